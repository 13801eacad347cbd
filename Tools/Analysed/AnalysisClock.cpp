// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Analysed/AnalysisClock.h"

#include <chrono>
#include <cstdint>

namespace velmora {

namespace {

/// The time plus what has passed between two others, within the range of Time.
Time shifted(Time time, Time from, Time to) {
    std::int64_t passed = 0;
    std::int64_t sum = 0;
    if (__builtin_sub_overflow(to.time_since_epoch().count(), from.time_since_epoch().count(), &passed) ||
        __builtin_add_overflow(time.time_since_epoch().count(), passed, &sum))
        return to < from ? Time::min() : Time::max();
    return Time(std::chrono::nanoseconds(sum));
}

} // namespace

Time MessageTimes::of(Time arrival, std::optional<Time> modem) {
    if (_clock == AnalysisClock::Arrival)
        return arrival;
    if (modem) {
        _stamp = modem;
        _arrival = arrival;
        return *modem;
    }
    return _stamp ? shifted(*_stamp, _arrival, arrival) : arrival;
}

} // namespace velmora
