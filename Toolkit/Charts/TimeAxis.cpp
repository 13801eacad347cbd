// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Charts/TimeAxis.h"

#include "Toolkit/Charts/ChartText.h"

#include <algorithm>
#include <array>
#include <ctime>

namespace velmora {

namespace {

constexpr std::int64_t millisecond_ns = 1'000'000;
constexpr std::int64_t second_ns = 1000 * millisecond_ns;
constexpr std::int64_t minute_ns = 60 * second_ns;
constexpr std::int64_t hour_ns = 60 * minute_ns;
constexpr std::int64_t day_ns = 24 * hour_ns;

constexpr std::int64_t steps_ns[] = {
    millisecond_ns,
    2 * millisecond_ns,
    5 * millisecond_ns,
    10 * millisecond_ns,
    20 * millisecond_ns,
    50 * millisecond_ns,
    100 * millisecond_ns,
    200 * millisecond_ns,
    500 * millisecond_ns,
    second_ns,
    2 * second_ns,
    5 * second_ns,
    10 * second_ns,
    15 * second_ns,
    30 * second_ns,
    minute_ns,
    2 * minute_ns,
    5 * minute_ns,
    10 * minute_ns,
    15 * minute_ns,
    30 * minute_ns,
    hour_ns,
    2 * hour_ns,
    3 * hour_ns,
    6 * hour_ns,
    12 * hour_ns,
    day_ns,
    2 * day_ns,
    7 * day_ns,
    30 * day_ns,
    100 * day_ns,
};

std::tm localTime(std::int64_t time_ns) {
    const std::time_t seconds = time_ns / second_ns;
    std::tm local{};
    (void)::localtime_r(&seconds, &local);
    return local;
}

std::string labelOf(std::int64_t time_ns, std::int64_t step_ns) {
    if (step_ns < minute_ns)
        return chartTime(time_ns, step_ns < second_ns);
    const std::tm local = localTime(time_ns);
    std::array<char, 40> text{};
    const bool isMidnight = local.tm_hour == 0 && local.tm_min == 0;
    const std::size_t length =
        std::strftime(text.data(), text.size(), step_ns >= day_ns || isMidnight ? "%m-%d" : "%H:%M", &local);
    return {text.data(), length};
}

} // namespace

TimeAxis TimeAxis::covering(const TimeRange& range, std::size_t markLimit) {
    TimeAxis axis;
    const auto limit = static_cast<std::int64_t>(std::max<std::size_t>(markLimit, 1));
    axis.step_ns = *std::find_if(std::begin(steps_ns), std::end(steps_ns) - 1, [&](std::int64_t step) {
        return (range.length_ns() + step - 1) / step <= limit;
    });
    // Round in local time, whose distance from UTC is taken as it is where the range begins.
    const std::int64_t offset_ns = localTime(range.begin_ns).tm_gmtoff * second_ns;
    const std::int64_t local_ns = range.begin_ns + offset_ns;
    const std::int64_t over_ns = ((local_ns % axis.step_ns) + axis.step_ns) % axis.step_ns;
    std::int64_t mark_ns = range.begin_ns - over_ns + (over_ns == 0 ? 0 : axis.step_ns);
    for (; mark_ns < range.end_ns && axis.marks.size() < static_cast<std::size_t>(limit);
         mark_ns += axis.step_ns)
        axis.marks.push_back({mark_ns, labelOf(mark_ns, axis.step_ns)});
    return axis;
}

} // namespace velmora
