// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Pcapng/InterfaceDescription.h"

#include "Tests/Support/Hex.h"

#include <optional>
#include <string>

#include <gtest/gtest.h>

namespace velmora {
namespace {

struct StampCase {
    const char* name;
    std::uint8_t resolution;
    std::int64_t offset_seconds;
    std::uint64_t stamp;
    std::optional<std::int64_t> nanoseconds;
};

class InterfaceStamps : public testing::TestWithParam<StampCase> {};

TEST_P(InterfaceStamps, meanTheMoment) {
    InterfaceDescription description;
    description.timeResolution = GetParam().resolution;
    description.timeOffset_seconds = GetParam().offset_seconds;
    const std::optional<Time> time = description.time(GetParam().stamp);
    EXPECT_EQ(time ? std::optional(time->time_since_epoch().count()) : std::nullopt, GetParam().nanoseconds);
}

INSTANTIATE_TEST_SUITE_P(
    Table, InterfaceStamps,
    testing::Values(
        StampCase{"Seconds", 0, 0, 3, 3'000'000'000}, StampCase{"Milliseconds", 3, 0, 1'500, 1'500'000'000},
        StampCase{"Microseconds", 6, 0, 1, 1'000}, StampCase{"Nanoseconds", 9, 0, 123'456'789, 123'456'789},
        StampCase{"PicosecondsRoundDown", 12, 0, 1'999, 1},
        StampCase{"FarBelowAnyNanosecond", 127, 0, UINT64_MAX, 0},
        StampCase{"HalfSeconds", 0x81, 0, 3, 1'500'000'000},
        // 2^-30 s is 0.93 ns; 2^30 of them are a second.
        StampCase{"PowerOfTwo30", 0x9E, 0, 0x40000001, 1'000'000'000},
        StampCase{"PowerOfTwoWholeSeconds", 0x80, 0, 2, 2'000'000'000},
        // The top half of the stamp's range is half a second.
        StampCase{"PowerOfTwo64", 0xC0, 0, 0x8000000000000000, 500'000'000},
        StampCase{"PowerOfTwo127", 0xFF, 0, UINT64_MAX, 0},
        StampCase{"OffsetIsAdded", 9, 10, 5, 10'000'000'005},
        StampCase{"NegativeOffsetGoesBelow1970", 9, -1, 0, -1'000'000'000},
        StampCase{"LastMoment", 9, 0, INT64_MAX, INT64_MAX},
        StampCase{"PastTheLastMoment", 9, 0, std::uint64_t{INT64_MAX} + 1, std::nullopt},
        StampCase{"SecondsPastTheLastMoment", 0, 0, UINT64_MAX, std::nullopt},
        StampCase{"OffsetPastTheFirstMoment", 9, INT64_MIN, 0, std::nullopt},
        StampCase{"OffsetBringsBackIntoRange", 0, -10'000'000'000, 10'000'000'001, 1'000'000'000}),
    [](const auto& row) { return std::string(row.param.name); });

TEST(InterfaceDescription, hasDefaultsWhereThereAreNoOptions) {
    const auto description = InterfaceDescription::read(hex("9300 0000 00000400").bytes(), false);
    ASSERT_TRUE(description);
    EXPECT_EQ(description->linkType, 147);
    EXPECT_EQ(description->snapLength, 0x40000U);
    EXPECT_EQ(description->name, "");
    EXPECT_EQ(description->timeResolution, 6);
    EXPECT_EQ(description->timeOffset_seconds, 0);
}

TEST(InterfaceDescription, readsItsOptionsInBothByteOrders) {
    const char* const littleEndian = R"(9300 0000 00000000
        0300 0300 616263 00          # a description, not ours
        0200 0400 4C544520           # name
        0900 0100 8A 000000          # resolution
        0E00 0800 FFFFFFFFFFFFFFFF   # offset
        0000 0000
        FFFF FFFF                    # after the end, not read)";
    const char* const bigEndian = R"(0093 0000 00000000
        0003 0003 616263 00
        0002 0004 4C544520
        0009 0001 8A 000000
        000E 0008 FFFFFFFFFFFFFFFF
        0000 0000
        FFFF FFFF)";
    for (const bool big : {false, true}) {
        const auto description = InterfaceDescription::read(hex(big ? bigEndian : littleEndian).bytes(), big);
        ASSERT_TRUE(description);
        EXPECT_EQ(description->name, "LTE ");
        EXPECT_EQ(description->timeResolution, 0x8A);
        EXPECT_EQ(description->timeOffset_seconds, -1);
    }
}

TEST(InterfaceDescription, endsANameAtAZero) {
    const auto description =
        InterfaceDescription::read(hex("9300 0000 00000000 0200 0400 4C540000").bytes(), false);
    ASSERT_TRUE(description);
    EXPECT_EQ(description->name, "LT");
}

TEST(InterfaceDescription, isNoneWhereItDoesNotHoldItsFields) {
    for (const char* const body : {
             "",                                           // nothing
             "9300 0000 000000",                           // short of its fixed part
             "9300 0000 00000000 0200",                    // short of an option's length
             "9300 0000 00000000 0200 0500 41424344",      // short of an option's value
             "9300 0000 00000000 0900 0200 0909 0000",     // a resolution of two bytes
             "9300 0000 00000000 0900 0000",               // a resolution of none
             "9300 0000 00000000 0E00 0400 00000000 0000", // an offset of four bytes
         })
        EXPECT_FALSE(InterfaceDescription::read(hex(body).bytes(), false)) << body;
}

} // namespace
} // namespace velmora
