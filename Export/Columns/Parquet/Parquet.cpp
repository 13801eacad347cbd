// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/Parquet/Parquet.h"

#include "Export/Columns/Parquet/BitPacking.h"

#include <string>

namespace velmora::parquet {

std::vector<std::uint8_t> endOf(const FileMetadata& metadata) {
    const std::string content = serialized(metadata);
    std::vector<std::uint8_t> end(content.begin(), content.end());
    appendFixed(end, static_cast<std::uint32_t>(content.size()));
    end.insert(end.end(), magic.begin(), magic.end());
    return end;
}

} // namespace velmora::parquet
