// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/Parquet/ParquetWriter.h"

#include "Export/Columns/Parquet/PageHeader.h"
#include "Export/Columns/Parquet/Parquet.h"

namespace velmora {

ParquetWriter::ParquetWriter(const std::vector<TableColumn>& columns,
                             std::vector<std::pair<std::string, std::string>> properties, ByteSink& sink,
                             PageCompressor& compressor)
    : _sink(sink), _compressor(compressor) {
    for (const TableColumn& column : columns) {
        _columns.emplace_back(column);
        _metadata.columns.push_back(column.schema);
    }
    _metadata.properties = std::move(properties);
}

std::size_t ParquetWriter::size() const {
    std::size_t sum = 0;
    for (const ColumnBuilder& column : _columns)
        sum += column.size();
    return sum;
}

Result<Done> ParquetWriter::write(Bytes bytes) {
    Result<Done> written = _sink.write(bytes);
    if (written)
        _offset += bytes.size();
    return written;
}

Result<Done> ParquetWriter::cut() {
    if (_rows == 0)
        return Done();
    if (_offset == 0)
        if (Result<Done> begun = write(parquet::bytesOf(parquet::magic)); !begun)
            return begun;
    RowGroupMetadata group;
    group.rows = _rows;
    for (ColumnBuilder& column : _columns) {
        Result<ChunkMetadata> chunk = writeChunk(column.finish(_rows));
        if (!chunk)
            return Failure{chunk.reason()};
        group.chunks.push_back(*std::move(chunk));
    }
    _metadata.groups.push_back(std::move(group));
    _rows = 0;
    return Done();
}

Result<ChunkMetadata> ParquetWriter::writeChunk(EncodedChunk encoded) {
    ChunkMetadata chunk;
    chunk.values = _rows;
    chunk.statistics = std::move(encoded.statistics);
    chunk.encodings = {PageEncoding::Runs, encoded.encoding};
    if (encoded.dictionaryValues > 0) {
        chunk.encodings.push_back(PageEncoding::Plain);
        chunk.dictionaryOffset = _offset;
        if (Result<Done> written =
                writePage(encoded.dictionary, true, encoded.dictionaryValues, PageEncoding::Plain, chunk);
            !written)
            return Failure{written.reason()};
    }
    chunk.dataOffset = _offset;
    if (Result<Done> written = writePage(encoded.data, false, _rows, encoded.encoding, chunk); !written)
        return Failure{written.reason()};
    return chunk;
}

Result<Done> ParquetWriter::writePage(const std::vector<std::uint8_t>& content, bool isDictionary,
                                      std::size_t values, PageEncoding encoding, ChunkMetadata& chunk) {
    const Bytes compressed = _compressor.compress(content);
    const std::string header =
        serialized(PageHeader{isDictionary, encoding, values, compressed.size(), content.size()});
    chunk.size += header.size() + compressed.size();
    chunk.uncompressedSize += header.size() + content.size();
    if (Result<Done> written = write(parquet::bytesOf(header)); !written)
        return written;
    return write(compressed);
}

Result<Done> ParquetWriter::finish() {
    if (Result<Done> last = cut(); !last)
        return last;
    if (_offset == 0)
        if (Result<Done> begun = write(parquet::bytesOf(parquet::magic)); !begun)
            return begun;
    return write(parquet::endOf(_metadata));
}

} // namespace velmora
