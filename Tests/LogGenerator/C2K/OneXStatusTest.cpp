// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/C2K/ParserHarness.h"
#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

const Data paging = hex("01 00 08 00 06 00 00 00");
const Data traffic = hex("01 00 08 00 08 00 00 00");
const Data radio = hex("02 00 0E 00"
                       "01 00"   // +4 band classes 1 and 0
                       "77 01"   // +6 channel 375
                       "2A 01"   // +8 channel 298
                       "C4"      // +10 -60: -60 * 0.334 - 63.248 = -83.288
                       "20"      // +11 32: 32 * 0.334 - 63.248 = -52.56
                       "9C FF"); // +12 -100 tenths
// Energies: 2^(2S-3) E / (9 N^2 G) - 1/N with N 2, G 1, S 2: E/18 - 1/2.
const Data active = hex("03 00 34 00"
                        "02 00" // +4 N
                        "01 02" // +6 G, S
                        "02 01" // +8 two pilots, M
                        "0E 01" // +10 reference PN 270
                        // M of 1: 20 bytes a pilot (21 & 0xFFC), the energy at 28 - 12 = 16
                        "64 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00" // +12 PN 100
                        "12 00 00 00"                                     // +28 E 18: 0.5, -3.0103 dB
                        "0E 01 00 00 00 00 00 00 00 00 00 00 00 00 00 00" // +32 PN 270
                        "1B 00 00 00");                                   // +48 E 27: 1, 0 dB
const Data fingers = hex("04 00 04 00");

/// The record of these sub-packets: bytes 13 to 16 with the count, then they.
Data status(std::initializer_list<Data> subPackets) {
    return joined(withByte(recordWith(0x119C, 17), 14, static_cast<std::uint8_t>(subPackets.size())),
                  joined(subPackets));
}

Data idleRecord() {
    return status({paging, radio, active, fingers}); // at 17, 25, 39, 91; 95 bytes
}
Data trafficRecord() {
    return status({traffic, radio, active, fingers});
}

constexpr const char* pilots =
    "k1xActiveSetInfo {_sorted '_sorted', 0;100 '-3.01 dB', 1;270 '(ref pilot) +0.00 dB'}";

std::string idleDisplay() {
    return std::string("{k1xDeviceState 'Paging [6]', k1xRx0BandClass '1.8 to 2.0GHz PCS band [1]', "
                       "k1xRx0ChanNum '375', k1xRxAGC0 '-83.29 dBm', k1xRx1BandClass 'N/A', "
                       "k1xRx1ChanNum 'N/A', k1xRxAGC1 'N/A', k1xTxAGC 'N/A', ")
        .append(pilots)
        .append("}");
}

TEST(OneXStatusTest, IdleShowsOneChain) {
    ParserHarness parser;
    parser.update(idleRecord());
    EXPECT_EQ(parser.display(), idleDisplay());
    EXPECT_EQ(parser.lines(), LogLines());
}

TEST(OneXStatusTest, TrafficShowsBothChains) {
    ParserHarness parser;
    parser.update(trafficRecord());
    EXPECT_EQ(parser.display(),
              std::string("{k1xDeviceState 'Traffic [8]', k1xRx0BandClass '1.8 to 2.0GHz PCS band [1]', "
                          "k1xRx0ChanNum '375', k1xRxAGC0 '-83.29 dBm', "
                          "k1xRx1BandClass '800 MHz cellular band [0]', k1xRx1ChanNum '298', "
                          "k1xRxAGC1 '-52.56 dBm', k1xTxAGC '-10.00 dBm', ")
                  .append(pilots)
                  .append("}"));
}

TEST(OneXStatusTest, OrderOfSubPacketsDoesNotMatter) {
    ParserHarness parser;
    parser.update(status({fingers, active, radio, hex("09 00 04 00"), paging}));
    EXPECT_EQ(parser.display(), idleDisplay());
}

TEST(OneXStatusTest, DeviceStates) {
    expectEnumeration(idleRecord(), 21, "k1xDeviceState",
                      {{0, "Inactive [0]"},
                       {1, "Deep sleep in start state [1]"},
                       {2, "Initial state for CDMA operation [2]"},
                       {3, "Acquisition [3]"},
                       {4, "Sync [4]"},
                       {5, "Slew [5]"},
                       {6, "Paging [6]"},
                       {7, "Slotted mode sleep state [7]"},
                       {8, "Traffic [8]"},
                       {9, "UnSlew [9]"},
                       {10, "Operation in PCG state [10]"},
                       {11, "Powerup state [11]"}},
                      "[Bad Value ", "]");
}

TEST(OneXStatusTest, BandClasses) {
    expectEnumeration(trafficRecord(), 29, "k1xRx0BandClass", expectedBandClasses, "[Bad Value ", "]");
    expectEnumeration(trafficRecord(), 30, "k1xRx1BandClass", expectedBandClasses, "[Bad Value ", "]");
}

