// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/C2K/ParserHarness.h"
#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

Data goodRecord() {
    return record(0x1183, "6B 0A"    // 13 channel 2 * 256 + 0x6B = 619; band class 1
                          "C4 BE 05" // 15 receive -60 and -66, transmit 5
                          "64 00"    // 18 serving PN offset 100
                          "00 00 00 00 00 00 00 00"
                          "00 00 00 00 00 00 00 00"   // 20 not read
                          "05 04"                     // 36 Connected, Open
                          "34 12 AB"                  // 38 UATI 0xAB1234
                          "2A"                        // 41 color code 42
                          "00 00 00 00 00 00 00 00"); // 42 not read
}

TEST(EVDOStatusTest, ShowsEveryFieldInOrder) {
    ParserHarness parser;
    parser.update(goodRecord());
    EXPECT_EQ(parser.display(), "{kChannel '619', k1xEVDODeviceState 'Connected [5]', "
                                "kBandClass '1.8 to 2.0GHz PCS band [1]', kRxAGC0 '-60 dBm', "
                                "kRxAGC1 '-66 dBm', kTxAGC '+5 dBm', "
                                "kServingPNOffset '100 \xC3\x97 64chips', " // U+00D7 in UTF-8
                                "kSessionState 'Open [4]', kUATI24 '0xab1234', kColorCode '42'}");
    EXPECT_EQ(parser.lines(), LogLines());
    EXPECT_EQ(shown(std::make_shared<Dictionary>(parser.state)), "{ExtraInfo {}}");
}

TEST(EVDOStatusTest, AnyOtherLengthIsRejected) {
    std::vector<std::uint8_t> bytes(60, 0xEE);
    const Data longer = joined(goodRecord(), Data(std::move(bytes)));
    for (std::size_t length = 13; length <= longer.size(); ++length) {
        if (length == 50)
            continue;
        ParserHarness parser;
        parser.update(prefixOf(longer, length));
        EXPECT_EQ(parser.display(), "{}");
        EXPECT_EQ(parser.lines(), error("Log code 0x1183 is " + std::to_string(length) +
                                        " bytes long but should be 50 bytes."));
    }
}

TEST(EVDOStatusTest, DeviceStates) {
    expectEnumeration(goodRecord(), 36, "k1xEVDODeviceState",
                      {{0, "Inactive [0]"},
                       {1, "Acquisition [1]"},
                       {2, "Sync [2]"},
                       {3, "Idle [3]"},
                       {4, "Access [4]"},
                       {5, "Connected [5]"}},
                      "[Reserved ", "]");
}

TEST(EVDOStatusTest, SessionStates) {
    expectEnumeration(goodRecord(), 37, "kSessionState",
                      {{0, "Closed [0]"},
                       {1, "AMP setup [1]"},
                       {2, "AT-initiated neg [2]"},
                       {3, "Initiated neg [3]"},
                       {4, "Open [4]"}},
                      "[Reserved ", "]");
}

TEST(EVDOStatusTest, BandClassesAreFiveBits) {
    for (unsigned value = 0; value < 32; ++value) {
        std::string expected = "[Bad Value " + std::to_string(value) + "]";
        for (const ExpectedText& row : expectedBandClasses)
            if (row.value == value)
                expected = row.text;
        ParserHarness parser;
        parser.update(withByte(goodRecord(), 14, static_cast<std::uint8_t>(value << 3 | 7)));
        EXPECT_EQ(parser.text("kBandClass"), expected);
        EXPECT_EQ(parser.text("kChannel"), "1899"); // 7 * 256 + 107
    }
}

TEST(EVDOStatusTest, SecondChainAndTransmitterNeedAccessOrMore) {
    for (unsigned state = 0; state < 256; ++state) {
        ParserHarness parser;
        parser.update(withByte(goodRecord(), 36, static_cast<std::uint8_t>(state)));
        EXPECT_EQ(parser.text("kRxAGC0"), "-60 dBm");
        EXPECT_EQ(parser.text("kRxAGC1"), state < 4 ? "N/A" : "-66 dBm") << state;
        EXPECT_EQ(parser.text("kTxAGC"), state < 4 ? "N/A" : "+5 dBm") << state;
    }
}

struct Case {
    const char* odd;
    FieldAt field;
    const char* valueKey;
    const char* text;
};

class EVDOFieldTest : public testing::TestWithParam<Case> {};

TEST_P(EVDOFieldTest, Shows) {
    ParserHarness parser;
    parser.update(withFields(goodRecord(), {GetParam().field}));
    EXPECT_EQ(parser.text(GetParam().valueKey), GetParam().text);
}

INSTANTIATE_TEST_SUITE_P(
    , EVDOFieldTest,
    testing::Values(Case{"LowestChannel", {13, 2, 0}, "kChannel", "0"},
                    Case{"HighestChannel", {13, 2, 0xFFFF}, "kChannel", "2047"},
                    Case{"ZeroLevelHasASign", {15, 1, 0}, "kRxAGC0", "+0 dBm"},
                    Case{"LowestLevel", {16, 1, 0x80}, "kRxAGC1", "-128 dBm"},
                    Case{"HighestLevel", {17, 1, 0x7F}, "kTxAGC", "+127 dBm"},
                    Case{"NoPilot", {18, 2, 0xFFFF}, "kServingPNOffset", "Invalid Value"},
                    Case{"NearlyNoPilot", {18, 2, 0xFFFE}, "kServingPNOffset", "65534 \u00D7 64chips"},
                    Case{"PilotZero", {18, 2, 0}, "kServingPNOffset", "0 \u00D7 64chips"},
                    Case{"SmallUATI", {38, 3, 1}, "kUATI24", "0x000001"},
                    Case{"LargestUATI", {38, 3, 0xFFFFFF}, "kUATI24", "0xffffff"},
                    Case{"LargestColorCode", {41, 1, 0xFF}, "kColorCode", "255"}),
    [](const auto& test) { return std::string(test.param.odd); });

} // namespace
} // namespace velmora
