// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Charts/TimeRange.h"

#include <optional>

namespace velmora {

/// Which times a chart shows: the last span before now, all that there is, or where the user has moved it.
class TimeWindow {
public:
    static constexpr std::int64_t second_ns = 1'000'000'000;
    static constexpr std::int64_t shortest_ns = second_ns / 100;
    static constexpr std::int64_t longest_ns = 400 * 24 * 3600 * second_ns;

    [[nodiscard]] bool isFollowing() const { return _isFollowing; }
    /// Of the followed range; none for all.
    [[nodiscard]] std::optional<std::int64_t> span_ns() const { return _span_ns; }
    [[nodiscard]] std::int64_t now_ns() const { return _now_ns; }
    /// `oldest_ns` is where all that there is begins.
    [[nodiscard]] TimeRange range(std::optional<std::int64_t> oldest_ns) const;

    void setNow(std::int64_t now_ns) { _now_ns = now_ns; }
    void follow() { _isFollowing = true; }
    /// Follows with that span.
    void setSpan(std::optional<std::int64_t> span_ns);
    /// Stops following.
    void setRange(const TimeRange& range);

    /// Moves by a time, positive into the future.
    void pan(std::int64_t by_ns, std::optional<std::int64_t> oldest_ns);
    /// Makes the range `factor` times as long, with `fixed_ns` staying where it is; while following the end
    /// stays.
    void zoom(double factor, std::int64_t fixed_ns, std::optional<std::int64_t> oldest_ns);
    /// Moves as little as brings the time into view.
    void reveal(std::int64_t time_ns, std::optional<std::int64_t> oldest_ns);

private:
    bool _isFollowing = true;
    std::optional<std::int64_t> _span_ns = 5 * 60 * second_ns;
    std::int64_t _now_ns = 0;
    TimeRange _moved;
};

} // namespace velmora