TEST(OneXStatusTest, OnlyTrafficShowsTheSecondChain) {
    for (unsigned state = 0; state < 256; ++state) {
        ParserHarness parser;
        parser.update(withByte(idleRecord(), 21, static_cast<std::uint8_t>(state)));
        EXPECT_EQ(parser.text("k1xTxAGC"), state == 8 ? "-10.00 dBm" : "N/A") << state;
    }
}

struct Level {
    const char* name;
    FieldAt field;
    const char* valueKey;
    const char* text;
};

class LevelTest : public testing::TestWithParam<Level> {};

TEST_P(LevelTest, Shows) {
    ParserHarness parser;
    parser.update(withFields(trafficRecord(), {GetParam().field}));
    EXPECT_EQ(parser.text(GetParam().valueKey), GetParam().text);
}

INSTANTIATE_TEST_SUITE_P(
    , LevelTest,
    testing::Values(Level{"Zero", {35, 1, 0}, "k1xRxAGC0", "-63.25 dBm"},       // -63.248
                    Level{"Lowest", {35, 1, 0x80}, "k1xRxAGC0", "-106.00 dBm"}, // -42.752 - 63.248
                    Level{"Highest", {36, 1, 0x7F}, "k1xRxAGC1", "-20.83 dBm"}, // 42.418 - 63.248
                    Level{"NoPower", {37, 2, 0}, "k1xTxAGC", "+0.00 dBm"},
                    Level{"Power", {37, 2, 235}, "k1xTxAGC", "+23.50 dBm"},
                    Level{"LowestPower", {37, 2, 0x8000}, "k1xTxAGC", "-3276.80 dBm"},
                    Level{"Channel", {31, 2, 65535}, "k1xRx0ChanNum", "65535"},
                    Level{"OtherChannel", {33, 2, 65535}, "k1xRx1ChanNum", "65535"}),
    [](const auto& test) { return std::string(test.param.name); });

/// What the active set shows of a sub-packet.
std::string activeSetOf(const Data& subPacket) {
    ParserHarness parser;
    parser.update(status({paging, radio, fingers, subPacket}));
    EXPECT_EQ(parser.lines(), LogLines());
    const std::string display = parser.display();
    const std::size_t begin = display.find("k1xActiveSetInfo ") + 17;
    return display.substr(begin, display.size() - begin - 1);
}

TEST(OneXStatusTest, ActiveSetWithoutPilotsIsAnEmptyList) {
    EXPECT_EQ(activeSetOf(hex("03 00 0C 00 02 00 01 02 00 01 0E 01")), "{_sorted '_sorted'}");
}

TEST(OneXStatusTest, EnergiesAreHeldAtMinus50) {
    // E/18 - 1/2: 9 gives 0, 0 gives -0.5; both below 0.00001.
    EXPECT_EQ(activeSetOf(withFields(active, {{28, 2, 9}, {48, 2, 0}})),
              "{_sorted '_sorted', 0;100 '-50.00 dB', 1;270 '(ref pilot) -50.00 dB'}");
}

TEST(OneXStatusTest, SDoublesTwice) {
    // S of 0: E / (8 * 36) - 1/2; 720 / 288 - 0.5 = 2, 3.0103 dB.
    // S of 3: 8 E / 36 - 1/2; 27 gives 5.5, 7.4036 dB.
    EXPECT_EQ(activeSetOf(withFields(active, {{7, 1, 0}, {28, 2, 720}, {48, 2, 720}})),
              "{_sorted '_sorted', 0;100 '+3.01 dB', 1;270 '(ref pilot) +3.01 dB'}");
    EXPECT_EQ(activeSetOf(withFields(active, {{7, 1, 3}, {28, 2, 27}, {48, 2, 27}})),
              "{_sorted '_sorted', 0;100 '+7.40 dB', 1;270 '(ref pilot) +7.40 dB'}");
}

TEST(OneXStatusTest, LargeNAndG) {
    // N 512, G 4, S 8: 2^13 * 65535 / (9 * 262144 * 4) - 1/512 = 536862720 / 9437184 - 0.00195
    // = 56.888 - 0.002 = 56.886, 17.5501 dB; E 0: held.
    EXPECT_EQ(
        activeSetOf(withFields(active, {{4, 2, 512}, {6, 1, 4}, {7, 1, 8}, {28, 2, 65535}, {48, 2, 0}})),
        "{_sorted '_sorted', 0;100 '+17.55 dB', 1;270 '(ref pilot) -50.00 dB'}");
}

TEST(OneXStatusTest, DivisorsOfZeroAreSurvived) {
    // G 0: E/0 is infinite, 0/0 is no number and shows the floor. N 0: infinite less infinite, the floor.
    EXPECT_EQ(activeSetOf(withFields(active, {{6, 1, 0}, {28, 2, 18}, {48, 2, 0}})),
              "{_sorted '_sorted', 0;100 '+inf dB', 1;270 '(ref pilot) -50.00 dB'}");
    EXPECT_EQ(activeSetOf(withFields(active, {{4, 2, 0}})),
              "{_sorted '_sorted', 0;100 '-50.00 dB', 1;270 '(ref pilot) -50.00 dB'}");
}

