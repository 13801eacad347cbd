// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/Parquet/FileMetadata.h"

#include "Export/Columns/Parquet/Parquet.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

namespace velmora {
namespace {

FileMetadata example() {
    FileMetadata metadata;
    metadata.columns = {{"file", StoredType::Text, ValueMeaning::Text, false},
                        {"time", StoredType::Integer, ValueMeaning::Timestamp, false},
                        {"level_dbm", StoredType::Number, ValueMeaning::Plain, true},
                        {"is", StoredType::Boolean, ValueMeaning::Plain, true},
                        {"latitude", StoredType::Integer, ValueMeaning::Degrees, true}};
    metadata.properties = {{"velmora.version", "1"}, {"velmora.unit.level_dbm", "dBm"}};
    RowGroupMetadata group;
    group.rows = 3;
    for (std::uint64_t i = 0; i < metadata.columns.size(); ++i) {
        ChunkMetadata chunk;
        chunk.encodings = {PageEncoding::Runs, PageEncoding::DictionaryIndex, PageEncoding::Plain};
        chunk.values = 3;
        chunk.size = 100 + i;
        chunk.uncompressedSize = 200 + i;
        chunk.dataOffset = 1000 * i + 50;
        if (i % 2 == 0)
            chunk.dictionaryOffset = 1000 * i;
        chunk.statistics.nulls = i;
        if (i < 2)
            chunk.statistics.range = std::pair(std::string("a"), std::string("b"));
        group.chunks.push_back(std::move(chunk));
    }
    metadata.groups = {group, group};
    return metadata;
}

TEST(FileMetadata, countsTheRowsOfAllGroups) {
    EXPECT_EQ(example().rows(), 6U);
}

TEST(FileMetadata, isReadBack) {
    const Result<FileMetadata> read = parseFileMetadata(parquet::bytesOf(serialized(example())));
    ASSERT_TRUE(read) << read.reason();
    EXPECT_EQ(*read, example());
}

TEST(FileMetadata, ofNothingIsReadBack) {
    const Result<FileMetadata> read = parseFileMetadata(parquet::bytesOf(serialized(FileMetadata())));
    ASSERT_TRUE(read) << read.reason();
    EXPECT_EQ(*read, FileMetadata());
}

TEST(FileMetadata, ofOtherProgramsIsRefused) {
    std::string text = serialized(example());
    const std::size_t at = text.find("velmora-log version");
    ASSERT_NE(at, std::string::npos);
    text[at] = 'V';
    const Result<FileMetadata> read = parseFileMetadata(parquet::bytesOf(text));
    ASSERT_FALSE(read);
    EXPECT_EQ(read.reason(), "not written by this program");
}

TEST(FileMetadata, thatLacksAColumnOfAGroupIsRefused) {
    FileMetadata metadata = example();
    metadata.groups[1].chunks.pop_back();
    const Result<FileMetadata> read = parseFileMetadata(parquet::bytesOf(serialized(metadata)));
    ASSERT_FALSE(read);
    EXPECT_EQ(read.reason(), "its metadata lists 4 of 5 columns in a row group");
}

TEST(FileMetadata, thatEndsEarlyIsRefused) {
    const std::string text = serialized(example());
    for (std::size_t size = 0; size < text.size(); ++size)
        EXPECT_FALSE(parseFileMetadata(parquet::bytesOf(text.substr(0, size)))) << size;
}

RC_GTEST_PROP(FileMetadata, thatIsDamagedIsReadOrRefused, ()) {
    std::string text = serialized(example());
    const auto changes = *rc::gen::container<std::vector<std::pair<std::size_t, char>>>(
        rc::gen::pair(rc::gen::inRange(std::size_t{0}, text.size()), rc::gen::arbitrary<char>()));
    for (const auto& [at, byte] : changes)
        text[at] = byte;
    const Result<FileMetadata> read = parseFileMetadata(parquet::bytesOf(text));
    if (read)
        for (const RowGroupMetadata& group : read->groups)
            RC_ASSERT(group.chunks.size() == read->columns.size());
}

} // namespace
} // namespace velmora
