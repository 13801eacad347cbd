// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/Parquet/ParquetJoin.h"

#include "Export/Columns/Parquet/ParquetWriter.h"
#include "Tests/Export/Columns/MemorySink.h"

#include <gtest/gtest.h>

#include <algorithm>

namespace velmora {
namespace {

MemorySink fileWith(const std::vector<double>& numbers, const std::string& property = "1") {
    MemorySink sink;
    PageCompressor compressor;
    ParquetWriter writer({{{"x", StoredType::Number, ValueMeaning::Plain, true}, false}},
                         {{"version", property}}, sink, compressor);
    for (const double number : numbers)
        writer.column(0).setNumber(writer.addRow(), number);
    EXPECT_TRUE(writer.finish());
    return sink;
}

Result<Done> add(ParquetJoin& join, const MemorySink& part) {
    if (Result<Done> added = join.add(*part.metadata(), 4, part.metadataOffset()); !added)
        return added;
    return join.copy(Bytes(part.content).subspan(4, part.metadataOffset() - 4));
}

TEST(ParquetJoin, ofOneFileIsThatFile) {
    const MemorySink part = fileWith({1, 1, 2, 2});
    MemorySink joined;
    ParquetJoin join(joined);
    ASSERT_TRUE(add(join, part));
    ASSERT_TRUE(join.finish());
    EXPECT_EQ(joined.content, part.content);
}

TEST(ParquetJoin, hasThePagesOfEachPart) {
    const std::vector<MemorySink> parts = {fileWith({1, 1, 2, 2}), fileWith({}), fileWith({3, 4})};
    MemorySink joined;
    ParquetJoin join(joined);
    for (const MemorySink& part : parts)
        ASSERT_TRUE(add(join, part));
    EXPECT_EQ(join.chunks(), 2U);
    ASSERT_TRUE(join.finish());
    const Result<FileMetadata> metadata = joined.metadata();
    ASSERT_TRUE(metadata) << metadata.reason();
    EXPECT_EQ(metadata->rows(), 6U);
    ASSERT_EQ(metadata->groups.size(), 2U);
    for (const auto& [group, part] : {std::pair(0, 0), std::pair(1, 2)}) {
        const ChunkMetadata chunk = metadata->groups[static_cast<std::size_t>(group)].chunks[0];
        const MemorySink& own = parts[static_cast<std::size_t>(part)];
        const ChunkMetadata original = own.metadata()->groups[0].chunks[0];
        EXPECT_EQ(chunk.statistics, original.statistics);
        EXPECT_EQ(chunk.dataOffset - chunk.begin(), original.dataOffset - original.begin());
        const auto begin = joined.content.begin() + static_cast<std::ptrdiff_t>(chunk.begin());
        EXPECT_TRUE(std::equal(begin, begin + static_cast<std::ptrdiff_t>(chunk.size),
                               own.content.begin() + static_cast<std::ptrdiff_t>(original.begin())));
    }
}

TEST(ParquetJoin, refusesOtherColumnsAndProperties) {
    MemorySink joined;
    ParquetJoin join(joined);
    ASSERT_TRUE(add(join, fileWith({1})));
    const std::size_t size = joined.content.size();
    const Result<Done> added = add(join, fileWith({1}, "2"));
    ASSERT_FALSE(added);
    EXPECT_EQ(added.reason(), "it has other columns");
    EXPECT_EQ(joined.content.size(), size);
}

TEST(ParquetJoin, refusesPagesThatLieElsewhere) {
    const MemorySink part = fileWith({1, 1});
    const auto refuses = [&](auto change) {
        FileMetadata metadata = *part.metadata();
        change(metadata.groups[0].chunks[0]);
        MemorySink joined;
        ParquetJoin join(joined);
        return !join.add(metadata, 4, part.metadataOffset());
    };
    EXPECT_FALSE(refuses([](ChunkMetadata&) {}));
    EXPECT_TRUE(refuses([](ChunkMetadata& chunk) { chunk.dictionaryOffset = 3; }));
    EXPECT_TRUE(refuses([](ChunkMetadata& chunk) { ++chunk.size; }));
    EXPECT_TRUE(refuses([](ChunkMetadata& chunk) { chunk.dataOffset += chunk.size; }));
    EXPECT_TRUE(refuses([](ChunkMetadata& chunk) { chunk.dictionaryOffset = ~std::uint64_t{0}; }));
    EXPECT_TRUE(refuses([](ChunkMetadata& chunk) { chunk.size = ~std::uint64_t{0}; }));
}

} // namespace
} // namespace velmora
