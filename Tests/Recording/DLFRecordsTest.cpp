// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Recording/LogFile.h"

#include <string>
#include <vector>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using testing::ElementsAreArray;
using testing::IsEmpty;

// 2026-11-16 05:00:00 UTC as a record's time stamp, and 1.25 ms later.
#define FIVE "000040329B741301"
#define LATER "000041329B741301"

struct Case {
    const char* name;
    const char* records;               ///< after the version report
    std::vector<std::string> messages; ///< less number, place and time
};

const Case cases[] = {
    {"OfARecord",
     R"(1000 2C51 )" FIVE R"( 04000100)", // length, code, time stamp, payload
     {"0110002C51" FIVE "04000100"}},
    {"OfABufferOfSeveral",
     R"(1000 2C51 )" FIVE R"( 04000100       // the first: no type byte
        01 0F00 3271 )" LATER R"( 010000     // the others keep theirs
        01 1000 2C51 )" LATER R"( 05000100)",
     {"0110002C51" FIVE "04000100", "010F003271" LATER "010000", "0110002C51" LATER "05000100"}},
    {"OfTwoBuffers",
     R"(1000 2C51 )" FIVE R"( 04000100
        01 0F00 3271 )" FIVE R"( 010000
        1000 2C51 )" LATER R"( 05000100
        01 0F00 3271 )" LATER R"( 020000)",
     {"0110002C51" FIVE "04000100", "010F003271" FIVE "010000", "0110002C51" LATER "05000100",
      "010F003271" LATER "020000"}},
    {"PrefixedInABuffer",
     R"(1000 2C51 )" FIVE R"( 04000100
        8171 01 0F00 3271 )" FIVE R"( 010000
        81FF FF 0E00 0200 )" LATER R"( 3C3E)",
     {"0110002C51" FIVE "04000100", "8171010F003271" FIVE "010000", "81FFFF0E000200" LATER "3C3E"}},
    {"PrefixedFirstOfABuffer",
     R"(71 01 0F00 3271 )" FIVE R"( 010000   // its 0x81 is gone
        01 1000 2C51 )" FIVE R"( 04000100
        01 01 0F00 3271 )" LATER R"( 010000)", // a prefix 0x81 0x01, of another buffer
     {"8171010F003271" FIVE "010000", "0110002C51" FIVE "04000100", "8101010F003271" LATER "010000"}},
    {"OfTheExtraStream",
     R"(0E00 0000 )" FIVE R"( 3C3E            // codes 0 to 2 without type byte
        1000 0100 )" FIVE R"( 62706C69
        0C00 0200 )" LATER R"(
        FF 0D00 0200 )" LATER R"( 3C)",
     {"FF0E000000" FIVE "3C3E", "FF10000100" FIVE "62706C69", "FF0C000200" LATER, "FF0D000200" LATER "3C"}},
    {"OfTheBasebandWithAnExtraCode", // recognised only by its type byte
     R"(01 0D00 0100 )" FIVE R"( AA
        01 0F00 3271 )" FIVE R"( 010000)",
     {"010D000100" FIVE "AA", "010F003271" FIVE "010000"}},
    {"OfAWrongType",
     R"(1000 2C51 )" FIVE R"( 04000100
        02 0F00 3271 )" FIVE R"( 010000
        01 1000 2C51 )" LATER R"( 05000100)",
     {"0110002C51" FIVE "04000100", "020F003271" FIVE "010000", "0110002C51" LATER "05000100"}},
    {"OfUnknownCodes",
     R"(0F00 7513 )" FIVE R"( 010000
        0D00 7613 )" FIVE R"( AA
        01 0D00 7713 )" LATER R"( BB)",
     {"010F007513" FIVE "010000", "010D007613" FIVE "AA", "010D007713" LATER "BB"}},
    {"OfADayLater", // and a minute: 69,168,000 units of 1.25 ms
     R"(0F00 7513 )" FIVE R"( 010000
        0F00 7513 )" LATER R"( 020000
        0D00 7613 0000C09DBA781301 AA
        0D00 7713 0000C19DBA781301 BB)",
     {"010F007513" FIVE "010000", "010F007513" LATER "020000", "010D0076130000C09DBA781301AA",
      "010D0077130000C19DBA781301BB"}},
    {"WithoutTimes",
     R"(1000 2C51 0000000000000000 04000100
        01 0F00 3271 0000000000000000 010000
        0D00 7513 0000000000000000 AA)",
     {"0110002C51000000000000000004000100", "010F0032710000000000000000010000",
      "010D0075130000000000000000AA"}},
    {"WithTimesThatAreNone", // the lower 16 bits only go up to 0xBFFF
     R"(1000 2C51 00C040329B741301 04000100
        0F00 3271 00C040329B741301 010000)",
     {"0110002C5100C040329B74130104000100", "010F00327100C040329B741301010000"}},
};

std::vector<std::string> texts(const std::vector<std::string>& messages) {
    std::vector<std::string> parts;
    for (const std::string& message : messages)
        parts.push_back(message.substr(message.find(": ") + 2));
    return parts;
}

class DLFRecords : public testing::TestWithParam<Case> {};

TEST_P(DLFRecords, comeAsTheyArrived) {
    const ReadOut out = readAnyForm(joined(versionReport(), hex(GetParam().records)));
    EXPECT_THAT(texts(out.messages), ElementsAreArray(GetParam().messages));
    EXPECT_THAT(out.losses, IsEmpty());
    EXPECT_EQ(out.failure, "");
}

TEST_P(DLFRecords, areTheSameForAnyReadSize) {
    const Data file = joined(versionReport(), hex(GetParam().records));
    const ReadOut whole = readAnyForm(file);
    for (const std::size_t piece : {1U, 2U, 3U, 7U, 13U})
        EXPECT_EQ(readAnyForm(file, piece).messages, whole.messages) << piece;
}

INSTANTIATE_TEST_SUITE_P(, DLFRecords, testing::ValuesIn(cases),
                         [](const auto& each) { return std::string(each.param.name); });

} // namespace
} // namespace velmora
