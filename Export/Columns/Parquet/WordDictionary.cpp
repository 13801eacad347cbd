// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/Parquet/WordDictionary.h"

namespace velmora {

std::optional<std::uint16_t> WordDictionary::find(std::uint64_t value) {
    if (_slots.size() < 2 * (_values.size() + 1))
        grow();
    Slot& slot = slotOf(value);
    if (slot.number == 0) {
        if (_values.size() == mostValues)
            return std::nullopt;
        _values.push_back(value);
        slot = {value, static_cast<std::uint32_t>(_values.size())};
    }
    return static_cast<std::uint16_t>(slot.number - 1);
}

/// The slot that holds the value, or the free one for it.
WordDictionary::Slot& WordDictionary::slotOf(std::uint64_t value) {
    std::size_t slot = homeOf(value);
    while (_slots[slot].number != 0 && _slots[slot].value != value)
        slot = (slot + 1) & (_slots.size() - 1);
    return _slots[slot];
}

void WordDictionary::grow() {
    constexpr std::size_t smallest = 32;
    _slots.assign(_slots.empty() ? smallest : _slots.size() * 2, Slot());
    for (std::size_t i = 0; i < _values.size(); ++i)
        slotOf(_values[i]) = {_values[i], static_cast<std::uint32_t>(i + 1)};
}

} // namespace velmora
