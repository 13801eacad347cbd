// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/BrowseTime.h"

#include "Platform/DateText.h"
#include "Tools/Messages/TimeRange.h"

#include <chrono>

namespace velmora {

Result<Time> browsedTime(const std::string& text, Time first, Time now) {
    const auto failure = [&text] {
        return Failure{"got " + text +
                       ", wanted a time such as 05:02:40, 2026-11-16T05:00:00Z, or +90 or -90 "
                       "seconds from here"};
    };
    if (text.starts_with('+') || text.starts_with('-')) {
        const Result<TimeBound> bound = readTimeBound("+" + text.substr(1));
        if (!bound)
            return failure();
        if (text.starts_with('+'))
            return TimeRange::momentOf(*bound, now);
        const bool isBefore = now.time_since_epoch() < bound->offset + Time::min().time_since_epoch();
        return isBefore ? Time::min() : now - bound->offset;
    }
    const bool isTimeOfDay = text.size() > 2 && text[2] == ':';
    const std::string day = dayText(std::chrono::floor<std::chrono::days>(now));
    const Result<TimeBound> bound = readTimeBound(isTimeOfDay ? day + "T" + text : text);
    if (!bound)
        return failure();
    return TimeRange::momentOf(*bound, first);
}

} // namespace velmora
