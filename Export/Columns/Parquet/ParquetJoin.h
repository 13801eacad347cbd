// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Columns/Parquet/ByteSink.h"
#include "Export/Columns/Parquet/FileMetadata.h"

#include <cstdint>

namespace velmora {

/// Joins files of the same columns: the row groups of all of them, as they are, in one file.
class ParquetJoin {
public:
    /// The sink must outlive it.
    explicit ParquetJoin(ByteSink& sink) : _sink(sink) {}

    /// The row groups of a file follow, whose pages lie between the offsets `begin` and `end` in it: pass
    /// them to `copy` next. Fails, and takes nothing, where the file has other columns or properties than
    /// those before, or pages elsewhere.
    Result<Done> add(const FileMetadata& file, std::uint64_t begin, std::uint64_t end);
    /// The next bytes of the file's pages.
    Result<Done> copy(Bytes bytes);
    /// Writes the end.
    Result<Done> finish();

    /// Chunks so far: their metadata is kept in memory, here and by readers.
    [[nodiscard]] std::uint64_t chunks() const { return _metadata.groups.size() * _metadata.columns.size(); }

private:
    Result<Done> write(Bytes bytes);
    Result<Done> begin();

    ByteSink& _sink;
    FileMetadata _metadata;
    std::uint64_t _offset = 0;
};

} // namespace velmora
