// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/TimeSpans.h"

#include <gtest/gtest.h>

namespace velmora {

namespace {

using namespace std::chrono_literals;

Time at(std::chrono::nanoseconds time) {
    return Time(time);
}

TEST(TimeSpans, LeaveOutLongSilences) {
    TimeSpans spans;
    for (const auto minutes : {0min, 5min, 10min, 120min, 125min})
        spans.add(at(minutes));
    ASSERT_EQ(spans.spans().size(), 2U);
    EXPECT_EQ(spans.spans()[0].end, at(10min));
    EXPECT_EQ(spans.spans()[1].begin, at(120min));
}

TEST(TimeSpans, JoinRecordingsOfTheSameTime) {
    TimeSpans spans;
    for (const auto minutes : {60min, 65min, 70min, 0min, 5min, 62min})
        spans.add(at(minutes));
    ASSERT_EQ(spans.spans().size(), 2U);
    EXPECT_EQ(spans.spans()[0].begin, at(0min));
    EXPECT_EQ(spans.spans()[1].end, at(70min));
}

TEST(TimeSpans, AreBoundedAndContainAllTimes) {
    TimeSpans spans;
    for (int day = 0; day < 1000; ++day)
        spans.add(at(day % 2 == 0 ? day * 24h : -day * 24h));
    EXPECT_LE(spans.spans().size(), TimeSpans::most);
    EXPECT_EQ(spans.spans().front().begin, at(-999 * 24h));
    EXPECT_EQ(spans.spans().back().end, at(998 * 24h));
}

TEST(TimeSpans, TakeAnyTimes) {
    TimeSpans spans;
    for (int i = 0; i < 200; ++i)
        spans.add(i % 2 == 0 ? Time::min() : Time::max());
    EXPECT_EQ(spans.spans().size(), 2U);
}

TEST(TimeAxis, PlacesTimesByWhatWasRecorded) {
    const TimeAxis axis({{at(0min), at(10min)}, {at(60min), at(90min)}});
    EXPECT_DOUBLE_EQ(axis.place(at(5min)), 0.125);
    EXPECT_DOUBLE_EQ(axis.place(at(30min)), 0.25); // in the silence
    EXPECT_DOUBLE_EQ(axis.place(at(75min)), 0.625);
    EXPECT_DOUBLE_EQ(axis.place(at(-5min)), 0);
    EXPECT_DOUBLE_EQ(axis.place(at(200min)), 1);
}

TEST(TimeAxis, PlacesTheOnlyTime) {
    EXPECT_EQ(TimeAxis({{at(1s), at(1s)}}).place(at(1s)), 0);
    EXPECT_EQ(TimeAxis({}).place(at(1s)), 0);
}

} // namespace

} // namespace velmora
