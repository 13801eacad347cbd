// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/Unit.h"

#include <optional>
#include <string_view>

namespace velmora {

/// A number that a text shows with its unit.
struct TextNumber {
    double value;
    Unit unit;
};

/// The number of a text that is a decimal number and nothing else, or a number and a unit after a blank:
/// "-71 dBm", "12.5", "3 %". Absent for anything else, for a number with leading zeros or more than 15
/// digits, which rather is an identity, and for a unit that observations do not have. For technologies whose
/// messages hold nothing but texts.
[[nodiscard]] std::optional<TextNumber> readTextNumber(std::string_view text);

} // namespace velmora
