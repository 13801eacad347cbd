// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Charts/TimeRange.h"

#include <cstddef>
#include <cstdint>

namespace velmora {

/// Places of times: whole columns of device pixels from `left` (in points) on, aligned to multiples of their
/// length since 1970. So a sample stays in its column while the range moves, and what is drawn for it too.
struct ChartScale {
    std::int64_t begin_ns = 0;
    std::int64_t column_ns = 1;
    std::size_t columns = 1;
    double left = 0;
    double pixelRatio = 1; ///< device pixels a point

    /// For a range drawn over that width; the range's end lies in the last column.
    [[nodiscard]] static ChartScale covering(const TimeRange& range, double left, double width,
                                             double pixelRatio);

    [[nodiscard]] TimeRange range() const {
        return {begin_ns, begin_ns + column_ns * static_cast<std::int64_t>(columns)};
    }
    [[nodiscard]] double width() const { return static_cast<double>(columns) / pixelRatio; }
    /// The left edge of device pixels counts for a column's begin.
    [[nodiscard]] double columnAt(std::int64_t time_ns) const {
        return static_cast<double>(time_ns - begin_ns) / static_cast<double>(column_ns);
    }
    [[nodiscard]] double xAt(std::int64_t time_ns) const { return left + columnAt(time_ns) / pixelRatio; }
    [[nodiscard]] std::int64_t timeAt(double x) const;
    /// How much time so many points are.
    [[nodiscard]] std::int64_t timeOf(double points) const;

    friend bool operator==(const ChartScale&, const ChartScale&) = default;
};

} // namespace velmora
