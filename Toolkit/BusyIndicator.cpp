// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/BusyIndicator.h"

namespace velmora {

void BusyIndicator::startAnimating() {
    _isAnimating = true;
    changed();
}

void BusyIndicator::stopAnimating() {
    _isAnimating = false;
    changed();
}

void BusyIndicator::setHidesWhenStopped(bool hides) {
    _hidesWhenStopped = hides;
    changed();
}

} // namespace velmora
