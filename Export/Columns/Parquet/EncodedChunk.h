// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Columns/Parquet/FileMetadata.h"

#include <cstddef>
#include <cstdint>
#include <vector>

namespace velmora {

/// A column of a row group, not yet compressed.
struct EncodedChunk {
    std::vector<std::uint8_t> dictionary; ///< a page's content; empty where there is none
    std::size_t dictionaryValues = 0;
    std::vector<std::uint8_t> data; ///< a page's content
    PageEncoding encoding = PageEncoding::Plain;
    ColumnStatistics statistics;
};

} // namespace velmora
