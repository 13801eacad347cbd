// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogMessages/RecordHeader.h"

#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

TEST(RecordHeader, readsTheFieldsOfABasebandRecord) {
    const Data message = hex(R"(01                      # type
                                0D 00                   # length
                                E0 D0                   # code
                                08 07 06 05 04 03 02 01 # time stamp
                                AA                      # payload)");
    const auto header = recordHeader(message.bytes());
    ASSERT_TRUE(header);
    EXPECT_FALSE(header->prefixed);
    EXPECT_EQ(header->type, 1);
    EXPECT_EQ(header->length, 13);
    EXPECT_EQ(header->code, 0xD0E0);
    EXPECT_EQ(header->logCode(), 0xD0E0U);
    EXPECT_EQ(header->timestamp, 0x0102030405060708U);
    EXPECT_EQ(header->record.size(), 14U);
}

TEST(RecordHeader, readsPastAPrefixOfTwoBytes) {
    const Data message = hex("81 7F  FF 0C00 0200 0100000000000000");
    const auto header = recordHeader(message.bytes());
    ASSERT_TRUE(header);
    EXPECT_TRUE(header->prefixed);
    EXPECT_EQ(header->type, 0xFF);
    EXPECT_EQ(header->code, 2);
    EXPECT_EQ(header->logCode(), 0xFF0002U);
    EXPECT_EQ(header->timestamp, 1U);
    EXPECT_EQ(header->record.size(), 13U);
    EXPECT_EQ(header->record.data(), message.bytes().data() + 2);
}

TEST(RecordHeader, keepsATypeThatNoDecoderTakes) {
    const auto header = recordHeader(hex("02 0C00 3412 0000000000000000").bytes());
    ASSERT_TRUE(header);
    EXPECT_EQ(header->type, 2);
    EXPECT_EQ(header->logCode(), 0x1234U);
}

TEST(RecordHeader, hasNoneBelow13BytesAsTheyArrived) {
    EXPECT_FALSE(recordHeader({}));
    EXPECT_FALSE(recordHeader(hex("01 0B00 3412 00000000000000").bytes()));
    EXPECT_FALSE(recordHeader(hex("81 00 01 0900 3412 0000000000").bytes()));
}

TEST(RecordHeader, ofAPrefixedMessageOf13BytesHasNoWholeTimestamp) {
    const auto header = recordHeader(hex("81 00 01 0A00 3412 000000000000").bytes());
    ASSERT_TRUE(header);
    EXPECT_EQ(header->code, 0x1234);
    EXPECT_EQ(header->record.size(), 11U);
    EXPECT_EQ(header->timestamp, std::nullopt);
}

} // namespace
} // namespace velmora
