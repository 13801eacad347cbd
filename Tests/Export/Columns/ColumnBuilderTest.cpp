// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/Parquet/ColumnBuilder.h"

#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

std::vector<std::uint8_t> bytes(const char* digits) {
    const Data data = hex(digits);
    return {data.bytes().begin(), data.bytes().end()};
}

TableColumn column(StoredType type, bool isNullable = true) {
    return {{"x", type, type == StoredType::Text ? ValueMeaning::Text : ValueMeaning::Plain, isNullable},
            false};
}

TEST(ColumnBuilder, refersToADictionaryForNumbers) {
    ColumnBuilder builder(column(StoredType::Number));
    builder.setNumber(0, 1.5);
    builder.setNumber(2, 1.5);
    const EncodedChunk chunk = builder.finish(3);
    EXPECT_EQ(chunk.dictionary, bytes("00 00 00 00 00 00 F8 3F"));
    EXPECT_EQ(chunk.dictionaryValues, 1U);
    EXPECT_EQ(chunk.encoding, PageEncoding::DictionaryIndex);
    EXPECT_EQ(chunk.data, bytes("02 00 00 00" // the length of the levels
                                "03 05"       // a value, none, a value
                                "01"          // indices of one bit
                                "03 00"));    // twice the first
    EXPECT_EQ(chunk.statistics.nulls, 1U);
}

TEST(ColumnBuilder, hasNoLevelsWithoutNulls) {
    ColumnBuilder builder(column(StoredType::Number, false));
    builder.setNumber(0, 1.5);
    EXPECT_EQ(builder.finish(1).data, bytes("01 03 00"));
}

TEST(ColumnBuilder, storesNumbersThatRarelyRepeatAsTheyAre) {
    ColumnBuilder builder(column(StoredType::Number, false));
    for (const double number : {1.0, 2.0, 3.0})
        builder.setNumber(static_cast<std::uint32_t>(number) - 1, number);
    const EncodedChunk chunk = builder.finish(3);
    EXPECT_EQ(chunk.dictionaryValues, 0U);
    EXPECT_EQ(chunk.encoding, PageEncoding::Plain);
    EXPECT_EQ(chunk.data, bytes("00 00 00 00 00 00 F0 3F 00 00 00 00 00 00 00 40 00 00 00 00 00 00 08 40"));
}

TEST(ColumnBuilder, storesFlagsAsBits) {
    ColumnBuilder builder(column(StoredType::Boolean, false));
    for (std::uint32_t row = 0; row < 9; ++row)
        builder.setFlag(row, row % 3 == 0);
    EXPECT_EQ(builder.finish(9).data, bytes("49 00"));
}

TEST(ColumnBuilder, storesTextsWithTheirLengths) {
    ColumnBuilder builder(column(StoredType::Text, false));
    builder.setText(0, "ab");
    builder.setText(1, "");
    builder.setText(2, "ab");
    const EncodedChunk chunk = builder.finish(3);
    EXPECT_EQ(chunk.dictionary, bytes("02 00 00 00 61 62 00 00 00 00"));
    EXPECT_EQ(chunk.data, bytes("01 03 02")); // the first, the second, the first
    EXPECT_EQ(chunk.statistics.range, std::pair(std::string(), std::string("ab")));
}

TEST(ColumnBuilder, storesTextsAsTheyAreOnceTheDictionaryIsFull) {
    ColumnBuilder builder(column(StoredType::Text, false));
    const std::string longText(TextDictionary::mostBytes, 'x');
    builder.setText(0, "a");
    builder.setText(1, longText);
    builder.setText(2, "a");
    const EncodedChunk chunk = builder.finish(3);
    EXPECT_EQ(chunk.dictionaryValues, 0U);
    EXPECT_EQ(chunk.encoding, PageEncoding::Plain);
    ASSERT_EQ(chunk.data.size(), 5 + 4 + longText.size() + 5);
    EXPECT_TRUE(std::equal(chunk.data.end() - 5, chunk.data.end(), bytes("01 00 00 00 61").begin()));
}

TEST(ColumnBuilder, storesNumbersAsTheyAreOnceTheDictionaryIsFull) {
    ColumnBuilder builder(column(StoredType::Integer, false));
    std::uint32_t row = 0;
    for (std::size_t i = 0; i <= WordDictionary::mostValues; ++i)
        for (int times = 0; times < 3; ++times)
            builder.setInteger(row++, static_cast<std::int64_t>(i));
    const EncodedChunk chunk = builder.finish(row);
    EXPECT_EQ(chunk.encoding, PageEncoding::Plain);
    ASSERT_EQ(chunk.data.size(), row * sizeof(std::int64_t));
    EXPECT_EQ(chunk.data[chunk.data.size() - 8], 0x00); // 16384 is 0x4000
    EXPECT_EQ(chunk.data[chunk.data.size() - 7], 0x40);
}

TEST(ColumnBuilder, givesWideIndicesWholeBytes) {
    ColumnBuilder builder(column(StoredType::Integer, false));
    std::uint32_t row = 0;
    for (int times = 0; times < 2; ++times)
        for (std::int64_t i = 0; i < 17; ++i)
            builder.setInteger(row++, i);
    EXPECT_EQ(builder.finish(row).data.front(), 8);
}

TEST(ColumnBuilder, isNullInRowsAfterTheLastValue) {
    ColumnBuilder builder(column(StoredType::Boolean));
    builder.setFlag(0, true);
    EXPECT_TRUE(builder.hasRow(0));
    EXPECT_FALSE(builder.hasRow(1));
    const EncodedChunk chunk = builder.finish(10);
    EXPECT_EQ(chunk.statistics.nulls, 9U);
    EXPECT_EQ(chunk.data, bytes("03 00 00 00" // the length of the levels
                                "05 01 00"    // a value, nine nulls
                                "01"));
}

TEST(ColumnBuilder, isEmptyAfterwards) {
    ColumnBuilder builder(column(StoredType::Text));
    builder.setText(0, "a");
    static_cast<void>(builder.finish(1));
    builder.setText(0, "b");
    EXPECT_EQ(builder.finish(1).dictionary, bytes("01 00 00 00 62"));
}

TEST(ColumnBuilder, hasNoRangeOfBytesThatAreNoText) {
    ColumnBuilder builder({{"x", StoredType::Text, ValueMeaning::Plain, true}, false});
    builder.setText(0, "\xFF");
    EXPECT_EQ(builder.finish(1).statistics.range, std::nullopt);
}

TEST(ColumnBuilder, repeatsATextInAllRows) {
    ColumnBuilder builder(column(StoredType::Text, false));
    builder.setAllTexts(20, "a");
    EXPECT_EQ(builder.finish(20).data, bytes("01 28 00"));
}

} // namespace
} // namespace velmora
