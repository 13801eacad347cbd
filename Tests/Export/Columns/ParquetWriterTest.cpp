// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/Parquet/ParquetWriter.h"

#include "Tests/Export/Columns/MemorySink.h"

#include <gtest/gtest.h>

#include <string_view>

namespace velmora {
namespace {

const std::vector<TableColumn> oneFlag = {{{"x", StoredType::Boolean, ValueMeaning::Plain, false}, false}};

class ParquetWriterTest : public testing::Test {
protected:
    MemorySink _sink;
    PageCompressor _compressor;
};

std::string_view textOf(const std::vector<std::uint8_t>& bytes, std::size_t offset, std::size_t count) {
    return {reinterpret_cast<const char*>(bytes.data()) + offset, count};
}

TEST_F(ParquetWriterTest, beginsAndEndsWithTheFormatsName) {
    ParquetWriter writer(oneFlag, {}, _sink, _compressor);
    writer.column(0).setFlag(writer.addRow(), true);
    ASSERT_TRUE(writer.finish());
    EXPECT_EQ(textOf(_sink.content, 0, 4), "PAR1");
    EXPECT_EQ(textOf(_sink.content, _sink.content.size() - 4, 4), "PAR1");
}

TEST_F(ParquetWriterTest, writesATableWithoutRows) {
    ParquetWriter writer(oneFlag, {{"key", "value"}}, _sink, _compressor);
    ASSERT_TRUE(writer.finish());
    EXPECT_EQ(_sink.metadataOffset(), 4U);
    const Result<FileMetadata> metadata = _sink.metadata();
    ASSERT_TRUE(metadata) << metadata.reason();
    EXPECT_EQ(metadata->columns, (std::vector<ColumnSchema>{oneFlag[0].schema}));
    EXPECT_EQ(metadata->properties, (std::vector<std::pair<std::string, std::string>>{{"key", "value"}}));
    EXPECT_TRUE(metadata->groups.empty());
}

TEST_F(ParquetWriterTest, saysWhereTheColumnsOfARowGroupAre) {
    ParquetWriter writer({{{"a", StoredType::Number, ValueMeaning::Plain, true}, false},
                          {{"b", StoredType::Integer, ValueMeaning::Timestamp, false}, true}},
                         {}, _sink, _compressor);
    for (int i = 0; i < 4; ++i) {
        const std::uint32_t row = writer.addRow();
        writer.column(0).setNumber(row, 1);
        writer.column(1).setInteger(row, i);
    }
    EXPECT_EQ(writer.rows(), 4U);
    ASSERT_TRUE(writer.finish());
    const Result<FileMetadata> metadata = _sink.metadata();
    ASSERT_TRUE(metadata) << metadata.reason();
    ASSERT_EQ(metadata->groups.size(), 1U);
    const std::vector<ChunkMetadata>& chunks = metadata->groups[0].chunks;
    ASSERT_EQ(chunks.size(), 2U);
    EXPECT_EQ(metadata->groups[0].rows, 4U);
    EXPECT_EQ(chunks[0].dictionaryOffset, 4U);
    EXPECT_GT(chunks[0].dataOffset, 4U);
    EXPECT_EQ(chunks[1].dictionaryOffset, std::nullopt);
    EXPECT_EQ(chunks[1].dataOffset, 4 + chunks[0].size);
    EXPECT_EQ(chunks[1].dataOffset + chunks[1].size, _sink.metadataOffset());
    EXPECT_EQ(chunks[1].values, 4U);
    EXPECT_EQ(chunks[1].statistics.range,
              std::pair(std::string(8, '\0'), std::string("\x03\0\0\0\0\0\0\0", 8)));
}

TEST_F(ParquetWriterTest, writesARowGroupAtEachCut) {
    ParquetWriter writer(oneFlag, {}, _sink, _compressor);
    for (int group = 0; group < 2; ++group) {
        writer.column(0).setFlag(writer.addRow(), true);
        ASSERT_TRUE(writer.cut());
    }
    ASSERT_TRUE(writer.cut()); // nothing is kept
    EXPECT_EQ(writer.rows(), 2U);
    ASSERT_TRUE(writer.finish());
    EXPECT_EQ(_sink.metadata()->groups.size(), 2U);
}

TEST_F(ParquetWriterTest, reportsWhyWritingFailed) {
    for (std::size_t limit : {0U, 4U, 20U, 60U}) {
        MemorySink sink(limit);
        ParquetWriter writer(oneFlag, {}, sink, _compressor);
        writer.column(0).setFlag(writer.addRow(), true);
        const Result<Done> finished = writer.finish();
        ASSERT_FALSE(finished) << limit;
        EXPECT_EQ(finished.reason(), "no space left");
    }
}

TEST_F(ParquetWriterTest, takesAsManyRowsAGroupAsReadersExpect) {
    ParquetWriter writer(oneFlag, {}, _sink, _compressor);
    for (std::uint32_t i = 0; i < 131072; ++i) {
        ASSERT_FALSE(writer.isFull());
        static_cast<void>(writer.addRow());
    }
    EXPECT_TRUE(writer.isFull());
}

} // namespace
} // namespace velmora
