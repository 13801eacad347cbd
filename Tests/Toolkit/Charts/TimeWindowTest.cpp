// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Charts/TimeWindow.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

constexpr std::int64_t second_ns = TimeWindow::second_ns;
constexpr std::int64_t oldest_ns = 0;

class TimeWindowTest : public ::testing::Test {
protected:
    TimeWindowTest() {
        window.setNow(1000 * second_ns);
        window.setSpan(100 * second_ns);
    }
    [[nodiscard]] TimeRange range() const { return window.range(oldest_ns); }
    static TimeRange seconds(std::int64_t begin, std::int64_t end) {
        return {begin * second_ns, end * second_ns};
    }

    TimeWindow window;
};

TEST_F(TimeWindowTest, FollowsNowUntilItIsMoved) {
    EXPECT_EQ(range(), seconds(900, 1000));
    window.setNow(1010 * second_ns);
    EXPECT_EQ(range(), seconds(910, 1010));
    window.pan(-50 * second_ns, oldest_ns);
    EXPECT_FALSE(window.isFollowing());
    window.setNow(1020 * second_ns);
    EXPECT_EQ(range(), seconds(860, 960));
    window.follow();
    EXPECT_EQ(range(), seconds(920, 1020));
}

TEST_F(TimeWindowTest, AllIsFromTheOldestToNow) {
    window.setSpan(std::nullopt);
    EXPECT_EQ(range(), seconds(0, 1000));
    EXPECT_EQ(window.range(995 * second_ns), seconds(990, 1000)); // at least ten seconds
    EXPECT_EQ(window.range(std::nullopt), seconds(990, 1000));
}

TEST_F(TimeWindowTest, CannotBeMovedAwayFromAllThatThereIs) {
    window.pan(-100'000 * second_ns, oldest_ns);
    EXPECT_EQ(range(), seconds(-50, 50));
    window.pan(100'000 * second_ns, oldest_ns);
    EXPECT_EQ(range(), seconds(950, 1050));
}

TEST_F(TimeWindowTest, ZoomsAroundAPlaceAndWhileFollowingAroundNow) {
    window.zoom(0.5, 900 * second_ns, oldest_ns);
    EXPECT_TRUE(window.isFollowing());
    EXPECT_EQ(range(), seconds(950, 1000));
    window.setRange(seconds(100, 200));
    window.zoom(2, 125 * second_ns, oldest_ns);
    EXPECT_EQ(range(), seconds(75, 275));
    window.zoom(0, 100 * second_ns, oldest_ns);
    EXPECT_EQ(range().length_ns(), TimeWindow::shortest_ns);
    EXPECT_TRUE(range().contains(100 * second_ns));
}

TEST_F(TimeWindowTest, RevealsWithAMarginAndMovesForNothingElse) {
    window.reveal(950 * second_ns, oldest_ns);
    EXPECT_TRUE(window.isFollowing());
    window.reveal(500 * second_ns, oldest_ns);
    EXPECT_EQ(range(), seconds(490, 590));
    window.reveal(700 * second_ns, oldest_ns);
    EXPECT_EQ(range(), seconds(610, 710));
}

} // namespace
} // namespace velmora
