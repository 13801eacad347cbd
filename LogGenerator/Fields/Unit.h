// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <optional>
#include <string_view>

namespace velmora {

/// What an observed number is counted in.
enum class Unit : std::uint8_t {
    None, ///< a plain number: an identity, a count, or a quantity whose unit no source tells
    DBm,
    DB,
    Percent,
    KilobitPerSecond, ///< of 1000 bits
    Second,
    Megahertz,
    Byte,
    Degree, ///< of an angle
    Metre,
};

/// The unit as it is written after a number: "dBm", "kbit/s"; empty for `None`.
[[nodiscard]] std::string_view nameOf(Unit unit);

/// A unit as a display text shows it after its number, and what makes the shown number one in that unit.
struct ShownUnit {
    Unit unit = Unit::None;
    double scale = 1;
};

/// The unit of a display format by what follows its number (" dBm", "% (old)", " kbps"); absent where that is
/// none.
[[nodiscard]] std::optional<ShownUnit> unitOfSuffix(std::string_view suffix);

} // namespace velmora
