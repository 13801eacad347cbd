// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/Extra/CellTexts.h"

namespace velmora {

std::string textOf(const std::vector<Cell>& cells) {
    std::string text;
    for (const Cell& each : cells) {
        text += "[" + std::to_string(each.kind.technology) + " " + std::to_string(each.kind.type);
        for (std::size_t i = 0; i < cellNumberCount; ++i)
            if ((each.present >> i & 1) != 0)
                text +=
                    " " + std::string(cellNumberKeys[i].substr(15)) + "=" + std::to_string(each.numbers[i]);
        text += "]";
    }
    return text;
}

} // namespace velmora
