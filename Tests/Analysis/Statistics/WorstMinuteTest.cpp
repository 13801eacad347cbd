// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Statistics/WorstMinute.h"

#include <gtest/gtest.h>

#include <chrono>
#include <limits>
#include <vector>

namespace velmora {
namespace {

using Measure = WorstMinute::Measure;

Time at(int minutes, int seconds) {
    using namespace std::chrono;
    return sys_days{year{2026} / November / 16} + hours{5} + std::chrono::minutes{minutes} +
           std::chrono::seconds{seconds};
}

void add(WorstMinute& search, int minute, const std::vector<double>& values) {
    int second = 0;
    for (const double value : values)
        search.add(at(minute, second++), value);
}

TEST(WorstMinute, HasTheLowestMedian) {
    WorstMinute search(Measure::LowestMedian);
    add(search, 0, {-80, -80, -80, -80, -120});
    add(search, 1, {-90, -90, -91, -90, -90, -60});
    add(search, 2, {-85, -85, -85, -85, -85});
    const auto worst = search.worst();
    ASSERT_TRUE(worst);
    EXPECT_EQ(worst->begin, at(1, 0));
    EXPECT_EQ(worst->figure, -90);
    EXPECT_EQ(worst->samples, 6u);
}

TEST(WorstMinute, HasTheHighestMeanOfErrorRates) {
    WorstMinute search(Measure::HighestMean);
    add(search, 0, {0, 0, 0, 0, 50});
    add(search, 1, {5, 5, 5, 5, 5});
    const auto worst = search.worst();
    ASSERT_TRUE(worst);
    EXPECT_EQ(worst->begin, at(0, 0));
    EXPECT_EQ(worst->figure, 10);
}

TEST(WorstMinute, NeedsFiveSamples) {
    WorstMinute search(Measure::LowestMedian);
    add(search, 0, {-120, -120, -120, -120});
    EXPECT_FALSE(search.worst());
    add(search, 1, {-70, -70, -70, -70, -70});
    EXPECT_EQ(search.worst()->begin, at(1, 0));
    add(search, 2, {-130});
    EXPECT_EQ(search.worst()->begin, at(1, 0));
}

TEST(WorstMinute, IsTheEarliestOfSeveral) {
    WorstMinute search(Measure::LowestMedian);
    for (const int minute : {3, 4, 5})
        add(search, minute, {-90, -90, -90, -90, -90});
    EXPECT_EQ(search.worst()->begin, at(3, 0));
}

TEST(WorstMinute, IsOfRolesThatHaveWorseValues) {
    EXPECT_EQ(WorstMinute::measureOf(Role::ServingLevel), Measure::LowestMedian);
    EXPECT_EQ(WorstMinute::measureOf(Role::ServingQuality), Measure::LowestMedian);
    EXPECT_EQ(WorstMinute::measureOf(Role::BlockErrorRate), Measure::HighestMean);
    for (const Role role : {Role::ServingChannel, Role::NeighbourLevel, Role::DataRate, Role::None})
        EXPECT_FALSE(WorstMinute::measureOf(role));
}

TEST(ClockMinute, IsThatOfTheClockAlsoBefore1970) {
    using namespace std::chrono;
    EXPECT_EQ(minuteOf(Time(59s + 999ms)), Time());
    EXPECT_EQ(minuteOf(Time(60s)), Time(60s));
    EXPECT_EQ(minuteOf(Time(-1ns)), Time(-60s));
    EXPECT_EQ(minuteOf(Time(-60s)), Time(-60s));
    EXPECT_EQ(minuteOf(Time::min()), Time::min());
    EXPECT_EQ(durationBetween(Time::min(), Time::max()), nanoseconds::max());
    EXPECT_EQ(durationBetween(Time::max(), Time::min()), nanoseconds::min());
}

} // namespace
} // namespace velmora
