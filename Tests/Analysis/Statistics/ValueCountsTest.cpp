// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Statistics/NumberFigures.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <vector>

namespace velmora {
namespace {

ValueCounts countsOf(const std::vector<double>& values, std::size_t most = ValueCounts::usualMost) {
    ValueCounts counts(most);
    for (const double value : values)
        counts.add(value);
    return counts;
}

std::vector<double> fromTo(int from, int to) {
    std::vector<double> values;
    for (int i = from; i <= to; ++i)
        values.push_back(i);
    return values;
}

TEST(NumberFigures, OfNothingAreAbsent) {
    const NumberFigures figures(countsOf({}));
    EXPECT_EQ(figures.samples, 0u);
    EXPECT_FALSE(figures.minimum || figures.p5 || figures.p50 || figures.p95 || figures.maximum ||
                 figures.mean);
}

TEST(NumberFigures, OfOneValueAreThatValue) {
    const NumberFigures figures(countsOf({-97.25}));
    for (const auto& figure :
         {figures.minimum, figures.p5, figures.p50, figures.p95, figures.maximum, figures.mean})
        EXPECT_EQ(figure, -97.25);
}

TEST(NumberFigures, HavePercentilesByNearestRank) {
    // 5 % of 20 is 1, 50 % is 10, 95 % is 19.
    const NumberFigures twenty(countsOf(fromTo(1, 20)));
    EXPECT_EQ(twenty.p5, 1);
    EXPECT_EQ(twenty.p50, 10);
    EXPECT_EQ(twenty.p95, 19);
    // Of 21: 1.05, 10.5 and 19.95, rounded up.
    const NumberFigures more(countsOf(fromTo(1, 21)));
    EXPECT_EQ(more.p5, 2);
    EXPECT_EQ(more.p50, 11);
    EXPECT_EQ(more.p95, 20);
    EXPECT_EQ(more.mean, 11);
}

TEST(NumberFigures, CountRepeatedValues) {
    const NumberFigures figures(countsOf({-80, -110, -80, -80, -95, -80, -80, -80, -80, -80}));
    EXPECT_EQ(figures.samples, 10u);
    EXPECT_EQ(figures.minimum, -110);
    EXPECT_EQ(figures.p5, -110);
    EXPECT_EQ(figures.p50, -80);
    EXPECT_EQ(figures.mean, -84.5);
    EXPECT_EQ(figures.relativeError, 0);
}

TEST(ValueCounts, TakesBothZerosForOneValue) {
    EXPECT_EQ(countsOf({0.0, -0.0, 0.0}).sorted().size(), 1u);
}

TEST(ValueCounts, SortsNegativeValues) {
    const auto sorted = countsOf({2, -1, -3, 0}).sorted();
    ASSERT_EQ(sorted.size(), 4u);
    EXPECT_EQ(sorted[0].value, -3);
    EXPECT_EQ(sorted[1].value, -1);
    EXPECT_EQ(sorted[3].value, 2);
}

TEST(ValueCounts, RoundsNoMoreThanItMust) {
    // Nine values from 1 to 2 in steps of 1/8, in at most 8: without the last of three binary digits 1
    // and 1.125 are one, and so on; 2 is one of its own.
    std::vector<double> values;
    for (int i = 0; i <= 8; ++i)
        values.push_back(1 + i / 8.0);
    EXPECT_EQ(countsOf(values, 9).relativeError(), 0);
    const ValueCounts coarse = countsOf(values, 8);
    const auto sorted = coarse.sorted();
    ASSERT_EQ(sorted.size(), 5u);
    EXPECT_EQ(sorted[0].count, 2u);
    EXPECT_EQ(sorted[4].count, 1u);
    EXPECT_EQ(sorted[0].value, 1.125); // the middle of 1 and 1.25
    // Two digits are left: half a step of 1/4, as a part of 1.
    EXPECT_EQ(coarse.relativeError(), 0.125);
    EXPECT_EQ(coarse.minimum(), 1);
    EXPECT_EQ(coarse.maximum(), 2);
    EXPECT_EQ(coarse.mean(), 1.5);
}

TEST(ValueCounts, SaysThatItKnowsNoPercentilesWhereMagnitudesAreLost) {
    const NumberFigures figures(countsOf({1, 4, 16, 64, 256}, 2));
    EXPECT_EQ(figures.minimum, 1);
    EXPECT_EQ(figures.maximum, 256);
    EXPECT_EQ(figures.mean, 68.2);
    EXPECT_FALSE(figures.p50);
}

TEST(ValueCounts, BearsTheLargestAndTheSmallestNumbers) {
    constexpr double largest = std::numeric_limits<double>::max();
    constexpr double smallest = std::numeric_limits<double>::denorm_min();
    std::vector<double> values{largest, -largest, smallest, -smallest, 0};
    for (int i = 0; i < 100; ++i)
        values.push_back(std::ldexp(1.5, 10 * i - 500));
    for (const std::size_t most : {std::size_t{2}, std::size_t{3}, std::size_t{50}}) {
        const ValueCounts counts = countsOf(values, most);
        EXPECT_LE(counts.sorted().size(), most);
        EXPECT_EQ(counts.minimum(), -largest);
        EXPECT_EQ(counts.maximum(), largest);
    }
    EXPECT_FALSE(countsOf({largest, largest}).mean());
}

} // namespace
} // namespace velmora
