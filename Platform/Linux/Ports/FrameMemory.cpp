// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Ports/FrameMemory.h"

#include "Platform/Linux/Ports/FrameReader.h"

#include <algorithm>
#include <numeric>

namespace velmora {

std::size_t FrameMemory::held() const {
    return std::accumulate(_readers.begin(), _readers.end(), std::size_t{0},
                           [](std::size_t sum, const FrameReader* reader) { return sum + reader->memory(); });
}

bool FrameMemory::makeRoom(const FrameReader& reader, std::size_t size) {
    // Until its bytes are moved the reader has its earlier memory too.
    while (held() + size > _limit) {
        const auto largest = std::max_element(
            _readers.begin(), _readers.end(),
            [](const FrameReader* a, const FrameReader* b) { return a->memory() < b->memory(); });
        if (largest == _readers.end() || *largest == &reader || (*largest)->memory() <= size)
            return false;
        (*largest)->giveUp();
    }
    return true;
}

} // namespace velmora
