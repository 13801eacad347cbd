// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"

#include <chrono>
#include <cstdint>
#include <limits>

/// Arithmetic with times of which nothing is known, as those of damaged files: it ends at the limits.
namespace velmora {

/// From one time to another; negative where that is the earlier.
[[nodiscard]] inline std::chrono::nanoseconds timeSpan(Time from, Time to) {
    std::int64_t span = 0;
    if (__builtin_sub_overflow(to.time_since_epoch().count(), from.time_since_epoch().count(), &span))
        span =
            to < from ? std::numeric_limits<std::int64_t>::min() : std::numeric_limits<std::int64_t>::max();
    return std::chrono::nanoseconds(span);
}

/// The time that much later, or earlier where the span is negative.
[[nodiscard]] inline Time timeAfter(Time time, std::chrono::nanoseconds span) {
    std::int64_t sum = 0;
    if (__builtin_add_overflow(time.time_since_epoch().count(), span.count(), &sum))
        return span.count() < 0 ? Time::min() : Time::max();
    return Time(std::chrono::nanoseconds(sum));
}

} // namespace velmora
