// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/Parquet/TextDictionary.h"

#include <functional>

namespace velmora {

std::optional<std::uint16_t> TextDictionary::indexOf(std::string_view text) {
    if (!_ends.empty() && at(_last) == text)
        return _last;
    if (_slots.size() < 2 * (count() + 1))
        grow();
    const std::size_t slot = slotOf(text);
    if (_slots[slot] == 0) {
        if (count() == mostTexts || text.size() > mostBytes - _bytes.size())
            return std::nullopt;
        _bytes.append(text);
        _ends.push_back(static_cast<std::uint32_t>(_bytes.size()));
        _slots[slot] = static_cast<std::uint16_t>(count());
    }
    _last = static_cast<std::uint16_t>(_slots[slot] - 1);
    return _last;
}

/// The slot that holds the text, or the free one for it.
std::size_t TextDictionary::slotOf(std::string_view text) const {
    const std::size_t mask = _slots.size() - 1;
    std::size_t slot = std::hash<std::string_view>()(text) & mask;
    while (_slots[slot] != 0 && at(_slots[slot] - 1U) != text)
        slot = (slot + 1) & mask;
    return slot;
}

void TextDictionary::grow() {
    constexpr std::size_t smallest = 32;
    _slots.assign(_slots.empty() ? smallest : _slots.size() * 2, 0);
    for (std::size_t i = 0; i < count(); ++i)
        _slots[slotOf(at(i))] = static_cast<std::uint16_t>(i + 1);
}

} // namespace velmora
