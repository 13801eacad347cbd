// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/C2K/ParserHarness.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

Data goodRecord() {
    return recordWith(0x134F, 186,
                      {
                          {13, 1, 2},       // version
                          {42, 4, 5},       // roaming indicator
                          {46, 4, 2},       // system type
                          {50, 2, 4139},    // SID
                          {52, 2, 65},      // NID
                          {131, 1, 7},      // packet zone
                          {133, 1, 6},      // protocol revision
                          {184, 2, 0x1234}, // base station: 4660
                      });
}

TEST(SystemIdentificationTest, ShowsEveryFieldInOrder) {
    ParserHarness parser;
    parser.update(goodRecord());
    EXPECT_EQ(parser.display(), "{k1xRoamingHome 'Preferred system [5]', kSystemId '4139', kNetworkId '65', "
                                "kPacketZoneId '7', kBaseId '4660', kProtocolRevision '6'}");
    EXPECT_EQ(parser.lines(), LogLines());
}

TEST(SystemIdentificationTest, LargestValues) {
    ParserHarness parser;
    parser.update(withFields(
        goodRecord(),
        {{13, 1, 255}, {50, 2, 65535}, {52, 2, 65535}, {131, 1, 255}, {133, 1, 255}, {184, 2, 65535}}));
    EXPECT_EQ(parser.display(), "{k1xRoamingHome 'Preferred system [5]', kSystemId '65535', "
                                "kNetworkId '65535', kPacketZoneId '255', kBaseId '65535', "
                                "kProtocolRevision '255'}");
}

TEST(SystemIdentificationTest, EveryPrefix) {
    for (std::size_t length = 13; length <= 186; ++length) {
        SCOPED_TRACE(length);
        ParserHarness parser;
        parser.show("kBaseId", "earlier");
        parser.update(prefixOf(goodRecord(), length));
        const std::string number = std::to_string(length);
        if (length < 171) {
            EXPECT_EQ(parser.display(), "{kBaseId 'earlier'}");
            EXPECT_EQ(parser.lines(),
                      error("Log code 0x134f is " + number + " bytes long but must be at least 171 bytes."));
        } else {
            // Long enough by the parser's own test, but the base station id lies at 184 and 185.
            EXPECT_EQ(parser.text("kBaseId"), length < 186 ? "earlier" : "4660");
            EXPECT_EQ(parser.text("k1xRoamingHome"), "Preferred system [5]");
            EXPECT_EQ(parser.text("kSystemId"), "4139");
            EXPECT_EQ(parser.text("kNetworkId"), "65");
            EXPECT_EQ(parser.text("kPacketZoneId"), "7");
            EXPECT_EQ(parser.text("kProtocolRevision"), "6");
            EXPECT_EQ(parser.lines(),
                      length < 186
                          ? error("Log code 0x134f is " + number +
                                  " bytes long but must be at least 186 bytes for the base station id.")
                          : LogLines());
        }
    }
}

TEST(SystemIdentificationTest, OldVersionIsDropped) {
    for (const std::uint8_t version : {std::uint8_t{0}, std::uint8_t{1}}) {
        ParserHarness parser;
        parser.update(withByte(goodRecord(), 13, version));
        EXPECT_EQ(parser.display(), "{}");
        EXPECT_EQ(parser.lines(), error("Log code 0x134f has version=" + std::to_string(version) +
                                        "; only version 2 or higher expected; dropping."));
    }
}

TEST(SystemIdentificationTest, RoamingIndicators) {
    expectEnumeration(goodRecord(), 42, "k1xRoamingHome",
                      {{0, "OFF [0]"},
                       {1, "ON [1]"},
                       {2, "Flashing [2]"},
                       {3, "Out of Neighborhood [3]"},
                       {4, "Out of Building [4]"},
                       {5, "Preferred system [5]"},
                       {6, "Available system [6]"},
                       {7, "Alliance partner [7]"},
                       {8, "Premium partner [8]"},
                       {9, "Full service functionality [9]"},
                       {10, "Partial service functionality [10]"},
                       {11, "Banner ON [11]"},
                       {12, "Banner OFF [12]"}},
                      "ERI - ", "");
}

TEST(SystemIdentificationTest, RoamingIndicatorIsFourBytesShownSigned) {
    ParserHarness parser;
    parser.update(withFields(goodRecord(), {{42, 4, 0x10005}}));
    EXPECT_EQ(parser.text("k1xRoamingHome"), "ERI - 65541");
    parser.update(withFields(goodRecord(), {{42, 4, 0xFFFFFFFF}}));
    EXPECT_EQ(parser.text("k1xRoamingHome"), "ERI - -1");
}

TEST(SystemIdentificationTest, IdentitiesOfAnotherSystemTypeAreUnknown) {
    struct Type {
        std::uint32_t type;
        const char* text;
    };
    for (const Type& each :
         {Type{0, "(unknown system type 0)"}, Type{3, "(unknown system type 3)"},
          Type{0x10002, "(unknown system type 65538)"}, Type{0xFFFFFFFF, "(unknown system type -1)"}}) {
        ParserHarness parser;
        parser.update(withFields(goodRecord(), {{46, 4, each.type}}));
        EXPECT_EQ(parser.text("kSystemId"), each.text);
        EXPECT_EQ(parser.text("kNetworkId"), each.text);
        EXPECT_EQ(parser.text("kBaseId"), "4660");
    }
}

} // namespace
} // namespace velmora
