// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// What the axes of charts are marked with, and how numbers and times are written.

#include "Toolkit/Charts/ChartText.h"
#include "Toolkit/Charts/TimeAxis.h"
#include "Toolkit/Charts/ValueAxis.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdlib>
#include <ctime>

namespace velmora {
namespace {

using ::testing::DoubleEq;
using ::testing::ElementsAre;

constexpr std::int64_t second_ns = 1'000'000'000;
constexpr std::int64_t noon_ns = 1'795'348'800 * second_ns; // 2026-11-22 12:00:00 UTC

/// Sets the zone during its lifetime.
class Zone {
public:
    explicit Zone(const char* name) {
        ::setenv("TZ", name, 1);
        ::tzset();
    }
    ~Zone() {
        ::unsetenv("TZ");
        ::tzset();
    }
    Zone(const Zone&) = delete;
    Zone& operator=(const Zone&) = delete;
};

std::vector<std::string> labels(const TimeRange& range, std::size_t limit) {
    std::vector<std::string> result;
    for (const TimeAxis::Mark& mark : TimeAxis::covering(range, limit).marks)
        result.push_back(mark.label);
    return result;
}

TEST(ValueAxis, IsMarkedAtRoundNumbers) {
    const ValueAxis axis = ValueAxis::covering({-117.25, -74}, {}, {}, 6);
    EXPECT_THAT(axis.marks, ElementsAre(DoubleEq(-120), DoubleEq(-110), DoubleEq(-100), DoubleEq(-90),
                                        DoubleEq(-80), DoubleEq(-70)));
    EXPECT_EQ(axis.decimals, 0);
    EXPECT_LE(axis.minimum, -117.25);
    EXPECT_GE(axis.maximum, -74);
}

TEST(ValueAxis, HasTheDecimalsThatItsMarksNeed) {
    const ValueAxis axis = ValueAxis::covering({0.1, 0.45}, {}, {}, 5);
    EXPECT_THAT(axis.marks,
                ElementsAre(DoubleEq(0.1), DoubleEq(0.2), DoubleEq(0.30000000000000004), DoubleEq(0.4)));
    EXPECT_EQ(axis.decimals, 1);
}

TEST(ValueAxis, AFlatLineAndNoValueAtAllHaveAnAxisToo) {
    const ValueAxis flat = ValueAxis::covering({-90, -90}, {}, {}, 5);
    EXPECT_LT(flat.minimum, -90);
    EXPECT_GT(flat.maximum, -90);
    const ValueAxis none = ValueAxis::covering({}, {}, {}, 5);
    EXPECT_LT(none.minimum, none.maximum);
    EXPECT_FALSE(none.marks.empty());
}

TEST(ValueAxis, KeepsGivenEnds) {
    const ValueAxis axis = ValueAxis::covering({-60, -20}, -140, -44, 4);
    EXPECT_EQ(axis.minimum, -140);
    EXPECT_EQ(axis.maximum, -44);
}

TEST(ValueAxis, HasNoMoreMarksThanThereIsRoomFor) {
    for (const double span : {0.3, 1.0, 7.0, 44.0, 99.0, 1e6})
        for (const std::size_t limit : {2U, 3U, 5U, 9U}) {
            const ValueAxis axis = ValueAxis::covering({-span / 3, span * 2 / 3}, {}, {}, limit);
            EXPECT_LE(axis.marks.size(), limit) << span;
            EXPECT_GE(axis.marks.size(), 1U) << span;
            EXPECT_LE(axis.minimum, -span / 3);
            EXPECT_GE(axis.maximum, span * 2 / 3);
        }
}

TEST(TimeAxis, ShowsSecondsUnderAMinuteAStep) {
    const Zone zone("UTC");
    EXPECT_THAT(labels({noon_ns, noon_ns + 60 * second_ns}, 4),
                ElementsAre("12:00:00", "12:00:15", "12:00:30", "12:00:45"));
    EXPECT_THAT(labels({noon_ns + 1, noon_ns + 300 * second_ns}, 5),
                ElementsAre("12:01", "12:02", "12:03", "12:04"));
    EXPECT_THAT(labels({noon_ns, noon_ns + second_ns}, 2), ElementsAre("12:00:00.000", "12:00:00.500"));
}

TEST(TimeAxis, IsMarkedAtRoundLocalTimes) {
    const Zone zone("Asia/Kolkata"); // half an hour off the hour
    EXPECT_THAT(labels({noon_ns, noon_ns + 3 * 3600 * second_ns}, 4), ElementsAre("18:00", "19:00", "20:00"));
}

TEST(TimeAxis, ShowsTheDateAtMidnight) {
    const Zone zone("UTC");
    EXPECT_THAT(labels({noon_ns, noon_ns + 24 * 3600 * second_ns}, 4),
                ElementsAre("12:00", "18:00", "11-23", "06:00"));
}

TEST(ChartText, WritesExactlyTheDecimalsThatAreAskedFor) {
    EXPECT_EQ(chartNumber(-97.25, 2), "\u221297.25");
    EXPECT_EQ(chartNumber(-97, 0), "\u221297");
    EXPECT_EQ(chartNumber(268435457, 0), "268435457");
    EXPECT_EQ(chartNumber(0.1, 1), "0.1");
    EXPECT_EQ(chartNumber(-0.04, 1), "0.0");
    EXPECT_EQ(chartValue(-97.25, 2, "dBm"), "\u221297.25 dBm");
    EXPECT_EQ(chartValue(7, 0, ""), "7");
    EXPECT_EQ(chartValue(std::nullopt, 2, "dBm"), "no value");
}

TEST(ChartText, WritesTimesAndDurations) {
    const Zone zone("UTC");
    EXPECT_EQ(chartTime(noon_ns + 61'250'000'000, true), "12:01:01.250");
    EXPECT_EQ(chartTime(noon_ns + 61'250'000'000, false), "12:01:01");
    EXPECT_EQ(chartTime(-1, true), "23:59:59.999");
    using std::chrono::seconds;
    EXPECT_EQ(chartDuration(seconds(1)), "1 second");
    EXPECT_EQ(chartDuration(seconds(60)), "1 minute");
    EXPECT_EQ(chartDuration(seconds(90)), "90 seconds");
    EXPECT_EQ(chartDuration(seconds(300)), "5 minutes");
    EXPECT_EQ(chartDuration(seconds(3600)), "1 hour");
    EXPECT_EQ(chartDuration(seconds(7500)), "2 hours 5 minutes");
}

} // namespace
} // namespace velmora
