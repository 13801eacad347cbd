// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Charts/SampleRing.h"

#include <vector>

namespace velmora {

/// The samples of one column of pixels.
struct SampleColumn {
    Extremes extremes; ///< empty for a column without samples
    double first = 0;  ///< the values that lines to the neighbouring columns begin at
    double last = 0;
    bool joinsPrevious = false; ///< no gap lies between its first sample and the sample before that
};

/// Reduces samples to `count` columns, the first of which begins at `begin_ns`, each `column_ns` long. No
/// extreme is lost, and the cost is that of the columns, not of the samples.
void reduceToColumns(const SampleRing& ring, std::int64_t begin_ns, std::int64_t column_ns, std::size_t count,
                     std::vector<SampleColumn>& columns);

} // namespace velmora
