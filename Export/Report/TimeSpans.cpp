// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/TimeSpans.h"

#include "Analysis/Statistics/ClockMinute.h"

#include <algorithm>
#include <utility>

namespace velmora {

namespace {

using Span = TimeSpans::Span;

double secondsOf(const Span& span) {
    return std::chrono::duration<double>(durationBetween(span.begin, span.end)).count();
}

/// Joins what overlaps or is at most that far apart.
std::vector<Span> joined(std::vector<Span> spans, std::chrono::nanoseconds apart) {
    std::sort(spans.begin(), spans.end(), [](const Span& a, const Span& b) { return a.begin < b.begin; });
    std::vector<Span> result;
    for (const Span& each : spans) {
        if (!result.empty() && durationBetween(result.back().end, each.begin) <= apart)
            result.back().end = std::max(result.back().end, each.end);
        else
            result.push_back(each);
    }
    return result;
}

} // namespace

void TimeSpans::add(Time time) {
    if (!_spans.empty()) {
        Span& last = _spans.back();
        const bool isNear = durationBetween(last.end, time) <= longestSilence &&
                            durationBetween(time, last.begin) <= longestSilence;
        if (isNear) {
            last.begin = std::min(last.begin, time);
            last.end = std::max(last.end, time);
            return;
        }
    }
    _spans.push_back({time, time});
    std::chrono::nanoseconds apart = longestSilence;
    while (_spans.size() > most) {
        _spans = joined(std::move(_spans), apart);
        if (apart > std::chrono::nanoseconds::max() / 4)
            _spans = {{_spans.front().begin, _spans.back().end}};
        apart *= 2;
    }
}

std::vector<Span> TimeSpans::spans() const {
    return joined(_spans, longestSilence);
}

TimeAxis::TimeAxis(std::vector<Span> spans) : _spans(std::move(spans)) {
    for (const Span& each : _spans)
        _seconds += secondsOf(each);
}

double TimeAxis::place(Time time) const {
    double before = 0;
    for (const Span& each : _spans) {
        if (time < each.begin)
            break;
        before += secondsOf({each.begin, std::min(time, each.end)});
    }
    return _seconds > 0 ? std::clamp(before / _seconds, 0.0, 1.0) : 0;
}

} // namespace velmora
