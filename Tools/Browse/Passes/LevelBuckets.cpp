// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/Passes/LevelBuckets.h"

#include <algorithm>

namespace velmora {

void LevelBuckets::setRange(Time first, Time last) {
    _first = first;
    _last = last;
}

double LevelBuckets::placeOf(Time time) const {
    const auto real = [](Time moment) { return static_cast<double>(moment.time_since_epoch().count()); };
    const double length = real(_last) - real(_first);
    return length > 0 ? std::clamp((real(time) - real(_first)) / length, 0.0, 1.0) : 0;
}

void LevelBuckets::add(Time time, double level) {
    const auto index = static_cast<std::size_t>(placeOf(time) * count);
    Span& span = _spans[std::min(index, count - 1)];
    span.sum += level;
    ++span.samples;
}

std::vector<std::optional<double>> LevelBuckets::means(std::size_t columns) const {
    std::vector<std::optional<double>> means(columns);
    for (std::size_t i = 0; i < columns; ++i) {
        // A screen may have more columns than there are spans.
        const std::size_t begin = i * count / columns;
        const std::size_t end = std::max((i + 1) * count / columns, begin + 1);
        Span all;
        for (std::size_t j = begin; j < end; ++j) {
            all.sum += _spans[j].sum;
            all.samples += _spans[j].samples;
        }
        if (all.samples > 0)
            means[i] = all.sum / static_cast<double>(all.samples);
    }
    return means;
}

} // namespace velmora
