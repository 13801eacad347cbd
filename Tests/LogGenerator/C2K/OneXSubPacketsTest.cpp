// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/C2K/OneXRecords.h"

#include <gtest/gtest.h>

namespace velmora::c2k {
namespace {

LogLines missing(const char* found) {
    return {{LogPriority::Warning, std::string("Log code 0x119c: missing subpacket (") + found + ")."}};
}

TEST(OneXSubPacketsTest, MissingSubPacketsAreNamed) {
    const Data other = hex("09 00 04 00");
    struct Case {
        Data record;
        const char* found;
    };
    for (const Case& each : {Case{status({other, radio, active, fingers}), "ss=0,rf=1,ai=1,fi=1"},
                             Case{status({paging, other, active, fingers}), "ss=1,rf=0,ai=1,fi=1"},
                             Case{status({paging, radio, other, fingers}), "ss=1,rf=1,ai=0,fi=1"},
                             Case{status({paging, radio, active, other}), "ss=1,rf=1,ai=1,fi=0"},
                             Case{status({paging, radio, active}), "ss=1,rf=1,ai=1,fi=0"},
                             Case{status({}), "ss=0,rf=0,ai=0,fi=0"}}) {
        ParserHarness parser;
        parser.state.set("TrafficFER", 0.25);
        parser.update(each.record);
        EXPECT_EQ(parser.lines(), missing(each.found));
        EXPECT_EQ(parser.display(), "{}");
        EXPECT_EQ(parser.state["TrafficFER"], Value(0.25));
    }
}

TEST(OneXSubPacketsTest, SubPacketMayEndUpTo16BytesPastTheRecord) {
    // The finger sub-packet, never read, begins at 91 of 95: 91 + 20 = 111 < 17 + 95, 91 + 21 = 112 is not.
    ParserHarness taken;
    taken.update(withFields(idleRecord(), {{93, 2, 20}}));
    EXPECT_EQ(taken.display(), idleDisplay());
    ParserHarness refused;
    refused.update(withFields(idleRecord(), {{93, 2, 21}}));
    EXPECT_EQ(refused.display(), "{}");
    LogLines expected = error("Log code error in subpkt#3: bad size (21).");
    expected.push_back(missing("ss=1,rf=1,ai=1,fi=0")[0]);
    EXPECT_EQ(refused.lines(), expected);
}

TEST(OneXSubPacketsTest, EveryPrefix) {
    for (std::size_t length = 13; length <= 95; ++length) {
        SCOPED_TRACE(length);
        ParserHarness parser;
        parser.state.set("TrafficFER", 0.25);
        parser.update(prefixOf(idleRecord(), length));
        const std::string is = "Log code 0x119c is " + std::to_string(length) + " bytes long but ";
        if (length < 95) {
            EXPECT_EQ(parser.display(), "{}");
            EXPECT_EQ(parser.state["TrafficFER"], Value(0.25));
        }
        if (length < 17) {
            EXPECT_EQ(parser.lines(), error(is + "must be at least 17 bytes."));
        } else if (length < 21) { // a sub-packet's header has four bytes
            EXPECT_EQ(parser.lines(), error(is + "its subpkt#0 needs at least 21 bytes."));
        } else if (length < 29) {
            EXPECT_EQ(parser.lines(), error(is + "its subpkt#1 needs at least 29 bytes."));
        } else if (length < 43) {
            EXPECT_EQ(parser.lines(), error(is + "its subpkt#2 needs at least 43 bytes."));
        } else if (length <= 74) { // the active set's end, 91, lies at or past 17 + length: for two searches
            LogLines expected(2, error("Log code error in subpkt#2: bad size (52).")[0]);
            expected.push_back(missing("ss=1,rf=1,ai=0,fi=0")[0]);
            EXPECT_EQ(parser.lines(), expected);
        } else if (length < 95) {
            EXPECT_EQ(parser.lines(), error(is + "its subpkt#3 needs at least 95 bytes."));
        } else {
            EXPECT_EQ(parser.text("k1xDeviceState"), "Paging [6]");
            EXPECT_EQ(parser.lines(), LogLines());
        }
    }
}

/// A record whose last sub-packet is taken although it is incomplete.
struct Cut {
    const char* name;
    std::vector<Data> subPackets;
    std::size_t length;
    const char* line; ///< empty where all that is read is there
};

TEST(OneXSubPacketsTest, AnIncompleteSubPacketDropsTheRecord) {
    // Sub-packets are 8, 14, 52 and 4 bytes long; the last of them ends at 95.
    const Data shortSize = withFields(active, {{2, 2, 12}});
    const Cut cuts[] = {
        {"StateMissing",
         {radio, active, fingers, paging},
         91,
         "Log code 0x119c is 91 bytes long but its subpkt#3 needs at least 92 bytes."},
        {"StateThere", {radio, active, fingers, paging}, 92, ""},
        {"IdleNeedsOneChain",
         {paging, active, fingers, radio},
         91,
         "Log code 0x119c is 91 bytes long but its subpkt#3 needs at least 92 bytes."}, // 81 + 11
        {"IdleHasOneChain", {paging, active, fingers, radio}, 92, ""},
        {"TrafficNeedsBoth",
         {traffic, active, fingers, radio},
         94,
         "Log code 0x119c is 94 bytes long but its subpkt#3 needs at least 95 bytes."}, // 81 + 14
        {"TrafficHasBoth", {traffic, active, fingers, radio}, 95, ""},
        {"ActiveSetHeader",
         {paging, radio, fingers, shortSize},
         54,
         "Log code 0x119c is 54 bytes long but its subpkt#3 needs at least 55 bytes."}, // 43 + 12
        {"LastEnergyMissing",
         {paging, radio, fingers, active},
         92,
         "Log code 0x119c is 92 bytes long but its subpkt#3 needs at least 93 bytes."}, // 43 + 20 + 28 + 2
        {"LastEnergyThere", {paging, radio, fingers, active}, 93, ""},
    };
    for (const Cut& cut : cuts) {
        SCOPED_TRACE(cut.name);
        ParserHarness parser;
        const auto& parts = cut.subPackets;
        parser.update(prefixOf(status({parts[0], parts[1], parts[2], parts[3]}), cut.length));
        EXPECT_EQ(parser.lines(), *cut.line ? error(cut.line) : LogLines());
        EXPECT_EQ(parser.display() == "{}", *cut.line != 0);
    }
}

TEST(OneXSubPacketsTest, MostPilotsOfTheLargestStride) {
    // M of 255 makes 1545 & 0xFFC = 1544 bytes a pilot, the energy at 24 + 1020: the last of 255 needs
    // 254 * 1544 + 1044 + 2 = 393222 bytes from 43 on.
    const Data claim = withFields(active, {{8, 1, 255}, {9, 1, 255}});
    ParserHarness parser;
    parser.update(status({paging, radio, fingers, claim}));
    EXPECT_EQ(parser.lines(),
              error("Log code 0x119c is 95 bytes long but its subpkt#3 needs at least 393265 bytes."));
}

} // namespace
} // namespace velmora::c2k
