// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Messages/TimeRange.h"

#include <gtest/gtest.h>

#include <string>

namespace velmora {
namespace {

using namespace std::chrono;

constexpr nanoseconds fiveOClock = (sys_days{year{2026} / November / 16} + hours{5}).time_since_epoch();

TEST(TimeRangeTest, BoundsAreReadInTheirForms) {
    struct Case {
        const char* text;
        TimeBound bound;
    };
    const Case cases[] = {
        {"2026-11-16T05:00:00Z", {fiveOClock, false}},
        {"2026-11-16T05:00:00", {fiveOClock, false}},
        {"2026-11-16t05:00:00z", {fiveOClock, false}},
        {"2026-11-16 05:00", {fiveOClock, false}},
        {"2026-11-16T06:30:00+01:30", {fiveOClock, false}},
        {"2026-11-15T23:30-05:30", {fiveOClock, false}},
        {"2026-11-16T05:00:00.25Z", {fiveOClock + milliseconds{250}, false}},
        {"2026-11-16T05:00:09.000000001Z", {fiveOClock + seconds{9} + nanoseconds{1}, false}},
        {"2026-11-16", {fiveOClock - hours{5}, false}},
        {"1678-01-01", {sys_days{year{1678} / 1 / 1}.time_since_epoch(), false}},
        {"2261-12-31T23:59:59Z", {(sys_days{year{2262} / 1 / 1} - seconds{1}).time_since_epoch(), false}},
        {"0", {nanoseconds{0}, false}},
        {"1794805200", {fiveOClock, false}},
        {"1794805200.5", {fiveOClock + milliseconds{500}, false}},
        {"+0", {nanoseconds{0}, true}},
        {"+90.125", {milliseconds{90'125}, true}},
    };
    for (const Case& row : cases) {
        const Result<TimeBound> bound = readTimeBound(row.text);
        ASSERT_TRUE(bound) << row.text;
        EXPECT_EQ(*bound, row.bound) << row.text;
    }
}

TEST(TimeRangeTest, AnythingElseIsRefused) {
    for (const std::string text : {"",
                                   "+",
                                   "now",
                                   "-5",
                                   "1.",
                                   ".5",
                                   "1.0000000001",
                                   "1e3",
                                   "99999999999",
                                   "9999999999",
                                   "2026-11",
                                   "2026-13-01",
                                   "2026-02-29",
                                   "2026-11-16T",
                                   "2026-11-16T5:00",
                                   "2026-11-16T24:00",
                                   "2026-11-16T05:60",
                                   "2026-11-16T05:00:60",
                                   "2026-11-16T05:00:00.",
                                   "2026-11-16T05:00:00Zulu",
                                   "2026-11-16T05:00+1",
                                   "2026-11-16T05:00+24:00",
                                   "1677-12-31",
                                   "2262-01-01",
                                   "+2026-11-16",
                                   "2026-11-16x",
                                   "5 "}) {
        const Result<TimeBound> bound = readTimeBound(text);
        ASSERT_FALSE(bound) << text;
        EXPECT_EQ(bound.reason(), "got " + text +
                                      ", wanted a time such as 2026-11-16T05:00:00Z, seconds since 1970, or "
                                      "+SECONDS after the first message");
    }
}

TEST(TimeRangeTest, StartBelongsToItAndEndDoesNot) {
    const Time first(fiveOClock);
    const TimeRange absolute{TimeBound{fiveOClock + seconds{1}, false},
                             TimeBound{fiveOClock + seconds{2}, false}};
    const TimeRange relative{TimeBound{seconds{1}, true}, TimeBound{seconds{2}, true}};
    for (const TimeRange& range : {absolute, relative}) {
        EXPECT_FALSE(range.contains(first + seconds{1} - nanoseconds{1}, first));
        EXPECT_TRUE(range.contains(first + seconds{1}, first));
        EXPECT_TRUE(range.contains(first + seconds{2} - nanoseconds{1}, first));
        EXPECT_FALSE(range.contains(first + seconds{2}, first));
    }
    EXPECT_TRUE(TimeRange().contains(Time::min(), first));
    EXPECT_TRUE(TimeRange().contains(Time::max(), first));
}

TEST(TimeRangeTest, MomentsPastTheEndOfTimeAreThatEnd) {
    const TimeRange range{TimeBound{seconds{9'000'000'000}, true}, std::nullopt};
    EXPECT_FALSE(range.contains(Time(fiveOClock), Time(fiveOClock)));
    EXPECT_TRUE(range.contains(Time::max(), Time(fiveOClock)));
}

} // namespace
} // namespace velmora
