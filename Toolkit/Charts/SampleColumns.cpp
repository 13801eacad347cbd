// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Charts/SampleColumns.h"

#include <cmath>

namespace velmora {

void reduceToColumns(const SampleRing& ring, std::int64_t begin_ns, std::int64_t column_ns, std::size_t count,
                     std::vector<SampleColumn>& columns) {
    columns.assign(count, {});
    std::size_t begin = ring.countBefore(begin_ns);
    for (std::size_t column = 0; column < count && begin < ring.size(); ++column) {
        const std::int64_t end_ns = begin_ns + static_cast<std::int64_t>(column + 1) * column_ns;
        if (ring.entry(begin).time_ns >= end_ns)
            continue;
        const std::size_t end = ring.countBefore(end_ns);
        SampleColumn& result = columns[column];
        result.extremes = ring.extremesOfEntries(begin, end);
        result.first = ring.entry(begin).value;
        result.joinsPrevious = begin > 0 && !ring.isGapAfter(begin - 1);
        // Gaps at the ends: the line is not joined there, so any value does.
        if (std::isnan(result.first))
            result.first = result.extremes.maximum;
        result.last = ring.entry(end - 1).value;
        if (std::isnan(result.last))
            result.last = result.extremes.maximum;
        begin = end;
    }
}

} // namespace velmora
