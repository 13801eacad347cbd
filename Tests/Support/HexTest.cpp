// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Support/Hex.h"

#include "PropertyLists/PropertyList.h"

#include <gtest/gtest.h>

#include <stdexcept>
#include <string>
#include <vector>

namespace velmora {
namespace {

Data bytes(std::vector<std::uint8_t> values) {
    return Data(std::move(values));
}

TEST(Hex, TakesDigitsOfBothCasesAndLeavesOutSpaceAndComments) {
    EXPECT_EQ(hex("00 fF\n\t7a // the rest is 55 and not read\n01# 02\r\n03"),
              bytes({0x00, 0xFF, 0x7A, 0x01, 0x03}));
    EXPECT_EQ(hex(""), Data());
    EXPECT_EQ(hex("# only a comment"), Data());
}

TEST(Hex, RefusesWhatIsNoByte) {
    for (const char* text : {"0", "00 1", "0 0", "0g", "x", "/00", "00,01"})
        EXPECT_THROW((void)hex(text), std::invalid_argument) << text;
    try {
        (void)hex("00 1z");
        FAIL();
    } catch (const std::invalid_argument& error) {
        EXPECT_STREQ(error.what(), "offset 3 of the hexadecimal text holds \"1z\", not two digits");
    }
}

TEST(Record, HasLengthCodeAndEightZeroBytesBeforeThePayload) {
    EXPECT_EQ(record(0xB0C1, "AA BB CC"), hex(R"(
        01                       // type
        0F 00                    // length less the type's byte: 12 + 3
        C1 B0                    // log code
        00 00 00 00 00 00 00 00
        AA BB CC                 // payload
    )"));
    EXPECT_EQ(record(0x0001, "", 0xFF), hex("FF 0C00 0100 0000000000000000"));
}

TEST(Record, RefusesALengthBeyond16Bits) {
    EXPECT_EQ(recordOf(1, std::vector<std::uint8_t>(65523)).size(), 65536U);
    EXPECT_THROW((void)recordOf(1, std::vector<std::uint8_t>(65524)), std::invalid_argument);
}

TEST(ExtraRecord, CarriesAPropertyList) {
    const auto list = makeDictionary();
    list->set("ICCID", "8949");
    const Data data = extraRecord(1, list);
    EXPECT_EQ(data.bytes()[0], 0xFF);
    EXPECT_EQ(data.bytes()[1] + 256U * data.bytes()[2], data.size() - 1);
    EXPECT_EQ(data.bytes()[3], 0x01);
    EXPECT_EQ(data.bytes()[4], 0x00);
    const auto read = readPropertyList(data.from(13).bytes());
    ASSERT_TRUE(read) << read.reason();
    EXPECT_EQ(*read, Value(list));
    EXPECT_THROW((void)extraRecord(1, Value()), std::invalid_argument);
}

TEST(Joined, PutsThePartsInOrder) {
    EXPECT_EQ(joined(hex("01"), hex("0203"), Data(), hex("04")), hex("01020304"));
    EXPECT_EQ(joined({hex("01"), hex("02")}), hex("0102"));
    EXPECT_EQ(joined(hex("05")), hex("05"));
}

} // namespace
} // namespace velmora
