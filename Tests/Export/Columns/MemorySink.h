// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Columns/Parquet/ByteSink.h"
#include "Export/Columns/Parquet/FileMetadata.h"
#include "Export/Columns/Parquet/Parquet.h"

#include <cstdint>
#include <vector>

namespace velmora {

/// Keeps what is written, up to a limit at which writing fails.
class MemorySink final : public ByteSink {
public:
    explicit MemorySink(std::size_t limit = ~std::size_t{0}) : _limit(limit) {}

    Result<Done> write(Bytes bytes) override {
        if (bytes.size() > _limit - content.size())
            return Failure{"no space left"};
        content.insert(content.end(), bytes.begin(), bytes.end());
        return Done();
    }

    /// Where the metadata begins, by the length at the end.
    [[nodiscard]] std::size_t metadataOffset() const {
        return content.size() - parquet::endSize -
               numberAt<std::uint32_t>(content.data() + content.size() - parquet::endSize,
                                       std::endian::little);
    }
    [[nodiscard]] Result<FileMetadata> metadata() const {
        const std::size_t offset = metadataOffset();
        return parseFileMetadata(Bytes(content).subspan(offset, content.size() - parquet::endSize - offset));
    }

    std::vector<std::uint8_t> content;

private:
    std::size_t _limit;
};

} // namespace velmora
