// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/C2K/OneXRecords.h"

#include <gtest/gtest.h>

namespace velmora::c2k {
namespace {

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
} // namespace velmora::c2k
