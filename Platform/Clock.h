// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <chrono>

namespace velmora {

/// A point in time, to the nanosecond (the resolution of recordings).
using Time = std::chrono::sys_time<std::chrono::nanoseconds>;

/// The offset of local time from UTC at a point in time.
struct ZoneState {
    std::chrono::seconds offset{0}; ///< east of UTC positive, daylight-saving time included
    bool daylightSaving = false;
};

/// The wall clock and the local zone: the machine's, a recording's, or a test's.
class Clock {
public:
    virtual ~Clock() = default;
    [[nodiscard]] virtual Time now() const = 0;
    [[nodiscard]] virtual ZoneState zoneAt(Time moment) const = 0;
};

} // namespace velmora
