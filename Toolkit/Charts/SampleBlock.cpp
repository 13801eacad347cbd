// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Charts/SampleBlock.h"

#include <algorithm>

namespace velmora {

void SampleBlock::clear() {
    _size = 0;
    _ofSmall.fill({});
    _ofLarge.fill({});
    _ofAll = {};
}

void SampleBlock::append(std::int64_t time_ns, double value) {
    _times[_size] = time_ns;
    _values[_size] = value;
    _ofSmall[_size / small].add(value);
    _ofLarge[_size / large].add(value);
    _ofAll.add(value);
    ++_size;
}

std::size_t SampleBlock::countBefore(std::int64_t time_ns, bool orAt) const {
    const auto begin = _times.begin();
    const auto end = begin + static_cast<std::ptrdiff_t>(_size);
    const auto found = orAt ? std::upper_bound(begin, end, time_ns) : std::lower_bound(begin, end, time_ns);
    return static_cast<std::size_t>(found - begin);
}

Extremes SampleBlock::extremes(std::size_t begin, std::size_t end) const {
    if (begin == 0 && end == _size)
        return _ofAll;
    Extremes result;
    while (begin < end) {
        if (begin % large == 0 && begin + large <= end) {
            result.add(_ofLarge[begin / large]);
            begin += large;
        } else if (begin % small == 0 && begin + small <= end) {
            result.add(_ofSmall[begin / small]);
            begin += small;
        } else {
            result.add(_values[begin]);
            ++begin;
        }
    }
    return result;
}

} // namespace velmora
