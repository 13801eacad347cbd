// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Charts/ValueAxis.h"

#include <algorithm>
#include <cmath>

namespace velmora {

namespace {

/// The least of 1, 2 and 5 times a power of ten that is not below the number.
double roundStep(double least) {
    const double power = std::pow(10.0, std::floor(std::log10(least)));
    for (const double factor : {1.0, 2.0, 5.0})
        if (factor * power >= least * (1 - 1e-9))
            return factor * power;
    return 10 * power;
}

/// How many multiples of the step are from one number to another.
double marksBetween(double low, double high, double step) {
    return std::floor(high / step + 1e-9) - std::ceil(low / step - 1e-9) + 1;
}

} // namespace

ValueAxis ValueAxis::covering(const Extremes& extremes, std::optional<double> minimum,
                              std::optional<double> maximum, std::size_t markLimit) {
    Extremes whole = extremes;
    if (minimum)
        whole.add(*minimum);
    if (maximum)
        whole.add(*maximum);
    if (whole.isEmpty())
        whole = {0, 1};
    double low = minimum.value_or(whole.minimum);
    double high = maximum.value_or(whole.maximum);
    // A flat line lies in the middle. Two neighbouring numbers of 64 bits are too close for marks.
    const double least = std::max({std::abs(low), std::abs(high), 1e-6}) * 1e-9;
    if (high - low < least) {
        const double middle = low;
        const double half = std::max(1.0, least);
        low = minimum.value_or(middle - half);
        high = std::max(maximum.value_or(middle + half), low + half);
    }
    // The ends are rounded finely, so that few marks don't leave much of a low plot empty.
    const double fine = roundStep((high - low) / 10);
    ValueAxis axis;
    axis.minimum = minimum ? low : std::floor(low / fine + 1e-9) * fine;
    axis.maximum = maximum ? high : std::ceil(high / fine - 1e-9) * fine;
    double step = fine;
    while (marksBetween(axis.minimum, axis.maximum, step) >
           static_cast<double>(std::max<std::size_t>(markLimit, 2)))
        step = roundStep(step * 1.5);
    axis.decimals = std::clamp(static_cast<int>(std::ceil(-std::log10(step) - 1e-9)), 0, 9);
    const double first = std::ceil(axis.minimum / step - 1e-9);
    const double count = marksBetween(axis.minimum, axis.maximum, step);
    for (double mark = first; mark < first + count; ++mark)
        axis.marks.push_back(mark * step);
    return axis;
}

} // namespace velmora
