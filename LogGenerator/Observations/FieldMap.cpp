// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Observations/FieldMap.h"

#include <algorithm>
#include <functional>

namespace velmora {

namespace {

bool isBefore(const FieldMap::Entry& a, const List* list, const Field* field) {
    return a.list != list ? std::less<>()(a.list, list) : std::less<>()(a.field, field);
}

} // namespace

void FieldMap::sort() {
    // A field under several labels keeps the order in which these were added.
    std::stable_sort(_entries.begin(), _entries.end(),
                     [](const Entry& a, const Entry& b) { return isBefore(a, b.list, b.field); });
}

std::span<const FieldMap::Entry> FieldMap::find(const List* list, const Field& field) const {
    std::size_t first = _expected;
    if (first >= _entries.size() || _entries[first].list != list || _entries[first].field != &field) {
        const auto found = std::lower_bound(
            _entries.begin(), _entries.end(), &field,
            [list](const Entry& entry, const Field* wanted) { return isBefore(entry, list, wanted); });
        first = static_cast<std::size_t>(found - _entries.begin());
    }
    std::size_t end = first;
    while (end < _entries.size() && _entries[end].list == list && _entries[end].field == &field)
        ++end;
    _expected = end;
    return {_entries.data() + first, end - first};
}

const CatalogueField* FieldMap::leafOf(std::string_view label) const {
    for (const Entry& entry : _entries)
        if (!entry.list && entry.field->label == label)
            return entry.node->leaf();
    return nullptr;
}

std::span<const FieldMap::ListEntry> FieldMap::findList(const List* outer, const List& list) const {
    const auto matches = [outer, &list](const ListEntry& entry) {
        return entry.outer == outer && entry.list == &list;
    };
    const auto first = std::find_if(_lists.begin(), _lists.end(), matches);
    const auto end = std::find_if_not(first, _lists.end(), matches);
    return {first, end};
}

} // namespace velmora
