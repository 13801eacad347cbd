// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Recording/Files/ChunkedInput.h"
#include "Recording/MessageReader.h"

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <utility>

namespace velmora {

/// Splits a pcapng file into its blocks. Where a block is damaged, resumes at the next one that is not:
/// blocks lie on 4-byte boundaries, but section headers are searched at every byte, so that a recording
/// appended to a truncated one is found. Main thread only.
class BlockReader {
public:
    struct Block {
        std::uint32_t type = 0;
        std::uint32_t length = 0;
        bool bigEndian = false;   ///< the byte order of its section
        std::uint64_t offset = 0; ///< its offset in the file
        Bytes bytes;              ///< all of it

        /// The bytes between its first length and its last.
        [[nodiscard]] Bytes body() const;
    };

    /// Blocks above this many bytes are treated as corrupt: the longest message, with a MiB for a block's
    /// options.
    static constexpr std::size_t maximumBlockSize = maximumMessageSize + (std::size_t{1} << 20);

    /// `bigEndian`: the byte order of the section that the input begins in, where that is not its first byte.
    explicit BlockReader(ChunkedInput input, bool bigEndian = false)
        : _input(std::move(input)), _bigEndian(bigEndian) {}

    /// Whether the input begins as a pcapng file does. Call it before the first `next`.
    [[nodiscard]] Result<Done> expectSection();
    /// The next complete block, valid until the next call; null at the end or once reading has failed.
    [[nodiscard]] const Block* next();
    /// Where the input goes on after the block that `next` last returned.
    [[nodiscard]] std::uint64_t nextOffset() const { return _input.offset() + _present.length; }
    /// The byte order of the present section.
    [[nodiscard]] bool isBigEndian() const { return _bigEndian; }
    /// What was skipped before the block, or the end, that `next` last returned; without its record number.
    [[nodiscard]] bool hasLoss() const { return _loss.has_value(); }
    [[nodiscard]] std::optional<Loss> takeLoss() { return std::exchange(_loss, std::nullopt); }
    /// A shared window on the block that `next` last returned. Precondition: it lies inside the block.
    [[nodiscard]] Data part(std::size_t offset, std::size_t length) const {
        return _input.part(offset, length);
    }
    /// The read error that ended the input; absent while there was none.
    [[nodiscard]] const std::optional<Failure>& failure() const { return _input.failure(); }

private:
    enum class Fault : std::uint8_t { None, Truncated, NoByteOrder, Length, TrailingLength };

    [[nodiscard]] Fault checkBlock(Block& block);
    [[nodiscard]] std::string describe(Fault fault, const Block& block) const;
    void skipDamage(Fault fault, const Block& block);
    [[nodiscard]] bool isAtBlock();

    ChunkedInput _input;
    Block _present; ///< what `next` last returned
    bool _bigEndian;
    std::optional<Loss> _loss;
};

} // namespace velmora
