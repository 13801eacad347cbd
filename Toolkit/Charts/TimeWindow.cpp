// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Charts/TimeWindow.h"

#include <algorithm>
#include <cmath>

namespace velmora {

TimeRange TimeWindow::range(std::optional<std::int64_t> oldest_ns) const {
    if (!_isFollowing)
        return _moved;
    const std::int64_t all_ns = _now_ns - oldest_ns.value_or(_now_ns);
    const std::int64_t length_ns = _span_ns ? *_span_ns : std::clamp(all_ns, 10 * second_ns, longest_ns);
    return {_now_ns - length_ns, _now_ns};
}

void TimeWindow::setSpan(std::optional<std::int64_t> span_ns) {
    _span_ns = span_ns;
    if (_span_ns)
        _span_ns = std::clamp(*_span_ns, shortest_ns, longest_ns);
    _isFollowing = true;
}

void TimeWindow::setRange(const TimeRange& range) {
    const std::int64_t length_ns = std::clamp(range.length_ns(), shortest_ns, longest_ns);
    _moved = {range.begin_ns, range.begin_ns + length_ns};
    _isFollowing = false;
}

void TimeWindow::pan(std::int64_t by_ns, std::optional<std::int64_t> oldest_ns) {
    const TimeRange shown = range(oldest_ns);
    // Not so far that nothing is in view.
    const std::int64_t half_ns = shown.length_ns() / 2;
    const std::int64_t first_ns = std::min(oldest_ns.value_or(_now_ns), _now_ns) - half_ns;
    const std::int64_t last_ns = std::max(_now_ns - half_ns, first_ns);
    const std::int64_t begin_ns = std::clamp(shown.begin_ns + by_ns, first_ns, last_ns);
    if (begin_ns != shown.begin_ns)
        setRange({begin_ns, begin_ns + shown.length_ns()});
}

void TimeWindow::zoom(double factor, std::int64_t fixed_ns, std::optional<std::int64_t> oldest_ns) {
    const TimeRange shown = range(oldest_ns);
    const auto length_ns = static_cast<std::int64_t>(
        std::clamp(static_cast<double>(shown.length_ns()) * factor, double(shortest_ns), double(longest_ns)));
    if (_isFollowing) {
        _span_ns = length_ns;
        return;
    }
    const double share =
        static_cast<double>(fixed_ns - shown.begin_ns) / static_cast<double>(shown.length_ns());
    const std::int64_t begin_ns =
        fixed_ns -
        static_cast<std::int64_t>(std::llround(std::clamp(share, 0.0, 1.0) * static_cast<double>(length_ns)));
    setRange({begin_ns, begin_ns + length_ns});
}

void TimeWindow::reveal(std::int64_t time_ns, std::optional<std::int64_t> oldest_ns) {
    const TimeRange shown = range(oldest_ns);
    if (time_ns >= shown.begin_ns && time_ns <= shown.end_ns)
        return;
    // A tenth of the range is kept on the other side, so that one sees where it goes on.
    const std::int64_t margin_ns = shown.length_ns() / 10;
    const std::int64_t begin_ns =
        time_ns < shown.begin_ns ? time_ns - margin_ns : time_ns + margin_ns - shown.length_ns();
    setRange({begin_ns, begin_ns + shown.length_ns()});
}

} // namespace velmora
