// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Charts/ChartScale.h"

#include <algorithm>
#include <cmath>

namespace velmora {

ChartScale ChartScale::covering(const TimeRange& range, double left, double width, double pixelRatio) {
    ChartScale scale;
    scale.left = left;
    scale.pixelRatio = pixelRatio;
    scale.columns = static_cast<std::size_t>(std::max(std::floor(width * pixelRatio), 1.0));
    const auto count = static_cast<std::int64_t>(scale.columns);
    scale.column_ns = std::max<std::int64_t>((range.length_ns() + count - 1) / count, 1);
    std::int64_t last = range.end_ns / scale.column_ns;
    if (last * scale.column_ns > range.end_ns) // before 1970
        --last;
    scale.begin_ns = (last + 1 - count) * scale.column_ns;
    return scale;
}

std::int64_t ChartScale::timeAt(double x) const {
    return begin_ns + timeOf(x - left);
}

std::int64_t ChartScale::timeOf(double points) const {
    return static_cast<std::int64_t>(std::llround(points * pixelRatio * static_cast<double>(column_ns)));
}

} // namespace velmora
