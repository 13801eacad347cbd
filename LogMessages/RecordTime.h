// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"

#include <cstdint>
#include <optional>

/// The 64-bit time stamp of a binary record. Its upper 48 bits count units of 1.25 ms of CDMA system time,
/// its lower 16 bits the 1/32 chips (at 1.2288 million chips a second, so 0 to 49151) since that unit began.
/// System time runs since 1980-01-06 00:00:00 UTC without leap seconds; since 2017 it is 18 s ahead of UTC.
namespace velmora {

/// The time that a record's time stamp denotes, to the nearest nanosecond; a leap second becomes the second
/// after it. None where the lower 16 bits are out of range, or the time is past the end of `Time` (the year
/// 2262).
[[nodiscard]] std::optional<Time> timeOfRecord(std::uint64_t timestamp);

/// Whether there is such a time.
[[nodiscard]] bool isRecordTime(std::uint64_t timestamp);

/// The time stamp of a time, to the nearest 1/32 chip; 0 for times before 1980-01-06. Leap seconds after 2017
/// are not included.
[[nodiscard]] std::uint64_t recordTimestamp(Time moment);

} // namespace velmora
