// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/SeriesBuckets.h"

#include <gtest/gtest.h>

namespace velmora {

namespace {

using namespace std::chrono_literals;

Time at(std::chrono::nanoseconds time) {
    return Time(time);
}

TEST(SeriesBuckets, KeepsExtremesWithTheMessagesThatReportedThem) {
    SeriesBuckets series;
    series.add(at(10ms), -80, {0, 1});
    series.add(at(20ms), -95, {0, 2});
    series.add(at(30ms), -95, {0, 3});
    series.add(at(130ms), -70, {0, 4});
    series.finish();
    ASSERT_EQ(series.buckets().size(), 2U);
    const SeriesBuckets::Bucket& first = series.buckets()[0];
    EXPECT_EQ(first.index, 0);
    EXPECT_EQ(first.minimum, -95);
    EXPECT_EQ(first.maximum, -80);
    EXPECT_EQ(first.count, 3U);
    EXPECT_EQ(first.minimumAt.number, 2U);
    EXPECT_EQ(first.maximumAt.number, 1U);
    EXPECT_EQ(series.buckets()[1].index, 1); // 125 ms each
}

TEST(SeriesBuckets, KeepValuesAtTheEndsOfAllTimes) {
    SeriesBuckets series;
    for (const std::uint64_t number : {1U, 2U})
        series.add(Time::min(), static_cast<double>(number), {0, number});
    for (const std::uint64_t number : {3U, 4U})
        series.add(Time::max(), static_cast<double>(number), {0, number});
    series.finish();
    ASSERT_EQ(series.buckets().size(), 2U);
    EXPECT_EQ(series.buckets()[0].maximum, 2);
    EXPECT_EQ(series.buckets()[1].minimum, 3);
    EXPECT_EQ(series.buckets()[1].count, 2U);
}

TEST(SeriesBuckets, BecomeWiderWhenThereAreTooManyAndLoseNoExtreme) {
    SeriesBuckets series(8);
    for (int i = 0; i < 1000; ++i)
        series.add(at(i * 125ms), i == 617 ? -200 : i % 10, {0, static_cast<std::uint64_t>(i + 1)});
    series.finish();
    EXPECT_LE(series.buckets().size(), 8U);
    EXPECT_EQ(series.total().count, 1000U);
    EXPECT_EQ(series.total().minimum, -200);
    EXPECT_EQ(series.total().minimumAt.number, 618U);
    EXPECT_EQ(series.total().maximum, 9);
    EXPECT_EQ(series.total().maximumAt.number, 10U);
}

TEST(SeriesBuckets, TakeNoRoomForATimeWithoutValues) {
    SeriesBuckets series(8);
    for (int day = 0; day < 4; ++day)
        series.add(at(day * 24h), day, {0, static_cast<std::uint64_t>(day + 1)});
    series.finish();
    EXPECT_EQ(series.width(), SeriesBuckets::narrowest);
    EXPECT_EQ(series.buckets().size(), 4U);
}

TEST(SeriesBuckets, SortValuesOfAClockThatGoesBack) {
    SeriesBuckets series(8);
    for (int i = 0; i < 100; ++i)
        series.add(at(i % 2 * 1s), i, {0, static_cast<std::uint64_t>(i + 1)});
    series.finish();
    ASSERT_EQ(series.buckets().size(), 2U);
    EXPECT_EQ(series.buckets()[0].maximum, 98);
    EXPECT_EQ(series.buckets()[1].minimum, 1);
    EXPECT_EQ(series.width(), SeriesBuckets::narrowest);
}

TEST(SeriesBuckets, RoundTimesBefore1970Down) {
    SeriesBuckets series;
    series.add(at(-1ms), 1, {0, 1});
    series.finish();
    EXPECT_EQ(series.buckets()[0].index, -1);
}

TEST(SeriesBuckets, TakeAnyTimes) {
    SeriesBuckets series(2);
    for (const Time time : {Time::min(), Time::max(), Time(), Time::max(), Time::min()})
        series.add(time, 1, {0, 1});
    series.finish();
    EXPECT_EQ(series.total().count, 5U);
}

} // namespace

} // namespace velmora
