// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Refreshes/RefreshTicks.h"

#include <cstdint>

namespace velmora {

/// Precondition: this is the first message, or the next tick is not after it.
std::optional<Time> RefreshTicks::advanceTo(Time message) {
    if (!_started) {
        _started = true;
        _next = message;
        advancePast(message);
        return std::nullopt;
    }
    // Messages have come since the last tick: each call but the first follows one, and only the first of
    // several simultaneous ticks has had any.
    const Time tick = _next;
    advancePast(message);
    return tick;
}

std::optional<Time> RefreshTicks::last() const {
    if (!_started)
        return std::nullopt;
    return _next;
}

/// Precondition: `_next` is not after the message.
void RefreshTicks::advancePast(Time message) {
    // Unsigned, since the span between two times can exceed a signed 64-bit count of nanoseconds.
    const auto distance = [](Time from, Time to) {
        return static_cast<std::uint64_t>(to.time_since_epoch().count()) -
               static_cast<std::uint64_t>(from.time_since_epoch().count());
    };
    constexpr auto step = static_cast<std::uint64_t>(interval.count());
    const std::uint64_t untilNext = step - distance(_next, message) % step;
    _exhausted = distance(message, Time::max()) < untilNext;
    _next = _exhausted ? Time::max() : message + std::chrono::nanoseconds(untilNext);
}

} // namespace velmora
