// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Columns/ParquetFile.h"

#include "Export/Columns/Parquet/Parquet.h"
#include "Platform/Linux/Errno.h"

#include <algorithm>
#include <cerrno>
#include <string_view>
#include <vector>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace velmora {

namespace {

/// Of the metadata: more than any file of this program has.
constexpr std::uint64_t mostMetadata = std::uint64_t{32} << 20;
constexpr std::size_t bufferSize = std::size_t{256} << 10;

Result<Done> readAt(int descriptor, std::uint64_t offset, std::span<std::uint8_t> buffer) {
    while (!buffer.empty()) {
        const ssize_t count = ::pread(descriptor, buffer.data(), buffer.size(), static_cast<off_t>(offset));
        if (count < 0 && errno == EINTR)
            continue;
        if (count < 0)
            return Failure{"cannot be read: " + errnoText(errno)};
        if (count == 0)
            return Failure{"ends at offset " + std::to_string(offset)};
        buffer = buffer.subspan(static_cast<std::size_t>(count));
        offset += static_cast<std::uint64_t>(count);
    }
    return Done();
}

} // namespace

std::uint64_t ParquetFile::begin() const {
    return parquet::magic.size();
}

Result<ParquetFile> ParquetFile::open(const std::filesystem::path& path) {
    FileDescriptor file(::open(path.c_str(), O_RDONLY | O_CLOEXEC));
    struct stat status = {};
    if (!file || ::fstat(file.get(), &status) != 0)
        return Failure{"cannot open: " + errnoText(errno)};
    const auto size = static_cast<std::uint64_t>(status.st_size);
    const std::uint64_t least = parquet::magic.size() + parquet::endSize;
    if (size < least)
        return Failure{"got " + std::to_string(size) + " bytes, wanted at least " + std::to_string(least)};
    std::vector<std::uint8_t> bytes(parquet::endSize);
    if (const Result<Done> read = readAt(file.get(), size - parquet::endSize, bytes); !read)
        return Failure{read.reason()};
    const auto length = numberAt<std::uint32_t>(bytes.data(), std::endian::little);
    const Bytes magic = Bytes(bytes).last(parquet::magic.size());
    if (!std::ranges::equal(magic, parquet::bytesOf(parquet::magic)) || length > size - least ||
        length > mostMetadata)
        return Failure{"is no Parquet file, or its end is damaged"};
    bytes.resize(length);
    const std::uint64_t end = size - parquet::endSize - length;
    if (const Result<Done> read = readAt(file.get(), end, bytes); !read)
        return Failure{read.reason()};
    Result<FileMetadata> metadata = parseFileMetadata(bytes);
    if (!metadata)
        return Failure{metadata.reason()};
    return ParquetFile(std::move(file), *std::move(metadata), end);
}

Result<Done> ParquetFile::readPages(const std::function<Result<Done>(Bytes)>& pass) const {
    std::vector<std::uint8_t> buffer(bufferSize);
    for (std::uint64_t offset = begin(); offset < _end;) {
        const auto count = static_cast<std::size_t>(std::min<std::uint64_t>(buffer.size(), _end - offset));
        const std::span<std::uint8_t> part = std::span(buffer).first(count);
        if (Result<Done> read = readAt(_file.get(), offset, part); !read)
            return read;
        if (Result<Done> passed = pass(part); !passed)
            return passed;
        offset += count;
    }
    return Done();
}

} // namespace velmora
