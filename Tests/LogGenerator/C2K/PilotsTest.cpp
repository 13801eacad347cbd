// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/C2K/ParserHarness.h"
#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

Data activeSet() {
    return record(0x12B6, "00 00"                                 // 13
                          "02"                                    // 15 pilots
                          "00 00 00 00 00 00 00 00 00"            // 16
                          "64 00 00 02 00 00 00 00 00 00 00 00"   // 25 PN 100, 512/512: 0 dB
                          "0E 01 00 01 00 00 00 00 00 00 00 00"); // 37 PN 270, 256/512: 10 log 0.5 = -3.0103
}

TEST(ActiveSetPilotsTest, ListsEveryPilot) {
    ParserHarness parser;
    parser.update(activeSet());
    EXPECT_EQ(parser.display(), "{kActiveSetPilots {_sorted '_sorted', 0;100 '+0.00 dB', 1;270 '-3.01 dB'}}");
    EXPECT_EQ(parser.lines(), LogLines());
}

TEST(ActiveSetPilotsTest, EveryRecordMakesANewList) {
    ParserHarness parser;
    parser.update(activeSet());
    parser.update(prefixOf(withByte(activeSet(), 15, 1), 37));
    EXPECT_EQ(parser.display(), "{kActiveSetPilots {_sorted '_sorted', 0;100 '+0.00 dB'}}");
}

TEST(ActiveSetPilotsTest, WithoutPilotsSaysNone) {
    ParserHarness parser;
    parser.update(recordWith(0x12B6, 25));
    EXPECT_EQ(parser.display(), "{kActiveSetPilots '(none)'}");
}

TEST(ActiveSetPilotsTest, EveryPrefix) {
    const Data longer = joined(activeSet(), hex("EE EE EE"));
    for (std::size_t length = 13; length <= longer.size(); ++length) {
        ParserHarness parser;
        parser.update(prefixOf(longer, length));
        const std::string number = std::to_string(length);
        if (length < 25)
            EXPECT_EQ(parser.lines(),
                      error("Log code 0x12b6 is " + number + " bytes long but must be at least 25 bytes."));
        else if (length < 49)
            EXPECT_EQ(parser.lines(),
                      error("Log code 0x12b6 is " + number + " bytes long, but has 2 substructs."));
        else
            EXPECT_EQ(parser.lines(), LogLines());
        EXPECT_EQ(parser.display() == "{}", length < 49);
    }
}

TEST(ActiveSetPilotsTest, CountOf255) {
    ParserHarness parser;
    parser.update(recordWith(0x12B6, 25 + 255 * 12 - 1, {{15, 1, 255}}));
    EXPECT_EQ(parser.lines(), error("Log code 0x12b6 is 3084 bytes long, but has 255 substructs."));
    parser.update(recordWith(0x12B6, 25 + 255 * 12, {{15, 1, 255}}));
    EXPECT_EQ(parser.lines(), LogLines());
}

struct Energy {
    const char* name;
    std::uint16_t energy;
    const char* text;
};

class EnergyTest : public testing::TestWithParam<Energy> {};

TEST_P(EnergyTest, IsShownInDecibels) {
    ParserHarness parser;
    parser.update(recordWith(0x12B6, 37, {{15, 1, 1}, {25, 2, 7}, {27, 2, GetParam().energy}}));
    EXPECT_EQ(parser.display(),
              std::string("{kActiveSetPilots {_sorted '_sorted', 0;7 '") + GetParam().text + "'}}");
    parser.update(recordWith(0x108A, 37, {{22, 1, 1}, {23, 2, 7}, {29, 2, GetParam().energy}}));
    EXPECT_NE(parser.display().find(std::string("kFingerC2I {_sorted '_sorted', 0;7 '") + GetParam().text),
              std::string::npos);
}

INSTANTIATE_TEST_SUITE_P(, EnergyTest,
                         testing::Values(Energy{"Zero", 0, "-inf dB"},
                                         Energy{"Smallest", 1, "-27.09 dB"},     // 10 log (1/512) = -27.0927
                                         Energy{"Double", 1024, "+3.01 dB"},     // 10 log 2 = 3.0103
                                         Energy{"Largest", 65535, "+21.07 dB"}), // 10 log 127.998 = 21.0720
                         [](const auto& test) { return std::string(test.param.name); });

Data fingers() {
    return record(0x108A, "00 00 00 00 00 00 00 00 00"                  // 13
                          "03"                                          // 22 fingers
                          "64 00 00 00 00 00 00 04 00 00 00 00 00 00"   // 23 PN 100, 1024/512: +3.0103
                          "FF FF 00 00 00 00 00 02 00 00 00 00 00 00"   // 37 unassigned
                          "0E 01 00 00 00 00 00 00 00 00 00 00 00 00"); // 51 PN 270, 0
}

TEST(FingerC2ITest, ListsAssignedFingersUnderTheirPlaceInTheRecord) {
    ParserHarness parser;
    parser.update(fingers());
    EXPECT_EQ(parser.display(), "{kFingerC2I {_sorted '_sorted', 0;100 '+3.01 dB', 2;270 '-inf dB'}}");
    EXPECT_EQ(parser.lines(), LogLines());
}

TEST(FingerC2ITest, SaysNoneWithoutAnyOrWithoutAnyAssigned) {
    ParserHarness parser;
    parser.update(recordWith(0x108A, 23));
    EXPECT_EQ(parser.display(), "{kFingerC2I '(none)'}");
    parser.update(fingers());
    parser.update(recordWith(0x108A, 51, {{22, 1, 2}, {23, 2, 0xFFFF}, {37, 2, 0xFFFF}}));
    EXPECT_EQ(parser.display(), "{kFingerC2I '(none)'}");
}

TEST(FingerC2ITest, EveryPrefixAndWhatIsTooLong) {
    const Data longer = joined(fingers(), hex("00 00"));
    for (std::size_t length = 13; length <= longer.size(); ++length) {
        ParserHarness parser;
        parser.update(prefixOf(longer, length));
        const std::string number = std::to_string(length);
        if (length < 23)
            EXPECT_EQ(parser.lines(),
                      error("Log code 0x108a is " + number + " bytes long but must be at least 23 bytes."));
        else if (length != 65) // 23 + 3 * 14
            EXPECT_EQ(parser.lines(), error("Log code 0x108a has bad length of " + number +
                                            " bytes, but has 3 substructs (size=23)."));
        else
            EXPECT_EQ(parser.lines(), LogLines());
        EXPECT_EQ(parser.display() == "{}", length != 65);
    }
}

} // namespace
} // namespace velmora
