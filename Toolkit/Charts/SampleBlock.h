// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Charts/Sample.h"

#include <array>
#include <cstddef>

namespace velmora {

/// A fixed number of consecutive entries of a series, filled from the front, with the extremes of every 16
/// and every 256 of them and of all: what a ring is made of and the unit in which memory is counted.
class SampleBlock {
public:
    static constexpr std::size_t capacity = 1024;

    void clear();
    /// The block must not be full. NaN marks a gap.
    void append(std::int64_t time_ns, double value);

    [[nodiscard]] std::size_t size() const { return _size; }
    [[nodiscard]] bool isFull() const { return _size == capacity; }
    [[nodiscard]] Sample operator[](std::size_t index) const { return {_times[index], _values[index]}; }
    [[nodiscard]] std::int64_t timeAt(std::size_t index) const { return _times[index]; }
    /// The number of entries before that time, or - with `orAt` - before or at it.
    [[nodiscard]] std::size_t countBefore(std::int64_t time_ns, bool orAt) const;
    /// Of the values from `begin` to before `end`; gaps don't count.
    [[nodiscard]] Extremes extremes(std::size_t begin, std::size_t end) const;

private:
    static constexpr std::size_t small = 16;
    static constexpr std::size_t large = small * small;

    std::array<std::int64_t, capacity> _times;
    std::array<double, capacity> _values;
    std::array<Extremes, capacity / small> _ofSmall;
    std::array<Extremes, capacity / large> _ofLarge;
    Extremes _ofAll;
    std::size_t _size = 0;
};

} // namespace velmora
