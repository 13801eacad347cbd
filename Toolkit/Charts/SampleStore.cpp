// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Charts/SampleStore.h"

#include "Toolkit/Charts/SampleBlock.h"
#include "Toolkit/Charts/SamplePool.h"

namespace velmora {

namespace {

/// With the ring's pointer to it and what the allocator adds.
constexpr std::size_t blockBytes = sizeof(SampleBlock) + 3 * sizeof(void*);

// A day of 20 series fits, even when each has lost a block that it had not used up.
static_assert(SampleStore::defaultByteLimit / blockBytes / 20 * SampleBlock::capacity >=
              24 * 3600 + SampleBlock::capacity);

} // namespace

SampleStore::SampleStore(std::size_t byteLimit)
    : _pool(std::make_shared<SamplePool>(byteLimit / blockBytes)) {}

SampleStore::~SampleStore() = default;

std::shared_ptr<SampleRing> SampleStore::makeSeries(std::int64_t gapLimit_ns) {
    return std::shared_ptr<SampleRing>(new SampleRing(_pool, gapLimit_ns));
}

std::size_t SampleStore::byteCount() const {
    return _pool->blockCount() * blockBytes;
}

} // namespace velmora
