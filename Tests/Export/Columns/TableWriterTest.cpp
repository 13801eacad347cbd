// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/TableWriter.h"

#include "Tests/Export/Columns/MemorySink.h"

#include <gtest/gtest.h>

#include <array>

namespace velmora {
namespace {

class TableWriterTest : public testing::Test {
protected:
    MemorySink _sink;
    PageCompressor _compressor;
    TableLayout _layout = listTable("cells", "Ostrel_GSM", 1);
};

TEST_F(TableWriterTest, writesNoRowGroupOfMoreThan131072Rows) {
    TableWriter table(_layout, "f00", _sink, _compressor);
    for (std::uint64_t i = 1; i <= 131073; ++i)
        table.addRow({i, 0});
    ASSERT_TRUE(table.finish());
    const Result<FileMetadata> metadata = _sink.metadata();
    ASSERT_TRUE(metadata) << metadata.reason();
    ASSERT_EQ(metadata->groups.size(), 2U);
    EXPECT_EQ(metadata->groups[0].rows, 131072U);
    EXPECT_EQ(metadata->groups[1].rows, 1U);
}

TEST_F(TableWriterTest, namesTheInputInEachRow) {
    TableWriter table(_layout, "f00", _sink, _compressor);
    table.addRow({1, 0});
    table.addRow({2, 0});
    ASSERT_TRUE(table.finish());
    const ChunkMetadata file = _sink.metadata()->groups.at(0).chunks.at(CommonColumns::file);
    EXPECT_EQ(file.values, 2U);
    EXPECT_EQ(file.statistics.nulls, 0U);
    EXPECT_EQ(file.statistics.range, std::pair(std::string("f00"), std::string("f00")));
}

TEST_F(TableWriterTest, hasNoValueForWhatAMessageLacks) {
    TableWriter table(_layout, "f00", _sink, _compressor);
    table.addRow({1, 10, 20, 0x5137, DecimalDegrees{481234567, -115000000}}, std::array<std::uint32_t, 1>{3},
                 "62");
    table.addRow({2, 10});
    ASSERT_TRUE(table.finish());
    const Result<FileMetadata> metadata = _sink.metadata();
    ASSERT_TRUE(metadata) << metadata.reason();
    std::vector<std::uint64_t> nulls;
    for (const ChunkMetadata& chunk : metadata->groups.at(0).chunks)
        nulls.push_back(chunk.statistics.nulls);
    // file, message, time, modem_time, code, latitude, longitude, row, row_key
    EXPECT_EQ(nulls, (std::vector<std::uint64_t>{0, 0, 0, 1, 1, 1, 1, 1, 1}));
    EXPECT_EQ(metadata->columns.at(CommonColumns::latitude).meaning, ValueMeaning::Degrees);
}

TEST_F(TableWriterTest, isAtTheLatestRowUntilItIsCut) {
    TableWriter table(_layout, "f00", _sink, _compressor);
    const std::array<std::uint32_t, 1> rows = {3};
    table.addRow({1, 0}, rows, "");
    EXPECT_TRUE(table.isAt(1, rows.data()));
    EXPECT_FALSE(table.isAt(2, rows.data()));
    EXPECT_FALSE(table.isAt(1, nullptr));
    ASSERT_TRUE(table.cut());
    EXPECT_FALSE(table.isAt(1, rows.data()));
}

TEST_F(TableWriterTest, reportsTheFirstFailure) {
    MemorySink full(100);
    TableWriter table(_layout, "f00", full, _compressor);
    for (std::uint64_t i = 1; i <= 131073; ++i)
        table.addRow({i, 0});
    const Result<Done> finished = table.finish();
    ASSERT_FALSE(finished);
    EXPECT_EQ(finished.reason(), "no space left");
}

} // namespace
} // namespace velmora
