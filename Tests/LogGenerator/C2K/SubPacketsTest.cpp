// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/OneX/SubPackets.h"

#include "Tests/LogGenerator/C2K/ParserHarness.h"
#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

using C2K::FoundSubPacket;
using C2K::SubPackets;
using Outcome = C2K::FoundSubPacket::Outcome;

/// Bytes 13 to 16 with the count, then the sub-packets.
Data with(std::uint8_t count, std::string_view subPackets) {
    return joined(withByte(recordWith(0x119C, 17), 14, count), hex(subPackets));
}

struct Case {
    const char* odd;
    std::uint8_t count;
    const char* subPackets;
    Outcome outcome;
    int index;          ///< where it is not missing
    std::size_t offset; ///< where it is not missing
    LogLines lines;
};

class SearchTest : public testing::TestWithParam<Case> {};

TEST_P(SearchTest, ForId7) {
    const Data data = with(GetParam().count, GetParam().subPackets);
    const CapturedLog log;
    const FoundSubPacket found = SubPackets(Record(data)).find(7);
    EXPECT_EQ(found.outcome, GetParam().outcome);
    if (GetParam().outcome != Outcome::Missing) {
        EXPECT_EQ(found.index, GetParam().index);
        EXPECT_EQ(found.offset, GetParam().offset);
    }
    EXPECT_EQ(log.lines(), GetParam().lines);
}

const LogLines quiet;

INSTANTIATE_TEST_SUITE_P(
    , SearchTest,
    testing::Values(
        Case{"CountOfZero", 0, "07 00 04 00", Outcome::Missing, 0, 0, quiet},
        Case{"First", 1, "07 00 04 00", Outcome::Found, 0, 17, quiet},
        Case{"TheFirstOfTwo", 2, "07 00 04 00 07 00 04 00", Outcome::Found, 0, 17, quiet},
        Case{"BehindALongerOne", 2, "01 00 06 00 AA BB 07 00 04 00", Outcome::Found, 1, 23, quiet},
        Case{"BehindTheCount", 1, "01 00 04 00 07 00 04 00", Outcome::Missing, 0, 0, quiet},
        Case{"NotThere", 2, "01 00 04 00 02 00 04 00", Outcome::Missing, 0, 0, quiet},
        // The record has 21 bytes; an end at 17 + 21 = 38 or later is too far, so 17 + 21.
        Case{"JustNotTooLarge", 1, "07 00 14 00", Outcome::Found, 0, 17, quiet},
        Case{"TooLargeAlthoughWanted", 1, "07 00 15 00", Outcome::Missing, 0, 0,
             error("Log code error in subpkt#0: bad size (21).")},
        Case{"LargestSize", 1, "07 00 FF FF", Outcome::Missing, 0, 0,
             error("Log code error in subpkt#0: bad size (65535).")},
        Case{"TooLargeBeforeTheWanted", 3, "01 00 04 00 02 00 FF 00 07 00 04 00", Outcome::Missing, 0, 0,
             error("Log code error in subpkt#1: bad size (255).")},
        Case{"TooLargeBehindTheWanted", 2, "07 00 04 00 02 00 FF 00", Outcome::Found, 0, 17, quiet},
        Case{"SizeOfZeroStaysWhereItIs", 255, "01 00 00 00 07 00 04 00", Outcome::Missing, 0, 0, quiet},
        Case{"SizeWithinTheHeader", 2, "01 07 01 00 00 00", Outcome::Found, 1, 18, quiet},
        Case{"CountWithoutAny", 1, "", Outcome::PastEnd, 0, 17, quiet},
        Case{"HeaderCutShort", 1, "07 00 04", Outcome::PastEnd, 0, 17, quiet},
        Case{"NextBehindTheRecord", 2, "01 00 0A 00", Outcome::PastEnd, 1, 27, quiet},
        Case{"NextHeaderCutShort", 2, "01 00 04 00 07 00 04", Outcome::PastEnd, 1, 21, quiet}),
    [](const auto& test) { return std::string(test.param.odd); });

TEST(SubPacketsTest, ReachesUpToTheRecordsEnd) {
    const Data data = with(1, "07 00 14 00 AA BB"); // 23 bytes, of which the sub-packet has six
    const SubPackets subPackets{Record(data)};
    const FoundSubPacket found = subPackets.find(7);
    const CapturedLog log;
    EXPECT_TRUE(subPackets.contains(found, 6, 0x119C));
    EXPECT_EQ(log.lines(), LogLines());
    EXPECT_FALSE(subPackets.contains(found, 7, 0x119C));
    EXPECT_EQ(log.lines(),
              error("Log code 0x119c is 23 bytes long but its subpkt#0 needs at least 24 bytes."));
    EXPECT_EQ(subPackets.from(found).size(), 6u);
    EXPECT_EQ(subPackets.from(found).u8(5), 0xBB);
}

} // namespace
} // namespace velmora
