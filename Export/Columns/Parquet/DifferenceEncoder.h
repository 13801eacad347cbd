// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <span>
#include <vector>

namespace velmora {

/// Appends numbers as the differences between them (Parquet's DELTA_BINARY_PACKED): numbers that rise slowly
/// take few bits.
void appendDifferences(std::vector<std::uint8_t>& out, std::span<const std::int64_t> values);

} // namespace velmora
