// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogMessages/LogMessage.h"

#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

TEST(LogMessage, readsTheFieldsOfABasebandRecord) {
    const Data message = hex(R"(01                      # type
                                0D 00                   # length
                                E0 D0                   # code
                                08 07 06 05 04 03 02 01 # time stamp
                                AA                      # payload)");
    const auto parsed = LogMessage::parse(message.bytes());
    ASSERT_TRUE(parsed);
    EXPECT_FALSE(parsed->prefixed);
    EXPECT_EQ(parsed->type, 1);
    EXPECT_EQ(parsed->length(), 13);
    EXPECT_EQ(parsed->code, 0xD0E0);
    EXPECT_EQ(parsed->logCode(), 0xD0E0U);
    EXPECT_EQ(parsed->timestamp(), 0x0102030405060708U);
    EXPECT_EQ(parsed->record.size(), 14U);
    ASSERT_EQ(parsed->payload().size(), 1U);
    EXPECT_EQ(parsed->payload()[0], 0xAA);
}

TEST(LogMessage, readsPastAPrefixOfTwoBytes) {
    const Data message = hex("81 7F  FF 0C00 0200 0100000000000000");
    const auto parsed = LogMessage::parse(message.bytes());
    ASSERT_TRUE(parsed);
    EXPECT_TRUE(parsed->prefixed);
    EXPECT_EQ(parsed->type, 0xFF);
    EXPECT_EQ(parsed->code, 2);
    EXPECT_EQ(parsed->logCode(), 0xFF0002U);
    EXPECT_EQ(parsed->timestamp(), 1U);
    EXPECT_EQ(parsed->record.size(), 13U);
    EXPECT_EQ(parsed->record.data(), message.bytes().data() + 2);
}

TEST(LogMessage, keepsATypeThatNoDecoderTakes) {
    const auto parsed = LogMessage::parse(hex("02 0C00 3412 0000000000000000").bytes());
    ASSERT_TRUE(parsed);
    EXPECT_EQ(parsed->type, 2);
    EXPECT_EQ(parsed->logCode(), 0x1234U);
}

TEST(LogMessage, hasNoneBelow13BytesAsTheyArrived) {
    EXPECT_FALSE(LogMessage::parse({}));
    EXPECT_FALSE(LogMessage::parse(hex("01 0B00 3412 00000000000000").bytes()));
    EXPECT_FALSE(LogMessage::parse(hex("81 00 01 0900 3412 0000000000").bytes()));
}

TEST(LogMessage, ofAPrefixedMessageOf13BytesHasNoWholeTimestampAndNoPayload) {
    const Data message = hex("81 00 01 0A00 3412 000000000000");
    const auto parsed = LogMessage::parse(message.bytes());
    ASSERT_TRUE(parsed);
    EXPECT_EQ(parsed->code, 0x1234);
    EXPECT_EQ(parsed->record.size(), 11U);
    EXPECT_EQ(parsed->length(), 10);
    EXPECT_EQ(parsed->timestamp(), std::nullopt);
    EXPECT_TRUE(parsed->payload().empty());
}

Data headerOf(std::uint8_t type, std::uint16_t code, std::size_t payloadLength, std::uint64_t timestamp) {
    return Data::copyOf(LogMessage::header(type, code, payloadLength, timestamp));
}

TEST(LogMessage, writesAHeader) {
    EXPECT_EQ(headerOf(0xFF, 0xD0E0, 1, 0x0102030405060708), hex(R"(FF                      # type
                                                                    0D 00                   # length
                                                                    E0 D0                   # code
                                                                    08 07 06 05 04 03 02 01 # time stamp)"));
}

TEST(LogMessage, writesTheLargestLengthForAPayloadThatIsTooLong) {
    EXPECT_EQ(headerOf(1, 0x1234, 65'523, 0), hex("01 FFFF 3412 0000000000000000"));
    EXPECT_EQ(headerOf(1, 0x1234, 65'522, 0), hex("01 FEFF 3412 0000000000000000"));
    EXPECT_EQ(headerOf(1, 0x1234, 65'536, 0), hex("01 FFFF 3412 0000000000000000"));
}

} // namespace
} // namespace velmora
