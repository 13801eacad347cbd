// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Charts/SampleRing.h"

#include "Toolkit/Charts/SampleBlock.h"
#include "Toolkit/Charts/SamplePool.h"

#include <algorithm>
#include <cmath>
#include <utility>

namespace velmora {

SampleRing::SampleRing(std::shared_ptr<SamplePool> pool, std::int64_t gapLimit_ns)
    : _pool(std::move(pool)), _gapLimit_ns(gapLimit_ns) {
    _pool->add(*this);
}

SampleRing::~SampleRing() {
    clear();
    _pool->remove(*this);
}

bool SampleRing::append(std::int64_t time_ns, double value) {
    return std::isfinite(value) && add(time_ns, value);
}

bool SampleRing::appendGap(std::int64_t time_ns) {
    if (_size != 0 && std::isnan(entry(_size - 1).value))
        return time_ns >= *newest_ns(); // one mark is enough
    return add(time_ns, std::numeric_limits<double>::quiet_NaN());
}

bool SampleRing::add(std::int64_t time_ns, double value) {
    if (_size != 0 && time_ns < *newest_ns())
        return false;
    if (_blocks.empty() || _blocks.back()->isFull())
        _blocks.push_back(_pool->take());
    _blocks.back()->append(time_ns, value);
    ++_size;
    ++_revision;
    return true;
}

void SampleRing::clear() {
    for (std::unique_ptr<SampleBlock>& block : _blocks)
        _pool->giveBack(std::move(block));
    _blocks.clear();
    _size = 0;
    ++_revision;
}

Sample SampleRing::entry(std::size_t index) const {
    return (*_blocks[index / SampleBlock::capacity])[index % SampleBlock::capacity];
}

std::size_t SampleRing::countBefore(std::int64_t time_ns, bool orAt) const {
    // The last block that begins before the time has its place; with equal times the first of them.
    const auto found =
        std::partition_point(_blocks.begin(), _blocks.end(), [&](const std::unique_ptr<SampleBlock>& block) {
            return block->timeAt(0) < time_ns || (orAt && block->timeAt(0) == time_ns);
        });
    if (found == _blocks.begin())
        return 0;
    const auto block = static_cast<std::size_t>(found - _blocks.begin()) - 1;
    return block * SampleBlock::capacity + _blocks[block]->countBefore(time_ns, orAt);
}

std::optional<Sample> SampleRing::at(std::int64_t time_ns) const {
    const std::size_t count = countBefore(time_ns, true);
    if (count == 0)
        return std::nullopt;
    const Sample found = entry(count - 1);
    if (std::isnan(found.value) || time_ns - found.time_ns > _gapLimit_ns)
        return std::nullopt;
    return found;
}

std::optional<Sample> SampleRing::before(std::int64_t time_ns) const {
    for (std::size_t index = countBefore(time_ns); index > 0; --index)
        if (const Sample found = entry(index - 1); !std::isnan(found.value))
            return found;
    return std::nullopt;
}

std::optional<Sample> SampleRing::after(std::int64_t time_ns) const {
    for (std::size_t index = countBefore(time_ns, true); index < _size; ++index)
        if (const Sample found = entry(index); !std::isnan(found.value))
            return found;
    return std::nullopt;
}

Extremes SampleRing::extremes(std::int64_t begin_ns, std::int64_t end_ns) const {
    return begin_ns < end_ns ? extremesOfEntries(countBefore(begin_ns), countBefore(end_ns)) : Extremes{};
}

Extremes SampleRing::extremesOfEntries(std::size_t begin, std::size_t end) const {
    Extremes result;
    while (begin < end) {
        const SampleBlock& block = *_blocks[begin / SampleBlock::capacity];
        const std::size_t first = begin % SampleBlock::capacity;
        const std::size_t last = std::min(first + (end - begin), block.size());
        result.add(block.extremes(first, last));
        begin += last - first;
    }
    return result;
}

bool SampleRing::isGapAfter(std::size_t index) const {
    if (index + 1 >= _size)
        return true;
    const Sample here = entry(index);
    const Sample next = entry(index + 1);
    return std::isnan(here.value) || std::isnan(next.value) || next.time_ns - here.time_ns > _gapLimit_ns;
}

std::size_t SampleRing::gapCount(std::int64_t begin_ns, std::int64_t end_ns) const {
    std::size_t count = 0;
    std::optional<Sample> last;
    bool isAfterMark = false;
    const std::size_t end = countBefore(end_ns);
    for (std::size_t index = countBefore(begin_ns); index < end; ++index) {
        const Sample here = entry(index);
        if (std::isnan(here.value)) {
            isAfterMark = true;
            continue;
        }
        if (last && (isAfterMark || here.time_ns - last->time_ns > _gapLimit_ns))
            ++count;
        last = here;
        isAfterMark = false;
    }
    return count;
}

std::optional<std::int64_t> SampleRing::oldest_ns() const {
    return _size == 0 ? std::nullopt : std::optional(_blocks.front()->timeAt(0));
}

std::optional<std::int64_t> SampleRing::newest_ns() const {
    return _size == 0 ? std::nullopt : std::optional(_blocks.back()->timeAt(_blocks.back()->size() - 1));
}

} // namespace velmora
