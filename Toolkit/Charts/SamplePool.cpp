// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Charts/SamplePool.h"

#include "Toolkit/Charts/SampleBlock.h"
#include "Toolkit/Charts/SampleRing.h"

#include <algorithm>
#include <utility>

namespace velmora {

SamplePool::SamplePool(std::size_t blockLimit) : _limit(std::max<std::size_t>(blockLimit, 1)) {}

SamplePool::~SamplePool() = default;

void SamplePool::add(SampleRing& ring) {
    _rings.push_back(&ring);
}

void SamplePool::remove(SampleRing& ring) {
    std::erase(_rings, &ring);
}

std::unique_ptr<SampleBlock> SamplePool::take() {
    std::unique_ptr<SampleBlock> block;
    if (!_spare.empty()) {
        block = std::move(_spare.back());
        _spare.pop_back();
    } else if (_made < _limit) {
        block = std::make_unique<SampleBlock>();
        ++_made;
    } else {
        // All blocks are in rings, so the longest has one.
        const auto longest = std::max_element(_rings.begin(), _rings.end(), [](auto* one, auto* other) {
            return one->_blocks.size() < other->_blocks.size();
        });
        SampleRing& ring = **longest;
        block = std::move(ring._blocks.front());
        ring._blocks.pop_front();
        ring._size -= block->size();
        ++ring._revision;
    }
    block->clear();
    return block;
}

void SamplePool::giveBack(std::unique_ptr<SampleBlock> block) {
    _spare.push_back(std::move(block));
}

} // namespace velmora
