// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Statistics/ExactSum.h"

#include <cmath>
#include <cstddef>
#include <utility>

namespace velmora {

namespace {

/// What rounding loses of a + b, of which a is the larger one.
double lostIn(double sum, double a, double b) {
    return b - (sum - a);
}

} // namespace

void ExactSum::add(double value) {
    std::size_t kept = 0;
    for (double part : _parts) {
        if (std::fabs(value) < std::fabs(part))
            std::swap(value, part);
        const double sum = value + part;
        const double lost = lostIn(sum, value, part);
        if (lost != 0)
            _parts[kept++] = lost;
        value = sum;
    }
    _parts.resize(kept);
    _parts.push_back(value);
}

void ExactSum::add(double value, std::uint64_t times) {
    const auto factor = static_cast<double>(times);
    const double product = value * factor;
    add(product);
    add(std::fma(value, factor, -product));
}

void ExactSum::add(const ExactSum& other) {
    for (const double part : std::vector<double>(other._parts))
        add(part);
}

double ExactSum::value() const {
    if (_parts.empty())
        return 0;
    std::size_t rest = _parts.size() - 1;
    double sum = _parts[rest];
    double lost = 0;
    while (rest > 0 && lost == 0) {
        const double larger = sum;
        const double part = _parts[--rest];
        sum = larger + part;
        lost = lostIn(sum, larger, part);
    }
    // Exactly between two doubles the parts below decide, which the rounding to even has not seen.
    if (rest > 0 && (lost < 0) == (_parts[rest - 1] < 0)) {
        const double step = 2 * lost;
        const double other = sum + step;
        if (other - sum == step)
            sum = other;
    }
    return sum;
}

} // namespace velmora
