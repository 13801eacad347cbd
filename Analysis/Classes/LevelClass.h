// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <optional>
#include <string_view>

namespace velmora {

/// How good a level or a quality is, for those who do not know the numbers of each radio technology.
enum class LevelClass : std::uint8_t { Poor, Fair, Good, Excellent };

inline constexpr std::array<LevelClass, 4> levelClasses{LevelClass::Poor, LevelClass::Fair, LevelClass::Good,
                                                        LevelClass::Excellent};

/// "poor", "fair", "good", "excellent".
[[nodiscard]] std::string_view nameOf(LevelClass levelClass);

/// From which value on a quantity is in each class; below `fair` it is poor. In ascending order.
struct LevelLimits {
    double fair = 0;
    double good = 0;
    double excellent = 0;

    /// Absent for what is no finite number.
    [[nodiscard]] std::optional<LevelClass> of(double value) const;
};

} // namespace velmora
