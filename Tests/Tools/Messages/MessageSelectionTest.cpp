// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Messages/MessageSelection.h"

#include "Tests/Support/Hex.h"
#include "Tools/Messages/LogCodeText.h"

#include <gmock/gmock.h>

#include <chrono>

namespace velmora {
namespace {

LoggedMessage messageAt(int seconds, Data message = {}) {
    return {Time(std::chrono::seconds(seconds)), std::move(message)};
}

TEST(MessageSelectionTest, BoundsCountFromTheFirstMessageWhetherOrNotItIsSelected) {
    MessageFilter filter({{TimeBound{std::chrono::seconds(2), true}, std::nullopt}, false, {}});
    EXPECT_FALSE(filter.passes(messageAt(100)));
    EXPECT_FALSE(filter.passes(messageAt(101)));
    EXPECT_TRUE(filter.passes(messageAt(102)));
    EXPECT_FALSE(filter.passes(messageAt(99)));
}

TEST(MessageSelectionTest, CodesAreThoseOfTheRecordAndItsStream) {
    MessageFilter filter({{}, false, {0x512C, 0xFF0001}});
    EXPECT_TRUE(filter.passes(messageAt(0, record(0x512C, "00"))));
    EXPECT_TRUE(filter.passes(messageAt(0, joined(hex("81 00"), record(0x512C, "00")))));
    EXPECT_TRUE(filter.passes(messageAt(0, record(0x0001, "", 0xFF))));
    EXPECT_FALSE(filter.passes(messageAt(0, record(0x0001, ""))));
    EXPECT_FALSE(filter.passes(messageAt(0, record(0x512C, "", 0xFF))));
    EXPECT_FALSE(filter.passes(messageAt(0, record(0x512C, "", 2)))) << "of neither stream";
    EXPECT_FALSE(filter.passes(messageAt(0, hex("01 0C 00 2C 51")))) << "shorter than a header";
}

TEST(MessageSelectionTest, WithoutCodesMessagesOfAnyKindPass) {
    MessageFilter filter({});
    EXPECT_TRUE(filter.passes(messageAt(5)));
    EXPECT_TRUE(filter.passes(messageAt(-5, hex("01"))));
}

TEST(LogCodeTextTest, IsHexadecimalOrDecimal) {
    EXPECT_EQ(*readLogCode("0x512C"), 0x512Cu);
    EXPECT_EQ(*readLogCode("0X512c"), 0x512Cu);
    EXPECT_EQ(*readLogCode("20780"), 0x512Cu);
    EXPECT_EQ(*readLogCode("0"), 0u);
    EXPECT_EQ(*readLogCode("0xFFFF"), 0xFFFFu);
    EXPECT_EQ(*readLogCode("0xFF0000"), 0xFF0000u);
    EXPECT_EQ(*readLogCode("16777215"), 0xFFFFFFu);
}

TEST(LogCodeTextTest, AnythingElseIsRefused) {
    for (const char* text : {"", "0x", "512C", "-1", "+1", " 1", "1 ", "0x10000", "0xFEFFFF", "0x1000000",
                             "4294967296", "0x1FFFFFFFF"}) {
        const Result<std::uint32_t> code = readLogCode(text);
        ASSERT_FALSE(code) << text;
        EXPECT_EQ(code.reason(),
                  std::string("got ") + text + ", wanted a log code such as 0x512C or 0xFF0000");
    }
}

} // namespace
} // namespace velmora
