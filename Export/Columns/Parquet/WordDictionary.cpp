// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/Parquet/WordDictionary.h"

namespace velmora {

std::optional<std::uint16_t> WordDictionary::find(std::uint64_t value) {
    if (_slots.size() < 2 * (_values.size() + 1))
        grow();
    const std::size_t slot = slotOf(value);
    if (_slots[slot] == 0) {
        if (_values.size() == mostValues)
            return std::nullopt;
        _values.push_back(value);
        _slots[slot] = static_cast<std::uint16_t>(_values.size());
    }
    _last = value;
    _lastIndex = static_cast<std::uint16_t>(_slots[slot] - 1);
    return _lastIndex;
}

/// The slot that holds the value, or the free one for it.
std::size_t WordDictionary::slotOf(std::uint64_t value) const {
    constexpr std::uint64_t spread = 0x9E3779B97F4A7C15; // 2^64 divided by the golden ratio
    const std::size_t mask = _slots.size() - 1;
    std::size_t slot = static_cast<std::size_t>((value ^ value >> 29) * spread >> 32) & mask;
    while (_slots[slot] != 0 && _values[_slots[slot] - 1U] != value)
        slot = (slot + 1) & mask;
    return slot;
}

void WordDictionary::grow() {
    constexpr std::size_t smallest = 32;
    _slots.assign(_slots.empty() ? smallest : _slots.size() * 2, 0);
    for (std::size_t i = 0; i < _values.size(); ++i)
        _slots[slotOf(_values[i])] = static_cast<std::uint16_t>(i + 1);
}

} // namespace velmora
