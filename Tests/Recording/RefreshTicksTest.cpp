// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Refreshes/RefreshTicks.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

using namespace std::chrono_literals;

constexpr Time start = Time(1'000s);

TEST(RefreshTicksTest, WithoutMessagesThereIsNoTick) {
    EXPECT_EQ(RefreshTicks().last(), std::nullopt);
}

TEST(RefreshTicksTest, TicksLieEveryTwoSecondsFromTheFirstMessageOn) {
    RefreshTicks ticks;
    EXPECT_EQ(ticks.tickBefore(start), std::nullopt);
    EXPECT_EQ(ticks.tickBefore(start + 500ms), std::nullopt);
    EXPECT_EQ(ticks.tickBefore(start + 2s - 1ns), std::nullopt);
    EXPECT_EQ(ticks.tickBefore(start + 2'100ms), start + 2s);
    EXPECT_EQ(ticks.tickBefore(start + 3s), std::nullopt);
    EXPECT_EQ(ticks.tickBefore(start + 4'500ms), start + 4s);
    EXPECT_EQ(ticks.last(), start + 6s);
}

TEST(RefreshTicksTest, TickComesBeforeAMessageStampedAtIt) {
    RefreshTicks ticks;
    EXPECT_EQ(ticks.tickBefore(start), std::nullopt);
    EXPECT_EQ(ticks.tickBefore(start + 2s), start + 2s);
    EXPECT_EQ(ticks.tickBefore(start + 2s), std::nullopt);
    EXPECT_EQ(ticks.tickBefore(start + 4s), start + 4s);
    EXPECT_EQ(ticks.last(), start + 6s);
}

TEST(RefreshTicksTest, TicksWithoutMessagesDoNotRefresh) {
    RefreshTicks ticks;
    EXPECT_EQ(ticks.tickBefore(start), std::nullopt);
    // Those at 4 s to 100 s have had none.
    EXPECT_EQ(ticks.tickBefore(start + 101s), start + 2s);
    EXPECT_EQ(ticks.tickBefore(start + 101'500ms), std::nullopt);
    EXPECT_EQ(ticks.tickBefore(start + 102s), start + 102s);
}

TEST(RefreshTicksTest, BackwardTimeCausesNoTick) {
    RefreshTicks ticks;
    EXPECT_EQ(ticks.tickBefore(start), std::nullopt);
    EXPECT_EQ(ticks.tickBefore(start - 3600s), std::nullopt);
    EXPECT_EQ(ticks.tickBefore(Time::min()), std::nullopt);
    EXPECT_EQ(ticks.tickBefore(start + 1s), std::nullopt);
    EXPECT_EQ(ticks.tickBefore(start + 3s), start + 2s);
}

TEST(RefreshTicksTest, TimeThatJumpsFromTheBeginningToTheEndIsNoWork) {
    RefreshTicks ticks;
    EXPECT_EQ(ticks.tickBefore(Time::min()), std::nullopt);
    EXPECT_EQ(ticks.tickBefore(Time::max()), Time::min() + 2s);
    // No later moment is left for a tick.
    EXPECT_EQ(ticks.tickBefore(Time::max()), std::nullopt);
    EXPECT_EQ(ticks.tickBefore(Time::min()), std::nullopt);
    EXPECT_EQ(ticks.last(), Time::max());
}

TEST(RecordedClockTest, ShowsWhatItWasSetToInUTC) {
    MessageClock clock;
    clock.setNow(start);
    EXPECT_EQ(clock.now(), start);
    EXPECT_EQ(clock.zoneAt(start).offset, 0s);
    EXPECT_FALSE(clock.zoneAt(start).daylightSaving);
}

} // namespace
} // namespace velmora
