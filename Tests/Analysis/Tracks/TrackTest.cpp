// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Tracks/Track.h"

#include "Tests/Support/Fixes.h"

#include <chrono>
#include <vector>

#include <gtest/gtest.h>

namespace velmora {
namespace {

using namespace std::chrono_literals;

Track trackOf(std::vector<Fix> fixes) {
    return Track::ofFixes(std::move(fixes));
}

TEST(Track, interpolatesBetweenFixes) {
    const Track track = trackOf({fixAt(1000ms, 59), fixAt(3000ms, 59.0004)});
    const auto position = track.at(Time(1500ms));
    ASSERT_TRUE(position);
    EXPECT_NEAR(position->fix.latitude, 59.0001, 1e-9);
    EXPECT_NEAR(position->fix.longitude, 18, 1e-9);
    EXPECT_EQ(position->fix.time, Time(1500ms));
    EXPECT_EQ(position->age, 500ms);
    EXPECT_EQ(track.at(Time(3000ms))->fix.latitude, 59.0004);
    EXPECT_EQ(track.at(Time(3000ms))->age, 0ns);
}

TEST(Track, hasNoPositionOutsideOfFixesAndInGaps) {
    const Track track = trackOf({fixAt(1000ms, 59), fixAt(3001ms, 60), fixAt(4000ms, 61)});
    EXPECT_FALSE(track.at(Time(999ms)));
    EXPECT_TRUE(track.at(Time(1000ms)));
    EXPECT_FALSE(track.at(Time(1001ms)));
    EXPECT_FALSE(track.at(Time(3000ms)));
    EXPECT_TRUE(track.at(Time(3500ms)));
    EXPECT_FALSE(track.at(Time(4001ms)));
    EXPECT_FALSE(Track().at(Time(0ms)));
    EXPECT_TRUE(Track::ofFixes({fixAt(1000ms, 59), fixAt(3001ms, 60)}, 3s).at(Time(2000ms)));
}

TEST(Track, interpolatesWhatBothFixesHave) {
    Fix before = fixAt(0ms, 59);
    Fix after = fixAt(1000ms, 59.0001);
    before.altitude_m = 10;
    after.altitude_m = 20;
    before.speed_mps = 22;
    before.course_degrees = 350;
    after.course_degrees = 20;
    before.hdop = 0.9;
    after.hdop = 1.5;
    before.deviation_m = 6;
    after.deviation_m = 5;
    const Fix fix = trackOf({before, after}).at(Time(500ms)).value().fix;
    EXPECT_DOUBLE_EQ(fix.altitude_m.value(), 15);
    EXPECT_FALSE(fix.speed_mps);
    EXPECT_DOUBLE_EQ(fix.course_degrees.value(), 5);
    EXPECT_DOUBLE_EQ(fix.hdop.value(), 1.5);
    EXPECT_DOUBLE_EQ(fix.deviation_m.value(), 6);
    EXPECT_DOUBLE_EQ(trackOf({before, after}).at(Time(200ms)).value().fix.course_degrees.value(), 356);
}

TEST(Track, ordersFixesAndLeavesOutSecondOnesOfATime) {
    const Track track = trackOf({fixAt(2000ms, 60), fixAt(1000ms, 59), fixAt(2000ms, 61)});
    ASSERT_EQ(track.fixes().size(), 2U);
    EXPECT_EQ(track.fixes()[0].latitude, 59);
    EXPECT_EQ(track.fixes()[1].latitude, 60);
}

TEST(Track, knowsWhetherALaterFixWouldMatter) {
    Track track;
    EXPECT_FALSE(track.isOpenAt(Time(0ms)));
    track.add(fixAt(1000ms, 59));
    EXPECT_FALSE(track.isOpenAt(Time(1000ms)));
    EXPECT_TRUE(track.isOpenAt(Time(1001ms)));
    EXPECT_FALSE(track.isOpenAt(Time(3000ms)));
}

TEST(Track, forgetsWhatNoPositionDependsOn) {
    Track track = trackOf({fixAt(1000ms, 59), fixAt(2000ms, 60), fixAt(3000ms, 61)});
    track.discardBefore(Time(2500ms));
    EXPECT_EQ(track.fixes().size(), 2U);
    EXPECT_TRUE(track.at(Time(2500ms)));
    track.discardBefore(Time(100s));
    EXPECT_EQ(track.fixes().size(), 1U);
}

TEST(Track, hasTheLengthOfTheWayWithoutGaps) {
    // 50 m each by Vincenty's solution; the last after a gap.
    const Track track = trackOf({fixAt(0ms, 59.33, 18.06), fixAt(2000ms, 59.33035845026, 18.06052861471),
                                 fixAt(4000ms, 59.33, 18.06), fixAt(9000ms, 60, 18)});
    EXPECT_NEAR(track.length_m(), 100, 0.02);
}

} // namespace
} // namespace velmora
