// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Columns/Parquet/FileMetadata.h"

#include <cstddef>
#include <string>

namespace velmora {

/// What a page begins with.
struct PageHeader {
    bool isDictionary = false;
    PageEncoding encoding = PageEncoding::Plain;
    std::size_t values = 0; ///< nulls included
    std::size_t size = 0;   ///< compressed, without the header
    std::size_t uncompressedSize = 0;
};

/// In Thrift's compact protocol.
[[nodiscard]] std::string serialized(const PageHeader& header);

} // namespace velmora
