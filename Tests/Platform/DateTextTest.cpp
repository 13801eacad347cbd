// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/DateText.h"
#include "Tests/Support/FakeClock.h"

#include <gtest/gtest.h>

#include <chrono>
#include <optional>

namespace velmora {
namespace {

using namespace std::chrono;

TEST(DateDescription, IsInUTCToTheSecond) {
    EXPECT_EQ(dateDescription(sys_days{year{2026} / 11 / 16} + 5h), "2026-11-16 05:00:00 +0000");
    EXPECT_EQ(dateDescription(sys_days{year{2026} / 1 / 2} + 3h + 4min + 5s + 999ms),
              "2026-01-02 03:04:05 +0000");
    EXPECT_EQ(dateDescription(Time(nanoseconds(-1))), "1969-12-31 23:59:59 +0000");
    EXPECT_EQ(dateDescription(Time()), "1970-01-01 00:00:00 +0000");
}

TEST(TimeOfDateDescription, ReadsWhatIsWritten) {
    for (const Time moment : {Time(sys_days{year{2026} / 11 / 16} + 5h), Time(), Time(seconds(-1)),
                              Time(sys_days{year{2261} / 12 / 31} + 23h + 59min + 59s),
                              Time(sys_days{year{1678} / 1 / 1}), Time(sys_days{year{2028} / 2 / 29})})
        EXPECT_EQ(timeOfDateDescription(dateDescription(moment)), moment);
}

TEST(TimeOfDateDescription, UsesTheZone) {
    const Time moment = sys_days{year{2026} / 11 / 16} + 5h;
    EXPECT_EQ(timeOfDateDescription("2026-11-16 06:30:00 +0130"), moment);
    EXPECT_EQ(timeOfDateDescription("2026-11-15 23:30:00 -0530"), moment);
}

TEST(TimeOfDateDescription, TakesNothingElse) {
    for (const char* const text :
         {"", "2026-11-16 05:00:00", "2026-11-16 05:00:00 +000", "2026-11-16 05:00:00 +00000",
          "2026-11-16T05:00:00 +0000", "2026-11-16 05:00:00 00000", "2026/11/16 05:00:00 +0000",
          "2026-13-16 05:00:00 +0000", "2026-00-16 05:00:00 +0000", "2026-11-31 05:00:00 +0000",
          "2026-02-29 05:00:00 +0000", "2026-11-16 24:00:00 +0000", "2026-11-16 05:60:00 +0000",
          "2026-11-16 05:00:60 +0000", "2026-11-16 05:00:00 +2400", "2026-11-16 05:00:00 +0060",
          "1677-11-16 05:00:00 +0000", "2262-01-01 05:00:00 +0000", "abcd-11-16 05:00:00 +0000"})
        EXPECT_FALSE(timeOfDateDescription(text)) << text;
}

TEST(LocalDateAndTime, UsesTheClocksZone) {
    FakeClock clock;
    clock.setZone({1h, false});
    EXPECT_EQ(localDateAndTime(clock, clock.now(), " at "), "2026-11-16 at 06:00:00");
    clock.setZone({-(5h + 30min), true});
    EXPECT_EQ(localDateAndTime(clock, clock.now(), " "), "2026-11-15 23:30:00");
    EXPECT_EQ(localDateAndTime(clock, clock.now(), ""), "2026-11-1523:30:00");
}

constexpr auto november16 = sys_days{year{2026} / 11 / 16};

TEST(DayText, HasFourDigitsOfYearUpTo9999) {
    EXPECT_EQ(dayText(november16), "2026-11-16");
    EXPECT_EQ(dayText(sys_days{year{1} / 2 / 3}), "0001-02-03");
    EXPECT_EQ(dayText(sys_days{year{9999} / 12 / 31}), "9999-12-31");
    EXPECT_EQ(dayText(sys_days{year{10000} / 1 / 1}), "10000-01-01");
}

TEST(DateAndTimeText, IsInUTCToTheSecond) {
    EXPECT_EQ(dateAndTimeText(november16 + 5h + 4min + 3s, "T"), "2026-11-16T05:04:03");
    EXPECT_EQ(dateAndTimeText(november16 + 23h, " at "), "2026-11-16 at 23:00:00");
    EXPECT_EQ(dateAndTimeText(sys_seconds(-1s), " "), "1969-12-31 23:59:59");
    EXPECT_EQ(isoText(november16 + 5h), "2026-11-16T05:00:00Z");
}

TEST(DayOfText, ReadsDaysOfTheCalendarAlone) {
    EXPECT_EQ(dayOfText("2026-11-16"), november16);
    EXPECT_EQ(dayOfText("0000-01-01"), sys_days{year{0} / 1 / 1});
    EXPECT_EQ(dayOfText("2028-02-29"), sys_days{year{2028} / 2 / 29});
    for (const char* const text : {"", "2026-11-1", "2026-11-160", "2026/11/16", "2026-1a-16", "2026-02-29",
                                   "2026-00-01", "2026-13-01", "2026-11-00", "2026-11-31", "-026-11-16"})
        EXPECT_EQ(dayOfText(text), std::nullopt) << text;
}

TEST(MomentOfText, ReadsTheTimeAfterTheSeparator) {
    EXPECT_EQ(momentOfText("2026-11-16T05:04:03", 'T'), november16 + 5h + 4min + 3s);
    EXPECT_EQ(momentOfText("9999-12-31 23:59:59", ' '), sys_days{year{10000} / 1 / 1} - 1s);
    for (const char* const text :
         {"", "2026-11-16", "2026-11-16 05:04:03", "2026-11-16T05:04", "2026-11-16T05:04:03Z",
          "2026-11-31T05:04:03", "2026-11-16T24:00:00", "2026-11-16T05:60:00", "2026-11-16T05:04:60",
          "2026-11-16T05-04-03", "2026-11-16T 5:04:03"})
        EXPECT_EQ(momentOfText(text, 'T'), std::nullopt) << text;
}

} // namespace
} // namespace velmora
