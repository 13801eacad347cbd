// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <limits>

namespace velmora {

/// One value of a series, at a time in nanoseconds (of any clock, as long as a chart's series share it; axes
/// take it for time since 1970).
struct Sample {
    std::int64_t time_ns = 0;
    double value = 0;
    friend bool operator==(const Sample&, const Sample&) = default;
};

/// The least and the greatest of some values; `minimum` is above `maximum` when there were none.
struct Extremes {
    double minimum = std::numeric_limits<double>::infinity();
    double maximum = -std::numeric_limits<double>::infinity();

    [[nodiscard]] bool isEmpty() const { return minimum > maximum; }
    void add(double value) {
        minimum = value < minimum ? value : minimum; // false for NaN, which marks a gap
        maximum = value > maximum ? value : maximum;
    }
    void add(const Extremes& others) {
        minimum = others.minimum < minimum ? others.minimum : minimum;
        maximum = others.maximum > maximum ? others.maximum : maximum;
    }
    friend bool operator==(const Extremes&, const Extremes&) = default;
};

} // namespace velmora
