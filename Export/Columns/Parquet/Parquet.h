// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <string_view>

/// Files of Apache Parquet's format.
namespace velmora::parquet {

/// What a file begins and ends with.
inline constexpr std::string_view magic = "PAR1";
/// What follows the metadata: their length, and the magic.
inline constexpr std::size_t endSize = 8;

} // namespace velmora::parquet
