// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Columns/Parquet/ByteSink.h"
#include "Export/Columns/Parquet/FileMetadata.h"
#include "Platform/Linux/Files/FileDescriptor.h"
#include "Platform/Result.h"

#include <cstdint>
#include <filesystem>
#include <functional>

namespace velmora {

/// A file of columns that this program has written, opened to join it with others.
class ParquetFile {
public:
    /// Reads its metadata. The reason does not repeat the path.
    [[nodiscard]] static Result<ParquetFile> open(const std::filesystem::path& path);

    [[nodiscard]] const FileMetadata& metadata() const { return _metadata; }
    /// Where its pages begin and end.
    [[nodiscard]] std::uint64_t begin() const;
    [[nodiscard]] std::uint64_t end() const { return _end; }
    /// Passes all bytes of its pages on.
    Result<Done> readPages(const std::function<Result<Done>(Bytes)>& pass) const;

private:
    ParquetFile(FileDescriptor file, FileMetadata metadata, std::uint64_t end)
        : _file(std::move(file)), _metadata(std::move(metadata)), _end(end) {}

    FileDescriptor _file;
    FileMetadata _metadata;
    std::uint64_t _end;
};

} // namespace velmora
