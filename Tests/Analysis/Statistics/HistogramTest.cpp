// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Statistics/Histogram.h"

#include <gmock/gmock.h>

#include <string>
#include <vector>

namespace velmora {
namespace {

/// Each bin as "from..to: count".
std::vector<std::string> binsOf(const std::vector<double>& values, Unit unit) {
    ValueCounts counts;
    for (const double value : values)
        counts.add(value);
    std::vector<std::string> lines;
    for (const HistogramBin& bin : histogramOf(counts.sorted(), unit).bins)
        lines.push_back(testing::PrintToString(bin.from) + ".." + testing::PrintToString(bin.to) + ": " +
                        std::to_string(bin.count));
    return lines;
}

TEST(Histogram, HasBinsOfAWidthFromZeroOn) {
    EXPECT_THAT(binsOf({-100, -97.25, -95.25, -95, 0, 4.9, 5}, Unit::DBm),
                testing::ElementsAre("-100..-95: 3", "-95..-90: 1", "0..5: 2", "5..10: 1"));
    EXPECT_THAT(binsOf({-10.5, -10, -8}, Unit::DB),
                testing::ElementsAre("-12..-10: 1", "-10..-8: 1", "-8..-6: 1"));
}

TEST(Histogram, HasBinsThatGrowForRates) {
    EXPECT_THAT(binsOf({0, 0.5, 1, 1.9, 2, 5, 9.5, 10, 49, 307.2, 7000}, Unit::KilobitPerSecond),
                testing::ElementsAre("0..1: 2", "1..2: 2", "2..5: 1", "5..10: 2", "10..20: 1", "20..50: 1",
                                     "200..500: 1", "5000..10000: 1"));
}

TEST(Histogram, HasTheSameBinsBelowZero) {
    EXPECT_THAT(binsOf({-5, -2, -1.5, -1, -0.5}, Unit::Second),
                testing::ElementsAre("-5..-2: 1", "-2..-1: 2", "-1..0: 2"));
}

TEST(Histogram, HasABinForEachValueWithoutUnit) {
    EXPECT_THAT(binsOf({62, 62, 1300}, Unit::None), testing::ElementsAre("62..62: 2", "1300..1300: 1"));
}

TEST(Histogram, KeepsTheMostFrequentValuesWithoutUnit) {
    ValueCounts counts;
    for (int i = 0; i < 60; ++i)
        for (int times = 0; times < (i < 5 ? 1 : 2); ++times)
            counts.add(i);
    // 0 to 4 are rare, and of the 55 others five are too many: the greatest.
    const Histogram histogram = histogramOf(counts.sorted(), Unit::None);
    ASSERT_EQ(histogram.bins.size(), Histogram::mostValues);
    EXPECT_EQ(histogram.bins.front().from, 5);
    EXPECT_EQ(histogram.bins.back().from, 54);
    EXPECT_EQ(histogram.others, 15u);
}

} // namespace
} // namespace velmora