TEST(OneXStatusTest, MSetsThePilotsStride) {
    // M of 2: 27 & 0xFFC = 24 bytes a pilot, the energy at 24 + 8 from the cursor, 20 into the pilot.
    EXPECT_EQ(activeSetOf(hex("03 00 3C 00 02 00 01 02 02 02 0E 01"
                              "64 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 12 00 00 00"
                              "0E 01 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 00 1B 00 00 00")),
              "{_sorted '_sorted', 0;100 '-3.01 dB', 1;270 '(ref pilot) +0.00 dB'}");
    // M of 0: 12 bytes a pilot, the energy where the next pilot's PN offset is.
    EXPECT_EQ(activeSetOf(hex("03 00 26 00 02 00 01 02 02 00 12 00"
                              "64 00 00 00 00 00 00 00 00 00 00 00" // PN 100; E is the next PN, 18
                              "12 00 00 00 00 00 00 00 00 00 00 00" // PN 18, the reference one
                              "1B 00")),                            // its E 27
              "{_sorted '_sorted', 0;100 '-3.01 dB', 1;18 '(ref pilot) +0.00 dB'}");
}

TEST(OneXStatusTest, EveryPilotWithTheReferencePNIsMarked) {
    EXPECT_EQ(activeSetOf(withFields(active, {{12, 2, 270}})),
              "{_sorted '_sorted', 0;270 '(ref pilot) -3.01 dB', 1;270 '(ref pilot) +0.00 dB'}");
}

LogLines missing(const char* found) {
    return {{LogPriority::Warning, std::string("Log code 0x119c: missing subpacket (") + found + ")."}};
}

TEST(OneXStatusTest, MissingSubPacketsAreNamed) {
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

TEST(OneXStatusTest, SubPacketMayEndUpTo16BytesPastTheRecord) {
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

TEST(OneXStatusTest, EveryPrefix) {
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

/// A record whose last sub-packet is taken although it is not whole.
struct Cut {
    const char* name;
    std::vector<Data> subPackets;
    std::size_t length;
    const char* line; ///< empty where all that is read is there
};

TEST(OneXStatusTest, AnIncompleteSubPacketDropsTheRecord) {
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

TEST(OneXStatusTest, MostPilotsOfTheLargestStride) {
    // M of 255 makes 1545 & 0xFFC = 1544 bytes a pilot, the energy at 24 + 1020: the last of 255 needs
    // 254 * 1544 + 1044 + 2 = 393222 bytes from 43 on.
    const Data claim = withFields(active, {{8, 1, 255}, {9, 1, 255}});
    ParserHarness parser;
    parser.update(status({paging, radio, fingers, claim}));
    EXPECT_EQ(parser.lines(),
              error("Log code 0x119c is 95 bytes long but its subpkt#3 needs at least 393265 bytes."));
}

TEST(OneXStatusTest, LeavingTrafficShowsTheLastAverageOnce) {
    ParserHarness parser;
    parser.state.set("TrafficFER", 0.25);
    parser.update(trafficRecord());
    EXPECT_EQ(parser.text("k1xTrafficFER"), "(none)");
    EXPECT_EQ(parser.state["TrafficFER"], Value(0.25));
    parser.update(idleRecord());
    EXPECT_EQ(parser.text("k1xTrafficFER"), "25.00% (old)");
    EXPECT_FALSE(parser.state.contains("TrafficFER"));
    parser.show("k1xTrafficFER", "untouched");
    parser.update(idleRecord());
    EXPECT_EQ(parser.text("k1xTrafficFER"), "untouched");
}

TEST(OneXStatusTest, AnAverageThatIsNoNumberIsIgnored) {
    ParserHarness parser;
    parser.state.set("TrafficFER", "0.25");
    parser.update(idleRecord());
    EXPECT_EQ(parser.text("k1xTrafficFER"), "(none)");
    EXPECT_EQ(parser.state["TrafficFER"], Value("0.25"));
}

TEST(OneXStatusTest, NextTrafficPeriodStartsAfresh) {
    const Data erased = withByte(joined(withByte(recordWith(0x119D, 17), 14, 1),
                                        Data::copyOf(recordWith(0, 13 + 25).bytes().subspan(13))),
                                 17, 11);
    const Data frame = withFields(erased, {{19, 2, 25}, {41, 1, 1}});
    ParserHarness parser;
    parser.update(trafficRecord()).update(frame).update(frame);
    EXPECT_EQ(parser.text("k1xTrafficFER"), "3.10%"); // 1 - (63/64)^2 = 127/4096 = 3.1006 %
    parser.update(idleRecord());
    EXPECT_EQ(parser.text("k1xTrafficFER"), "3.10% (old)");
    parser.update(trafficRecord()).update(frame);
    EXPECT_EQ(parser.text("k1xTrafficFER"), "1.56%");
}

} // namespace
} // namespace velmora
