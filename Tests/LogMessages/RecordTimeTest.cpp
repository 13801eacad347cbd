// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogMessages/RecordTime.h"

#include <chrono>
#include <random>

#include <gtest/gtest.h>

namespace velmora {
namespace {

Time at(std::int64_t seconds, std::int64_t nanoseconds = 0) {
    return Time(std::chrono::seconds(seconds) + std::chrono::nanoseconds(nanoseconds));
}

struct Pair {
    const char* name;
    Time time;
    std::uint64_t timestamp;
};

/// Seconds of system time times 800, with 16 bits below.
const Pair pairs[] = {
    {"1980-01-06 00:00:00", at(315'964'800), 0},
    {"a unit of 1.25 ms", at(315'964'800, 1'250'000), 0x10000},
    // 49152 parts a unit: half of them are 0.625 ms.
    {"half a unit", at(315'964'800, 625'000), 24'576},
    // 1250000 ns / 49152 = 25.43 ns
    {"one part", at(315'964'800, 25), 1},
    // 49151 * 25.43131510 ns = 1249974.57 ns
    {"the last part of a unit", at(315'964'800, 1'249'975), 49'151},
    // 46828801 s, the first with a leap second before it
    {"1981-07-01 00:00:00", at(362'793'600), 0x8'B8F8'A320'0000},
    // 599184013 s
    {"1999-01-01 00:00:00", at(915'148'800), 0x6F'9B51'F8A0'0000},
    // 1167264016 s: 17 s ahead, the last second but the inserted one
    {"2016-12-31 23:59:59", at(1'483'228'799), 0xD9'6B7C'5200'0000},
    // 1167264018 s: 18 s ahead
    {"2017-01-01 00:00:00", at(1'483'228'800), 0xD9'6B7C'5840'0000},
    // 1478840418 s
    {"2026-11-16 05:00:00", at(1'794'805'200), 0x113'749B'3240'0000},
};

TEST(RecordTime, turnsTimestampsIntoMoments) {
    for (const Pair& pair : pairs)
        EXPECT_EQ(timeOfRecord(pair.timestamp), pair.time) << pair.name;
}

TEST(RecordTime, turnsMomentsIntoTimestamps) {
    for (const Pair& pair : pairs)
        EXPECT_EQ(recordTimestamp(pair.time), pair.timestamp) << pair.name;
}

TEST(RecordTime, showsALeapSecondAsTheSecondAfterIt) {
    // 1167264017 s is 2016-12-31 23:59:60.
    EXPECT_EQ(timeOfRecord(std::uint64_t{1'167'264'017} * 800 << 16), at(1'483'228'800));
    EXPECT_EQ(timeOfRecord((std::uint64_t{1'167'264'017} * 800 + 400) << 16), at(1'483'228'800, 500'000'000));
}

TEST(RecordTime, roundsUpIntoTheNextUnit) {
    // 1249990 ns lie nearer to the unit's end than to its last part at 1249974.57 ns.
    EXPECT_EQ(recordTimestamp(at(315'964'800, 1'249'990)), 0x10000U);
}

TEST(RecordTime, hasNoMomentForPartsPastTheUnit) {
    EXPECT_EQ(timeOfRecord(49'152), std::nullopt);
    EXPECT_EQ(timeOfRecord(0xFFFF), std::nullopt);
}

TEST(RecordTime, hasNoMomentPastTheEndOfTime) {
    EXPECT_EQ(timeOfRecord(0xFFFF'FFFF'FFFF'0000), std::nullopt);
    // 2262-04-11 23:47:16 is the last whole second; 8907407236 s after 1980-01-06.
    EXPECT_TRUE(timeOfRecord(std::uint64_t{8'907'407'236} * 800 << 16));
    EXPECT_EQ(timeOfRecord(std::uint64_t{8'907'407'237} * 800 << 16), std::nullopt);
}

TEST(RecordTime, takesWhatLiesBefore1980ForItsBegin) {
    EXPECT_EQ(recordTimestamp(at(0)), 0U);
    EXPECT_EQ(recordTimestamp(Time::min()), 0U);
    EXPECT_EQ(recordTimestamp(at(315'964'799, 999'999'999)), 0U);
}

TEST(RecordTime, givesEveryTimestampBack) {
    std::mt19937_64 random(1);
    for (int i = 0; i < 100'000; ++i) {
        // From 2017 to 2175, past the leap seconds, which share their moments with the seconds after them.
        const std::uint64_t seconds = 1'167'264'018 + random() % 5'000'000'000;
        const std::uint64_t timestamp = (seconds * 800 + random() % 800) << 16 | random() % 49'152;
        const std::optional<Time> time = timeOfRecord(timestamp);
        ASSERT_TRUE(time) << timestamp;
        ASSERT_EQ(recordTimestamp(*time), timestamp);
    }
}

} // namespace
} // namespace velmora
