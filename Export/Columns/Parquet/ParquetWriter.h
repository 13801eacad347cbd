// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Columns/Parquet/ByteSink.h"
#include "Export/Columns/Parquet/ColumnBuilder.h"
#include "Export/Columns/Parquet/FileMetadata.h"
#include "Export/Columns/Parquet/PageCompressor.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <utility>
#include <vector>

namespace velmora {

/// Writes a table without nested columns to a Parquet file. Rows are kept until `cut` writes them as a row
/// group.
class ParquetWriter {
public:
    /// Readers hold a row group's column in memory.
    static constexpr std::uint32_t mostRows = std::uint32_t{128} << 10;

    /// `properties` are for the readers (key-value metadata). The sink and the compressor must outlive it.
    ParquetWriter(const std::vector<TableColumn>& columns,
                  std::vector<std::pair<std::string, std::string>> properties, ByteSink& sink,
                  PageCompressor& compressor);

    /// Begins a row, and returns its number in the group. Cut it before it has more than `mostRows`.
    std::uint32_t addRow() { return _rows++; }
    /// Rows that are kept.
    [[nodiscard]] std::uint32_t groupRows() const { return _rows; }
    [[nodiscard]] bool isFull() const { return _rows >= mostRows; }
    [[nodiscard]] ColumnBuilder& column(std::size_t index) { return _columns[index]; }
    /// Rows so far, those of earlier groups included.
    [[nodiscard]] std::uint64_t rows() const { return _metadata.rows() + _rows; }
    /// Bytes of memory that the kept rows take.
    [[nodiscard]] std::size_t size() const;
    /// Bytes of the file so far.
    [[nodiscard]] std::uint64_t offset() const { return _offset; }

    /// Writes the rows that are kept, if there are any.
    Result<Done> cut();
    /// Writes what is left, and the end. Nothing can be added afterwards.
    Result<Done> finish();

private:
    Result<Done> write(Bytes bytes);
    Result<Done> writePage(const std::vector<std::uint8_t>& content, bool isDictionary, std::size_t values,
                           PageEncoding encoding, ChunkMetadata& chunk);
    Result<ChunkMetadata> writeChunk(EncodedChunk chunk);

    std::vector<ColumnBuilder> _columns;
    FileMetadata _metadata;
    ByteSink& _sink;
    PageCompressor& _compressor;
    std::uint32_t _rows = 0;
    std::uint64_t _offset = 0;
};

} // namespace velmora
