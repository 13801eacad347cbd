// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Files/ChunkedInput.h"

#include <algorithm>
#include <bit>
#include <span>
#include <utility>

namespace velmora {

namespace {
/// A chunk whose end is nearer than this is left, rather than read into in crumbs.
constexpr std::size_t smallestRead = 4096;
} // namespace

ChunkedInput::ChunkedInput(std::unique_ptr<ByteSource> source, std::size_t chunkSize, std::uint64_t offset)
    : _source(std::move(source)), _chunkSize(std::max(chunkSize, 2 * smallestRead)),
      _chunk(std::make_shared<std::vector<std::uint8_t>>()), _offset(offset) {}

bool ChunkedInput::fill(std::size_t count) {
    while (_end - _begin < count && !_ended) {
        // Room for twice the bytes that have arrived, not for the length in a block's header: a few
        // bytes that claim megabytes must not allocate them.
        const std::size_t wanted = std::min(count, std::max(2 * (_end - _begin), _chunkSize));
        if (_chunk->size() - _begin < wanted || _chunk->size() - _end < smallestRead)
            nextChunk(wanted);
        // Bytes after _end have never been handed out, so that they may be written in a chunk that is shared.
        const Result<std::size_t> got = _source->read(std::span(*_chunk).subspan(_end));
        if (!got) {
            _failure = Failure{got.reason() + " at offset " + std::to_string(_offset + (_end - _begin))};
            _ended = true;
        } else {
            _end += *got;
            _ended = *got == 0;
        }
    }
    return _end - _begin >= count;
}

/// Moves the available bytes to the front of a chunk with room for `count`.
void ChunkedInput::nextChunk(std::size_t count) {
    // A long look-ahead gets room to move on in, so that a row of them does not move its bytes once a step.
    const std::size_t size =
        count + smallestRead <= _chunkSize ? _chunkSize : std::bit_ceil(count + _chunkSize);
    const auto usable = [size](const Chunk& chunk) {
        return chunk && chunk.use_count() == 1 && chunk->size() == size;
    };
    if (usable(_chunk)) {
        std::copy(_chunk->data() + _begin, _chunk->data() + _end, _chunk->data());
    } else {
        Chunk fresh = usable(_spare) ? std::move(_spare) : std::make_shared<std::vector<std::uint8_t>>(size);
        std::copy(_chunk->data() + _begin, _chunk->data() + _end, fresh->data());
        _spare = _chunk->size() == _chunkSize ? std::move(_chunk) : nullptr;
        _chunk = std::move(fresh);
    }
    _end -= _begin;
    _begin = 0;
}

} // namespace velmora
