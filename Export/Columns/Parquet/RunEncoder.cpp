// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/Parquet/RunEncoder.h"

#include "Export/Columns/Parquet/BitPacking.h"

#include <algorithm>

namespace velmora {

void RunEncoder::put(std::uint32_t value, std::size_t count) {
    // Until it is a run that takes any number at once.
    for (; count > 0 && !(value == _current && _repeats >= groupSize); --count)
        putNext(value);
    _repeats += count;
}

void RunEncoder::put(std::span<const std::uint16_t> values) {
    std::size_t i = 0;
    while (i < values.size()) {
        if (_grouped != 0 || values.size() - i < groupSize) {
            put(values[i++]);
        } else if (_repeats >= groupSize) {
            if (values[i] == _current) {
                ++_repeats;
                ++i;
            } else {
                endRun();
            }
        } else {
            // The next eight are a group of their own.
            const std::span<const std::uint16_t> next = values.subspan(i, groupSize);
            i += groupSize;
            _current = next.back();
            if (std::all_of(next.begin(), next.end(),
                            [this](std::uint16_t value) { return value == _current; })) {
                _repeats = groupSize;
                endPacked();
                continue;
            }
            std::copy(next.begin(), next.end(), _group.begin());
            packGroup();
        }
    }
}

void RunEncoder::putNext(std::uint32_t value) {
    if (value != _current || _repeats == 0) {
        if (_repeats >= groupSize)
            endRun();
        _current = value;
        _repeats = 0;
    }
    ++_repeats;
    _group[_grouped++] = value;
    if (_grouped == groupSize)
        endGroup();
}

/// The group is full: it is either the begin of a run, or packed.
void RunEncoder::endGroup() {
    if (_repeats >= groupSize) {
        endPacked();
        _grouped = 0;
        return;
    }
    packGroup();
}

void RunEncoder::packGroup() {
    if (_packedGroups == 0) {
        _packedHeader = _out.size();
        _out.push_back(0);
    }
    BitPacker packer(_out);
    for (const std::uint32_t value : _group)
        packer.put(value, _width);
    packer.finish();
    _grouped = 0;
    _repeats = 0; // those that are packed begin no run
    if (++_packedGroups == mostGroups)
        endPacked();
}

void RunEncoder::endPacked() {
    if (_packedGroups > 0)
        _out[_packedHeader] = static_cast<std::uint8_t>(_packedGroups << 1 | 1);
    _packedGroups = 0;
}

void RunEncoder::endRun() {
    appendVariable(_out, _repeats << 1);
    for (unsigned bits = 0; bits < _width; bits += 8)
        _out.push_back(static_cast<std::uint8_t>(_current >> bits));
    _repeats = 0;
}

const std::vector<std::uint8_t>& RunEncoder::finish() {
    if (_repeats >= groupSize) {
        endRun();
    } else if (_grouped > 0) {
        std::fill(_group.begin() + static_cast<std::ptrdiff_t>(_grouped), _group.end(), 0);
        _grouped = groupSize;
        _repeats = 0;
        endGroup();
    }
    endPacked();
    return _out;
}

} // namespace velmora
