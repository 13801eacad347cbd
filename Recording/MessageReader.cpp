// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/MessageReader.h"

namespace velmora {

std::vector<std::string> MessageReader::technologies() const {
    if (technology().empty())
        return {};
    return {technology()};
}

void MessageReader::addLoss(Loss loss) {
    ++_lossTotals.losses;
    _lossTotals.bytes += loss.bytes;
    if (keepsLoss())
        _losses.push_back(std::move(loss));
}

} // namespace velmora
