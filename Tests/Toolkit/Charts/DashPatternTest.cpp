// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Charts/DashPattern.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using ::testing::ElementsAre;

/// The dashes of level lines, as pairs of x.
std::vector<std::pair<double, double>> dashes(ChartLine kind, std::vector<QLineF> lines) {
    DashPattern(kind).cut(lines);
    std::vector<std::pair<double, double>> result;
    for (const QLineF& line : lines)
        result.emplace_back(line.x1(), line.x2());
    return result;
}

TEST(DashPattern, ContinuesFromOnePieceOfALineToTheNext) {
    // Dashes of 8 and spaces of 4.
    EXPECT_THAT(dashes(ChartLine::dashed, {{0, 0, 5, 0}, {5, 0, 10, 0}, {10, 0, 16, 0}}),
                ElementsAre(std::pair(0, 5), std::pair(5, 8), std::pair(12, 16)));
}

TEST(DashPattern, BeginsAnewAfterAGap) {
    EXPECT_THAT(dashes(ChartLine::dashed, {{0, 0, 10, 0}, {20, 0, 30, 0}}),
                ElementsAre(std::pair(0, 8), std::pair(20, 28)));
}

TEST(DashPattern, LeavesSolidLinesAndPointsAsTheyAre) {
    EXPECT_THAT(dashes(ChartLine::solid, {{0, 0, 100, 0}}), ElementsAre(std::pair(0, 100)));
    EXPECT_THAT(dashes(ChartLine::dotted, {{0, 0, 0, 0}, {0, 0, 4, 0}}), ElementsAre(std::pair(0, 2)));
}

TEST(DashPattern, KnowsWhatIsAPlaceAlongTheLine) {
    const DashPattern pattern(ChartLine::dashDotted); // 8, 3, 2, 3
    for (const double dash : {0.0, 7.9, 11.0, 12.9, 16.0, 27.5})
        EXPECT_TRUE(pattern.isDashAt(dash)) << dash;
    for (const double space : {8.0, 10.9, 13.0, 15.9, 24.5})
        EXPECT_FALSE(pattern.isDashAt(space)) << space;
    EXPECT_TRUE(DashPattern(ChartLine::solid).isDashAt(8));
}

} // namespace
} // namespace velmora
