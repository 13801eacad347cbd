// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Display/PathRests.h"

#include "LogGenerator/Observations/PathPattern.h"

#include <optional>

namespace velmora {

PathRests PathRests::below(std::string_view name, bool atRoot) const {
    PathRests inside;
    inside.isWhole = isWhole;
    for (const std::string& rest : rests)
        if (const std::optional<std::string_view> left = PathPattern::after(rest, atRoot, name)) {
            if (left->empty())
                inside.isWhole = true;
            else
                inside.rests.emplace_back(*left);
        }
    return inside;
}

} // namespace velmora
