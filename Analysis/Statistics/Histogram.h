// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Statistics/ValueCounts.h"
#include "LogGenerator/Fields/Unit.h"

#include <cstddef>
#include <cstdint>
#include <vector>

namespace velmora {

/// The values from `from` on that are below `to`; of numbers without a unit the one value that both are.
struct HistogramBin {
    double from;
    double to;
    std::uint64_t count;
};

/// How values are distributed, over bins that the unit alone determines, so that histograms of any two
/// recordings have the same ones.
struct Histogram {
    /// Of numbers without a unit, which may be identities, each value is a bin: at most so many.
    static constexpr std::size_t mostValues = 50;

    std::vector<HistogramBin> bins; ///< those that are not empty, the lowest first
    std::uint64_t others = 0; ///< how many values are in none of the bins: the rarer ones without a unit
};

/// Bins of 5 dBm, 2 dB, 5 %, 10 MHz or 1 degree from 0 on, of 1, 2, 5, 10, 20 ... for kbit/s, seconds, bytes
/// and metres, and one a value without a unit.
[[nodiscard]] Histogram histogramOf(const std::vector<ValueCounts::Entry>& sorted, Unit unit);

} // namespace velmora
