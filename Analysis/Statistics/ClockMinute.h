// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"

#include <chrono>
#include <cstdint>

namespace velmora {

/// The begin of the clock's minute (UTC) that the time is in.
[[nodiscard]] inline Time minuteOf(Time time) {
    constexpr std::int64_t minute = std::chrono::nanoseconds(std::chrono::minutes(1)).count();
    const std::int64_t count = time.time_since_epoch().count();
    const std::int64_t inMinute = (count % minute + minute) % minute;
    // A recording's times may be any: the first minute of all is not complete.
    return count < Time::min().time_since_epoch().count() + inMinute
               ? Time::min()
               : Time(std::chrono::nanoseconds(count - inMinute));
}

/// How long it is from one time to another, within what nanoseconds can say.
[[nodiscard]] inline std::chrono::nanoseconds durationBetween(Time from, Time to) {
    std::int64_t passed = 0;
    if (__builtin_sub_overflow(to.time_since_epoch().count(), from.time_since_epoch().count(), &passed))
        return to < from ? std::chrono::nanoseconds::min() : std::chrono::nanoseconds::max();
    return std::chrono::nanoseconds(passed);
}

} // namespace velmora
