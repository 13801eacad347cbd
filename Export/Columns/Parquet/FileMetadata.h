// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Columns/Parquet/ColumnSchema.h"
#include "Platform/Bytes.h"
#include "Platform/Result.h"

#include <cstdint>
#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace velmora {

/// How a page's values are encoded (the numbers are the format's).
enum class PageEncoding : std::uint8_t {
    Plain = 0,
    Runs = 3,            ///< run lengths and bit-packed groups
    Differences = 5,     ///< DELTA_BINARY_PACKED
    DictionaryIndex = 8, ///< RLE_DICTIONARY
};

/// What is known of a column's values without reading them.
struct ColumnStatistics {
    std::uint64_t nulls = 0;
    /// As the values are stored; absent where there is none, or where they are too long.
    std::optional<std::pair<std::string, std::string>> range;

    bool operator==(const ColumnStatistics&) const = default;
};

/// A column's part of a row group.
struct ChunkMetadata {
    std::vector<PageEncoding> encodings;
    std::uint64_t values = 0; ///< nulls included
    std::uint64_t size = 0;   ///< page headers included
    std::uint64_t uncompressedSize = 0;
    std::optional<std::uint64_t> dictionaryOffset; ///< in the file
    std::uint64_t dataOffset = 0;
    ColumnStatistics statistics;

    [[nodiscard]] std::uint64_t begin() const { return dictionaryOffset.value_or(dataOffset); }
    bool operator==(const ChunkMetadata&) const = default;
};

struct RowGroupMetadata {
    std::vector<ChunkMetadata> chunks; ///< one for each column
    std::uint64_t rows = 0;

    bool operator==(const RowGroupMetadata&) const = default;
};

/// What the end of a Parquet file says of it.
struct FileMetadata {
    std::vector<ColumnSchema> columns;
    std::vector<RowGroupMetadata> groups;
    std::vector<std::pair<std::string, std::string>> properties;

    [[nodiscard]] std::uint64_t rows() const;
    bool operator==(const FileMetadata&) const = default;
};

/// In Thrift's compact protocol.
[[nodiscard]] std::string serialized(const FileMetadata& metadata);

/// The metadata of a file that this program wrote; fails for others, which may have what `FileMetadata` does
/// not.
[[nodiscard]] Result<FileMetadata> parseFileMetadata(Bytes bytes);

} // namespace velmora
