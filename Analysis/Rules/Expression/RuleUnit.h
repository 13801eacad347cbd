// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/Unit.h"

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

namespace velmora {

/// A unit as rules write it after a number, and what makes the number one in the unit of observations.
struct RuleUnit {
    std::string_view name;
    Unit unit;
    double scale;
};

/// The unit at the front of the text, the longest that is possible; absent where there is none.
[[nodiscard]] std::optional<RuleUnit> unitAtFront(std::string_view text);

/// A decimal number at the front of a text, without a sign.
struct FrontNumber {
    double value;
    std::size_t length;
};
/// Absent where the text does not begin with a digit, and for a number that a double cannot hold.
[[nodiscard]] std::optional<FrontNumber> numberAtFront(std::string_view text);

/// A time span in seconds: "5s", "2 min", "1.5 h", "500 ms"; absent for any other text.
[[nodiscard]] std::optional<double> readSpan(std::string_view text);

/// A number as texts of events show it: at most two decimals, and the unit after a blank.
[[nodiscard]] std::string numberWithUnit(double number, Unit unit);

} // namespace velmora
