// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/MessageReader.h"

namespace velmora {

void MessageReader::addLoss(Loss loss) {
    ++_lossTotals.losses;
    _lossTotals.bytes += loss.bytes;
    if (keepsLoss())
        _losses.push_back(std::move(loss));
}

} // namespace velmora
