// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Tracks/PlaceHistory.h"

#include "Tests/Support/Fixes.h"

#include <chrono>

#include <gtest/gtest.h>

namespace velmora {
namespace {

using namespace std::chrono_literals;

TEST(PlaceHistory, knowsWhereTheReceiverWas) {
    PlaceHistory history;
    history.add(fixAt(1s, 59));
    history.add(fixAt(3s, 59.0004));
    history.add(fixAt(9s, 60));
    const auto position = history.at(Time(1500ms));
    ASSERT_TRUE(position);
    EXPECT_NEAR(position->fix.latitude, 59.0001, 1e-9);
    EXPECT_FALSE(history.at(Time(4s))) << "in a gap";
    EXPECT_FALSE(history.at(Time(10s))) << "after the last";
}

TEST(PlaceHistory, hasTheGapThatIsAskedFor) {
    PlaceHistory history(10s);
    history.add(fixAt(1s, 59));
    history.add(fixAt(9s, 59.0008));
    ASSERT_TRUE(history.at(Time(5s)));
}

TEST(PlaceHistory, beginsAgainWhereTheClockWasSetBack) {
    PlaceHistory history;
    history.add(fixAt(100s, 59));
    history.add(fixAt(50s, 60));
    history.add(fixAt(51s, 60));
    EXPECT_FALSE(history.at(Time(100s)));
    ASSERT_TRUE(history.at(Time(50500ms)));
}

TEST(PlaceHistory, forgetsTheEarliestOfTooMany) {
    PlaceHistory history;
    for (std::size_t i = 0; i <= PlaceHistory::mostFixes; ++i)
        history.add(fixAt(std::chrono::seconds(i), 59));
    EXPECT_FALSE(history.at(Time(0s)));
    EXPECT_TRUE(history.at(Time(1s)));
    EXPECT_TRUE(history.at(Time(std::chrono::seconds(PlaceHistory::mostFixes))));
}

} // namespace
} // namespace velmora
