// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Statistics/Histogram.h"

#include <algorithm>
#include <cmath>
#include <optional>
#include <tuple>
#include <utility>

namespace velmora {

namespace {

/// The width of bins that all have the same; absent where they grow with the values.
std::optional<double> widthOf(Unit unit) {
    switch (unit) {
    case Unit::DBm:
    case Unit::Percent: return 5;
    case Unit::DB: return 2;
    case Unit::Megahertz: return 10;
    case Unit::Degree: return 1;
    default: return std::nullopt;
    }
}

/// The bin of 0 to 1, 1 to 2, 2 to 5, 5 to 10 and so on that holds the value, which is not negative.
std::pair<double, double> growingBin(double value) {
    double from = 0;
    double to = 1;
    for (double decade = 1; value >= to && std::isfinite(decade); decade *= 10)
        for (const double step : {2.0, 5.0, 10.0})
            if (value >= to) {
                from = to;
                to = step * decade;
            }
    return {from, to};
}

std::pair<double, double> binOf(double value, Unit unit) {
    if (const std::optional<double> width = widthOf(unit)) {
        const double index = std::floor(value / *width);
        return {index * *width, (index + 1) * *width};
    }
    if (value >= 0)
        return growingBin(value);
    // The mirror image: its upper end belongs to the next bin, so that a value on it is in that one.
    auto [from, to] = growingBin(-value);
    if (-value == from)
        std::tie(from, to) = growingBin(std::nextafter(-value, 0.0));
    return {-to, 0 - from};
}

Histogram valuesOf(const std::vector<ValueCounts::Entry>& sorted) {
    std::vector<ValueCounts::Entry> kept = sorted;
    Histogram histogram;
    if (kept.size() > Histogram::mostValues) {
        std::stable_sort(kept.begin(), kept.end(),
                         [](const auto& a, const auto& b) { return a.count > b.count; });
        for (std::size_t i = Histogram::mostValues; i < kept.size(); ++i)
            histogram.others += kept[i].count;
        kept.resize(Histogram::mostValues);
        std::sort(kept.begin(), kept.end(), [](const auto& a, const auto& b) { return a.value < b.value; });
    }
    for (const ValueCounts::Entry& each : kept)
        histogram.bins.push_back({each.value, each.value, each.count});
    return histogram;
}

} // namespace

Histogram histogramOf(const std::vector<ValueCounts::Entry>& sorted, Unit unit) {
    if (unit == Unit::None)
        return valuesOf(sorted);
    Histogram histogram;
    for (const ValueCounts::Entry& each : sorted) {
        const auto [from, to] = binOf(each.value, unit);
        if (histogram.bins.empty() || histogram.bins.back().from != from)
            histogram.bins.push_back({from, to, 0});
        histogram.bins.back().count += each.count;
    }
    return histogram;
}

} // namespace velmora
