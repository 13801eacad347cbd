// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"

#include <chrono>
#include <optional>
#include <string>
#include <string_view>

namespace velmora {

/// Dates and times as text, without locale.

/// "2026-11-16". Years outside of 0 to 9999 have a sign or more digits.
[[nodiscard]] std::string dayText(std::chrono::sys_days day);
/// "2026-11-16T05:00:00" with the separator "T".
[[nodiscard]] std::string dateAndTimeText(std::chrono::sys_seconds moment, std::string_view separator);
/// ISO 8601 in UTC: "2026-11-16T05:00:00Z".
[[nodiscard]] std::string isoText(std::chrono::sys_seconds moment);

/// The day that ten characters such as "2026-11-16" name; none for any other text, and for what is no day of
/// the calendar.
[[nodiscard]] std::optional<std::chrono::sys_days> dayOfText(std::string_view text);
/// The time that 19 characters such as "2026-11-16T05:00:00" denote; hours to 23, minutes and seconds to 59.
[[nodiscard]] std::optional<std::chrono::sys_seconds> momentOfText(std::string_view text, char separator);

/// The date description: "2026-11-16 05:00:00 +0000", UTC, sortable as text.
[[nodiscard]] std::string dateDescription(Time moment);

/// The time that a date description denotes, in any zone; none for any other text, and for years outside 1678
/// to 2261.
[[nodiscard]] std::optional<Time> timeOfDateDescription(std::string_view text);

/// Local date and time through the clock's zone: "2026-11-16 at 06:00:00" with the separator " at ".
[[nodiscard]] std::string localDateAndTime(const Clock& clock, Time moment, std::string_view separator);

} // namespace velmora
