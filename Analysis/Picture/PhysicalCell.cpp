// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Picture/PhysicalCell.h"

namespace velmora {

std::optional<double> physicalCellOf(const Observation& observation) {
    if (observation.kind == ObservedKind::Number)
        return observation.number;
    const std::string_view text = observation.words;
    const auto isColourCode = [](char digit) { return digit >= '0' && digit <= '7'; };
    if (observation.kind != ObservedKind::Text || text.size() != 3 || text[1] != '-' ||
        !isColourCode(text[0]) || !isColourCode(text[2]))
        return std::nullopt;
    return 8 * (text[0] - '0') + (text[2] - '0');
}

} // namespace velmora
