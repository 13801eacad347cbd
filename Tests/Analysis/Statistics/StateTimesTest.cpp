// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Analysis/Statistics/StatisticsFixture.h"

#include <gmock/gmock.h>

namespace velmora {
namespace {

using testing::ElementsAre;

const std::string state = "/Radio/State";

class StateTimesTest : public testing::Test {
protected:
    void SetUp() override {
        statistics.complete = [this](const GroupStatistics& group) { lines = stateLines(group, state); };
    }
    void report(double seconds, const std::string& value) {
        statistics.report({after(seconds), {}, {{state, value}}});
    }
    /// A message that says nothing of the state.
    void passAt(double seconds) { statistics.report({after(seconds)}); }

    TestStatistics statistics;
    std::vector<std::string> lines;
};

TEST_F(StateTimesTest, AStateHoldsUntilTheNextReport) {
    report(0, "idle");
    report(10, "connected");
    report(12, "connected");
    report(15, "idle");
    passAt(16);
    statistics.finish();
    EXPECT_THAT(lines, ElementsAre("idle: 2 samples, 11000 ms", "connected: 2 samples, 5000 ms",
                                   "idle > connected: 1", "connected > idle: 1"));
}

TEST_F(StateTimesTest, AStateHoldsUntilThereIsNone) {
    report(0, "idle");
    statistics.report({after(4), {}, {}, {state}});
    passAt(10);
    report(20, "idle");
    statistics.report({after(21), {}, {}, {}, {state}});
    passAt(30);
    report(31, "connected");
    statistics.finish();
    // What was not known in between is no transition.
    EXPECT_THAT(lines, ElementsAre("idle: 2 samples, 5000 ms", "connected: 1 samples, 0 ms"));
}

TEST_F(StateTimesTest, AStateDoesNotHoldAcrossASilence) {
    report(0, "idle");
    passAt(30);
    passAt(60.001);
    report(61, "connected");
    statistics.finish();
    EXPECT_THAT(lines, ElementsAre("idle: 1 samples, 30000 ms", "connected: 1 samples, 0 ms"));
}

TEST_F(StateTimesTest, AStateDoesNotHoldWhereTheClockGoesBack) {
    report(100, "idle");
    passAt(110);
    passAt(108.999);
    report(109, "connected");
    statistics.finish();
    EXPECT_THAT(lines, ElementsAre("idle: 1 samples, 10000 ms", "connected: 1 samples, 0 ms"));
}

TEST_F(StateTimesTest, ASmallStepBackIsNoTime) {
    report(100, "idle");
    report(101, "connected");
    report(100, "idle");
    report(102, "connected");
    statistics.finish();
    EXPECT_THAT(lines, ElementsAre("idle: 2 samples, 2000 ms", "connected: 2 samples, 0 ms",
                                   "idle > connected: 2", "connected > idle: 1"));
}

TEST_F(StateTimesTest, AStateDoesNotHoldWhereMessagesAreMissing) {
    report(0, "idle");
    passAt(5);
    statistics.statistics.interrupt();
    passAt(6);
    report(8, "connected");
    statistics.finish();
    EXPECT_THAT(lines, ElementsAre("idle: 1 samples, 5000 ms", "connected: 1 samples, 0 ms"));
}

TEST_F(StateTimesTest, OnlyTheCountedTimesCountAndWhatWasBeforeIsKnown) {
    statistics.statistics.setCounted({after(10), after(20)});
    report(0, "idle");
    report(8, "connected");
    passAt(14);
    report(15, "idle");
    passAt(25);
    report(26, "connected");
    statistics.finish();
    EXPECT_THAT(lines, ElementsAre("connected: 0 samples, 5000 ms", "idle: 1 samples, 5000 ms",
                                   "connected > idle: 1"));
}

TEST_F(StateTimesTest, TextsThatIdentifyAreNoStates) {
    statistics.leaf(state).identity = Identity::Subscriber;
    report(0, "001010000000017");
    statistics.finish();
    EXPECT_THAT(lines, ElementsAre("(none)"));
}

TEST(StateCounts, CountsTheRowsOfListsWithoutTime) {
    TestStatistics statistics;
    std::vector<std::string> lines;
    statistics.complete = [&](const GroupStatistics& group) { lines = stateLines(group, "/Cells/*/Kind"); };
    for (const double seconds : {0, 10})
        statistics.report({after(seconds), {}, {{"/Cells/*/Kind", seconds == 0 ? "LTE" : "NR"}}});
    statistics.report({after(20)});
    statistics.finish();
    EXPECT_THAT(lines, ElementsAre("LTE: 1 samples, 0 ms", "NR: 1 samples, 0 ms"));
}

TEST(StateCounts, KeepsTheFirstValuesAndTheOthersTogether) {
    TestStatistics statistics;
    std::uint64_t others = 0;
    std::chrono::nanoseconds time{0};
    std::size_t values = 0;
    statistics.complete = [&](const GroupStatistics& group) {
        const StateCounts& states = group.parts.front()->leaves.front()->states;
        values = states.values().size();
        others = states.at(StateCounts::others).samples;
        time = states.at(StateCounts::others).time;
    };
    for (int i = 0; i < 70; ++i)
        statistics.report({after(i), {}, {{state, std::to_string(i)}}});
    statistics.finish();
    EXPECT_EQ(values, 64u);
    EXPECT_EQ(others, 6u);
    EXPECT_EQ(time, std::chrono::seconds(5)); // the last one has just been reported
}

} // namespace
} // namespace velmora
