// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <chrono>
#include <optional>
#include <string_view>

/// The fields of NMEA 0183 sentences as values. Absent where a field is empty or not what it should be.
namespace velmora::nmea {

/// A decimal number, as receivers write them: without exponent.
[[nodiscard]] std::optional<double> number(std::string_view text);
/// As above, and not below 0.
[[nodiscard]] std::optional<double> magnitude(std::string_view text);

/// "ddmm.mmm" and the hemisphere "N" or "S", in degrees.
[[nodiscard]] std::optional<double> latitude(std::string_view angle, std::string_view hemisphere);
/// "dddmm.mmm" and the hemisphere "E" or "W", in degrees from -180 to below 180.
[[nodiscard]] std::optional<double> longitude(std::string_view angle, std::string_view hemisphere);

/// "hhmmss" with any decimals of the second, since midnight. A leap second counts as the one after it.
[[nodiscard]] std::optional<std::chrono::nanoseconds> timeOfDay(std::string_view text);
/// "ddmmyy", of the years 1980 to 2079.
[[nodiscard]] std::optional<std::chrono::sys_days> date(std::string_view text);
/// Of ZDA: day, month and year of four digits.
[[nodiscard]] std::optional<std::chrono::sys_days> date(std::string_view day, std::string_view month,
                                                        std::string_view year);

} // namespace velmora::nmea
