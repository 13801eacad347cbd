// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/DateText.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

using namespace std::chrono;

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
