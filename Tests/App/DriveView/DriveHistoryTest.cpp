// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/DriveView/DriveHistory.h"

#include <gtest/gtest.h>

#include <chrono>

namespace velmora {
namespace {

using namespace std::chrono_literals;

constexpr Time start = Time(1000h);

TEST(DriveHistoryTest, KeepsSamplesAtTheirTimesForAsLongAsTheyCount) {
    DriveHistory history;
    history.sample(servingLevelSeries, start, -80.5);
    const SampleRing& ring = *history.ring(servingLevelSeries);
    ASSERT_TRUE(ring.at(nanosecondsOf(start)));
    EXPECT_EQ(ring.at(nanosecondsOf(start + 10s))->value, -80.5);
    EXPECT_FALSE(ring.at(nanosecondsOf(start + 11s)));
}

TEST(DriveHistoryTest, HasAGapWhereTheRadioTechnologyIsUnknown) {
    DriveHistory history;
    history.changed(start, RadioTechnology::LTE, RadioMode::Idle);
    history.sample(servingLevelSeries, start, -80);
    history.changed(start + 2s, {}, RadioMode::Searching);
    EXPECT_TRUE(history.ring(servingLevelSeries)->at(nanosecondsOf(start + 1s)));
    EXPECT_FALSE(history.ring(servingLevelSeries)->at(nanosecondsOf(start + 3s)));
}

TEST(DriveHistoryTest, BandsEndWhereTheNextOneBegins) {
    DriveHistory history;
    history.changed(start, RadioTechnology::LTE, RadioMode::Idle);
    history.changed(start + 5s, RadioTechnology::LTE, RadioMode::Connected);
    history.changed(start + 9s, {}, {});
    const std::vector<ChartBand> bands = history.bands();
    ASSERT_EQ(bands.size(), 3U);
    EXPECT_EQ(bands[0].label, "LTE");
    EXPECT_EQ(bands[0].end_ns, nanosecondsOf(start + 9s));
    EXPECT_EQ(bands[1].label, "idle");
    EXPECT_EQ(bands[1].end_ns, nanosecondsOf(start + 5s));
    EXPECT_EQ(bands[2].label, "connected");
    EXPECT_EQ(bands[2].lane, 1U);
}

TEST(DriveHistoryTest, EveryRadioTechnologyHasABandThatDiffersFromItsNeighbours) {
    DriveHistory history;
    for (std::size_t i = 0; i < radioTechnologies; ++i)
        history.changed(start + std::chrono::seconds(i), static_cast<RadioTechnology>(i), {});
    const std::vector<ChartBand> bands = history.bands();
    ASSERT_EQ(bands.size(), radioTechnologies);
    std::vector<std::string> labels;
    for (const ChartBand& each : bands)
        labels.push_back(each.label);
    EXPECT_EQ(labels,
              (std::vector<std::string>{"GSM", "UMTS", "TD-SCDMA", "LTE", "NR", "CDMA2000 1x", "EV-DO"}));
    for (std::size_t i = 1; i < bands.size(); ++i)
        EXPECT_NE(bands[i].color, bands[i - 1].color) << bands[i].label;
}

TEST(DriveHistoryTest, BeginsAnewWhenTheClockGoesBack) {
    DriveHistory history;
    history.sample(servingLevelSeries, start, -80);
    history.sample(servingLevelSeries, start - 500ms, -81); // out of order
    EXPECT_EQ(history.ring(servingLevelSeries)->size(), 1U);
    history.sample(servingLevelSeries, start - 1h, -82);
    EXPECT_EQ(history.ring(servingLevelSeries)->size(), 1U);
    EXPECT_EQ(history.ring(servingLevelSeries)->entry(0).value, -82);
}

TEST(DriveHistoryTest, KnowsHowManyDecimalsAreNeeded) {
    DriveHistory history;
    history.sample(servingLevelSeries, start, -80);
    EXPECT_EQ(history.decimals(servingLevelSeries), 0);
    history.sample(servingLevelSeries, start, -80.5);
    EXPECT_EQ(history.decimals(servingLevelSeries), 1);
    history.sample(servingLevelSeries, start, -80.0625);
    EXPECT_EQ(history.decimals(servingLevelSeries), 2);
}

TEST(DriveHistoryTest, SeriesAfterOneThatIsTakenOffMoveUp) {
    DriveHistory history;
    const std::size_t before = history.count();
    history.pinned({"/a", Unit::None, true});
    history.pinned({"/b", Unit::None, true});
    history.sample(firstPinnedSeries + 1, start, 7);
    history.unpinned(firstPinnedSeries);
    EXPECT_EQ(history.count(), before + 1);
    EXPECT_EQ(history.ring(firstPinnedSeries)->entry(0).value, 7);
}

} // namespace
} // namespace velmora
