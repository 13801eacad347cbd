// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Columns/Parquet/FileMetadata.h"
#include "Platform/Bytes.h"

#include <cstddef>
#include <cstdint>
#include <string_view>
#include <vector>

/// Files of Apache Parquet's format.
namespace velmora::parquet {

/// What a file begins and ends with.
inline constexpr std::string_view magic = "PAR1";
/// What follows the metadata: their length, and the magic.
inline constexpr std::size_t endSize = 8;

[[nodiscard]] inline Bytes bytesOf(std::string_view text) {
    return {reinterpret_cast<const std::uint8_t*>(text.data()), text.size()};
}

/// What follows a file's pages.
[[nodiscard]] std::vector<std::uint8_t> endOf(const FileMetadata& metadata);

} // namespace velmora::parquet
