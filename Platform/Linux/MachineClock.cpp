// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/MachineClock.h"

#include <ctime>

namespace velmora {

Time MachineClock::now() const {
    timespec moment{};
    ::clock_gettime(CLOCK_REALTIME, &moment);
    return Time(std::chrono::seconds(moment.tv_sec) + std::chrono::nanoseconds(moment.tv_nsec));
}

ZoneState MachineClock::zoneAt(Time moment) const {
    // localtime_r need not read TZ again after its first call, so tzset picks up a zone that changes at run
    // time.
    ::tzset();
    const std::time_t seconds = std::chrono::floor<std::chrono::seconds>(moment).time_since_epoch().count();
    std::tm local{};
    if (!::localtime_r(&seconds, &local))
        return {};
    return {std::chrono::seconds(local.tm_gmtoff), local.tm_isdst > 0};
}

} // namespace velmora
