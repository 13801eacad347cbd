// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/Parquet/ParquetJoin.h"

#include "Export/Columns/Parquet/Parquet.h"

#include <utility>
#include <vector>

namespace velmora {

namespace {

/// Whether all pages lie between the offsets.
bool liesBetween(const FileMetadata& file, std::uint64_t begin, std::uint64_t end) {
    for (const RowGroupMetadata& group : file.groups)
        for (const ChunkMetadata& chunk : group.chunks)
            if (chunk.begin() < begin || chunk.begin() > end || chunk.size > end - chunk.begin() ||
                chunk.dataOffset < chunk.begin() || chunk.dataOffset > chunk.begin() + chunk.size)
                return false;
    return true;
}

} // namespace

Result<Done> ParquetJoin::write(Bytes bytes) {
    Result<Done> written = _sink.write(bytes);
    if (written)
        _offset += bytes.size();
    return written;
}

Result<Done> ParquetJoin::begin() {
    return _offset == 0 ? write(parquet::bytesOf(parquet::magic)) : Result<Done>(Done());
}

Result<Done> ParquetJoin::add(const FileMetadata& file, std::uint64_t begin, std::uint64_t end) {
    if (!liesBetween(file, begin, end))
        return Failure{"its pages are not where they should be"};
    if (_offset == 0) {
        _metadata.columns = file.columns;
        _metadata.properties = file.properties;
    } else if (_metadata.columns != file.columns || _metadata.properties != file.properties) {
        return Failure{"it has other columns"};
    }
    if (Result<Done> begun = this->begin(); !begun)
        return begun;
    for (RowGroupMetadata group : file.groups) {
        for (ChunkMetadata& chunk : group.chunks) {
            chunk.dataOffset = chunk.dataOffset - begin + _offset;
            if (chunk.dictionaryOffset)
                chunk.dictionaryOffset = *chunk.dictionaryOffset - begin + _offset;
        }
        _metadata.groups.push_back(std::move(group));
    }
    return Done();
}

Result<Done> ParquetJoin::copy(Bytes bytes) {
    return write(bytes);
}

Result<Done> ParquetJoin::finish() {
    if (Result<Done> begun = begin(); !begun)
        return begun;
    return write(parquet::endOf(_metadata));
}

} // namespace velmora
