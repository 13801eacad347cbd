// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "Platform/Result.h"

#include <chrono>
#include <optional>
#include <string_view>

namespace velmora {

/// A time as the user gives it: absolute, or relative to a file's first message.
struct TimeBound {
    std::chrono::nanoseconds offset{0}; ///< since 1970-01-01 00:00:00 UTC, or since the first message
    bool afterFirstMessage = false;

    friend bool operator==(const TimeBound&, const TimeBound&) = default;
};

/// Reads one of
///
///     2026-11-16T05:00:00.25Z  2026-11-16 06:00+01:00  2026-11-16   ISO 8601; UTC where no zone is given
///     1794805200.25                                                 seconds since 1970
///     +90.5                                                         seconds after the first message
///
/// Seconds take up to nine digits of fraction. Times before 1678 or after 2261 are refused.
Result<TimeBound> readTimeBound(std::string_view text);

/// The selected messages: those stamped at or after `from` and before `to`; absent for no bound.
struct TimeRange {
    std::optional<TimeBound> from;
    std::optional<TimeBound> to;

    /// `first`: the time of the file's first message.
    [[nodiscard]] bool contains(Time message, Time first) const {
        return (!from || message >= momentOf(*from, first)) && (!to || message < momentOf(*to, first));
    }

    /// The time that a bound denotes, clamped to the range of Time.
    [[nodiscard]] static Time momentOf(const TimeBound& bound, Time first);
};

} // namespace velmora
