// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Statistics/ExactSum.h"

#include <gtest/gtest.h>

#include <cmath>
#include <vector>

namespace velmora {
namespace {

double sumOf(const std::vector<double>& values) {
    ExactSum sum;
    for (const double value : values)
        sum.add(value);
    return sum.value();
}

TEST(ExactSum, OfNothingIsZero) {
    EXPECT_EQ(sumOf({}), 0);
}

TEST(ExactSum, KeepsWhatLargeTermsWouldSwallow) {
    EXPECT_EQ(sumOf({1e100, 1, -1e100}), 1);
    EXPECT_EQ(sumOf({1, 1e100, 1, -1e100}), 2);
}

TEST(ExactSum, OfTenTenthsIsOne) {
    // Added up one by one they are 0.9999999999999999.
    EXPECT_EQ(sumOf(std::vector<double>(10, 0.1)), 1);
}

TEST(ExactSum, RoundsHalvesToEvenAndByWhatIsBelowThem) {
    const double half = std::ldexp(1.0, -53); // of the distance from 1 to the next double
    const double next = 1 + std::ldexp(1.0, -52);
    EXPECT_EQ(sumOf({1, half}), 1);
    EXPECT_EQ(sumOf({1, half, std::ldexp(1.0, -106)}), next);
    EXPECT_EQ(sumOf({1, half, -std::ldexp(1.0, -106)}), 1);
    EXPECT_EQ(sumOf({next, half}), 1 + std::ldexp(1.0, -51));
    EXPECT_EQ(sumOf({next, half, -std::ldexp(1.0, -106)}), next);
}

TEST(ExactSum, TakesAValueManyTimes) {
    ExactSum sum;
    sum.add(0.1, 10);
    EXPECT_EQ(sum.value(), 1);
    sum.add(-0.1, 9);
    sum.add(-0.1);
    EXPECT_EQ(sum.value(), 0);
}

TEST(ExactSum, AddsAnother) {
    ExactSum small;
    small.add(1);
    ExactSum sum;
    sum.add(1e100);
    sum.add(small);
    sum.add(sum);
    sum.add(-2e100);
    EXPECT_EQ(sum.value(), 2);
}

TEST(ExactSum, IsNotFiniteAfterAnOverflow) {
    EXPECT_FALSE(std::isfinite(sumOf({1e308, 1e308, -1e308})));
}

} // namespace
} // namespace velmora
