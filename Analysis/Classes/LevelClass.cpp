// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Classes/LevelClass.h"

#include <cmath>

namespace velmora {

std::string_view nameOf(LevelClass levelClass) {
    static constexpr std::array<std::string_view, levelClasses.size()> names{"poor", "fair", "good",
                                                                             "excellent"};
    return names[static_cast<std::size_t>(levelClass)];
}

std::optional<LevelClass> LevelLimits::of(double value) const {
    if (!std::isfinite(value))
        return std::nullopt;
    return value >= excellent ? LevelClass::Excellent
           : value >= good    ? LevelClass::Good
           : value >= fair    ? LevelClass::Fair
                              : LevelClass::Poor;
}

} // namespace velmora
