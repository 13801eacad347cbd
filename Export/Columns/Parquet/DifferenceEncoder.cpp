// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/Parquet/DifferenceEncoder.h"

#include "Export/Columns/Parquet/BitPacking.h"

#include <algorithm>
#include <array>
#include <bit>
#include <cstddef>

namespace velmora {

namespace {

constexpr std::size_t blockSize = 128;
constexpr std::size_t miniBlocks = 4;
constexpr std::size_t miniBlockSize = blockSize / miniBlocks;

/// Small numbers of either sign as small ones without.
void appendZigzag(std::vector<std::uint8_t>& out, std::int64_t value) {
    const auto bits = static_cast<std::uint64_t>(value);
    appendVariable(out, bits << 1 ^ (value < 0 ? ~std::uint64_t{0} : 0));
}

/// The differences of a block, each less the smallest of them where that is negative. They are stored in
/// whole bytes, and the same difference alike in all blocks: Zstandard then finds what repeats, as arrivals
/// on a grid do, which is worth more than the bits.
void appendBlock(std::vector<std::uint8_t>& out, std::span<std::uint64_t> differences) {
    std::int64_t least = 0;
    for (const std::uint64_t difference : differences)
        least = std::min(least, static_cast<std::int64_t>(difference));
    appendZigzag(out, least);
    const std::size_t widths = out.size();
    out.resize(widths + miniBlocks);
    for (std::size_t i = 0; i < miniBlocks && i * miniBlockSize < differences.size(); ++i) {
        const std::span<std::uint64_t> part =
            differences.subspan(i * miniBlockSize)
                .first(std::min(miniBlockSize, differences.size() - i * miniBlockSize));
        std::uint64_t all = 0;
        for (std::uint64_t& difference : part)
            all |= difference -= static_cast<std::uint64_t>(least);
        const auto width = (static_cast<unsigned>(std::bit_width(all)) + 7) / 8 * 8;
        out[widths + i] = static_cast<std::uint8_t>(width);
        BitPacker packer(out);
        for (const std::uint64_t difference : part)
            packer.put(difference, width);
        for (std::size_t filled = part.size(); filled < miniBlockSize; ++filled)
            packer.put(0, width);
        packer.finish();
    }
}

} // namespace

void appendDifferences(std::vector<std::uint8_t>& out, std::span<const std::int64_t> values) {
    appendVariable(out, blockSize);
    appendVariable(out, miniBlocks);
    appendVariable(out, values.size());
    appendZigzag(out, values.empty() ? 0 : values.front());
    std::array<std::uint64_t, blockSize> differences{};
    for (std::size_t first = 1; first < values.size(); first += blockSize) {
        const std::size_t count = std::min(blockSize, values.size() - first);
        // They may exceed the range, and wrap around as the reader's sums do.
        for (std::size_t i = 0; i < count; ++i)
            differences[i] = static_cast<std::uint64_t>(values[first + i]) -
                             static_cast<std::uint64_t>(values[first + i - 1]);
        appendBlock(out, std::span(differences).first(count));
    }
}

} // namespace velmora
