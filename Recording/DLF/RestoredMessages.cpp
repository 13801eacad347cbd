// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/DLF/RestoredMessages.h"

#include <algorithm>

namespace velmora {

Data RestoredMessages::add(std::uint8_t first, Bytes rest) {
    const std::size_t size = 1 + rest.size();
    if (!_chunk || _chunk->size() - _used < size) {
        if (!_chunk || _chunk.use_count() > 1 || _chunk->size() < size)
            _chunk = std::make_shared<std::vector<std::uint8_t>>(std::max(chunkSize, size));
        _used = 0;
    }
    // Bytes from _used on have never been handed out, so that they may be written in a chunk that is shared.
    std::uint8_t* const message = _chunk->data() + _used;
    *message = first;
    std::copy(rest.begin(), rest.end(), message + 1);
    Data added(_chunk, _used, size);
    _used += size;
    return added;
}

} // namespace velmora
