// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Statistics/NumberFigures.h"

#include <cmath>

namespace velmora {

NumberFigures::NumberFigures(const ValueCounts& values) : samples(values.count()) {
    if (samples == 0)
        return;
    minimum = values.minimum();
    maximum = values.maximum();
    mean = values.mean();
    if (!std::isfinite(values.relativeError()))
        return;
    relativeError = values.relativeError();
    const std::vector<ValueCounts::Entry> sorted = values.sorted();
    p5 = percentileOf(sorted, samples, 5);
    p50 = percentileOf(sorted, samples, 50);
    p95 = percentileOf(sorted, samples, 95);
}

} // namespace velmora
