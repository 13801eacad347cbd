// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Platform/Result.h"
#include "Recording/Files/ByteSource.h"

#include <cstddef>
#include <cstdint>
#include <memory>
#include <optional>
#include <vector>

namespace velmora {

/// A sliding window on a source of any length, for readers with a bounded look-ahead that hand out parts of
/// the input without a copy.
///
/// The bytes lie in chunks. `part` returns a window on the chunk itself: it stays valid after the input has
/// moved on, but keeps its entire chunk in memory; copy a part that is kept for long. A chunk without
/// references is reused. Chunks have the given size, except where one look-ahead requests more: then they
/// grow with the bytes that arrive, up to about twice that. Main thread only.
class ChunkedInput {
public:
    /// Two of them are much less than a mebibyte, so that the second, which is allocated after the first has
    /// been read, is negligible growth; larger ones are not read faster.
    static constexpr std::size_t defaultChunkSize = std::size_t{256} << 10;

    /// `offset`: of the source's first byte in the input, where it does not begin at the front.
    explicit ChunkedInput(std::unique_ptr<ByteSource> source, std::size_t chunkSize = defaultChunkSize,
                          std::uint64_t offset = 0);

    /// Reads until `count` bytes are available. False when the input ends, or fails, before.
    [[nodiscard]] bool ensure(std::size_t count) { return available().size() >= count || fill(count); }
    /// The bytes that have been read and not skipped. Valid until the next `ensure`.
    [[nodiscard]] Bytes available() const { return {_chunk->data() + _begin, _end - _begin}; }
    /// With the bytes skipped so far: the offset of the available ones in the input.
    [[nodiscard]] std::uint64_t offset() const { return _offset; }
    /// Precondition: `count` bytes are available.
    void skip(std::size_t count) {
        _begin += count;
        _offset += count;
    }
    /// A window on the available bytes. Precondition: it lies inside them.
    [[nodiscard]] Data part(std::size_t offset, std::size_t length) const {
        return Data(_chunk, _begin + offset, length);
    }
    /// The read error that ended the input; absent while there was none.
    [[nodiscard]] const std::optional<Failure>& failure() const { return _failure; }

private:
    using Chunk = std::shared_ptr<std::vector<std::uint8_t>>;

    bool fill(std::size_t count);
    void nextChunk(std::size_t count);

    std::unique_ptr<ByteSource> _source;
    std::size_t _chunkSize;
    Chunk _chunk;
    Chunk _spare; ///< the previous chunk, for reuse once it is unreferenced
    std::size_t _begin = 0;
    std::size_t _end = 0;
    std::uint64_t _offset;
    bool _ended = false;
    std::optional<Failure> _failure;
};

} // namespace velmora
