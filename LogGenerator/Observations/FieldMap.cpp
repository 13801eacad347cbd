// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Observations/FieldMap.h"

#include "LogGenerator/Observations/PhysicalValue.h"
#include "LogGenerator/Observations/WantedLeaves.h"

#include <algorithm>
#include <functional>
#include <iterator>

namespace velmora {

namespace {

bool isBefore(const FieldMap::Entry& a, const List* list, const Field* field) {
    return a.list != list ? std::less<>()(a.list, list) : std::less<>()(a.field, field);
}

/// Whether the telephony service may supply a dictionary or an array, whose leaves messages name.
bool mayBeTree(const Field& field) {
    return field.place.isComputed() && field.format.kind == TextFormat::Kind::Text;
}

FieldMap::TableEntry tableEntry(const FieldMap::Entry& entry) {
    const Field& field = *entry.field;
    const std::optional<ShownLine> line =
        entry.kind == ObservedKind::Number ? shownLine(field) : std::nullopt;
    return {field.place,
            field.format.hasSpecial,
            entry.kind,
            line.has_value(),
            field.format.specialValue,
            line ? line->scale : 0,
            line ? line->offset : 0,
            entry.scale,
            entry.offset,
            entry.node->leaf(),
            entry.source,
            entry.field};
}

} // namespace

void FieldMap::sort() {
    // A field under several labels keeps the order in which these were added.
    std::stable_sort(_entries.begin(), _entries.end(),
                     [](const Entry& a, const Entry& b) { return isBefore(a, b.list, b.field); });
    _wanted = _entries;
    _tables.clear();
    _codes.reset();
}

void FieldMap::setWanted(const WantedLeaves& wanted) {
    const auto isWanted = [&wanted](const auto& each) { return wanted.hasAnyAt(*each.node); };
    _wanted.clear();
    std::copy_if(_entries.begin(), _entries.end(), std::back_inserter(_wanted),
                 [&](const Entry& each) { return isWanted(each) || mayBeTree(*each.field); });
    _wantedLists.clear();
    std::copy_if(_lists.begin(), _lists.end(), std::back_inserter(_wantedLists), isWanted);
    _tables.clear();
    _expected = 0;
    _codes = wantedCodes();
}

std::vector<std::uint32_t> FieldMap::wantedCodes() const {
    std::vector<std::uint32_t> codes;
    for (const Entry& each : _wanted)
        codes.push_back(each.source->code);
    // A record that has no wanted field of a list replaces it all the same.
    for (const Entry& each : _entries)
        if (std::any_of(_wantedLists.begin(), _wantedLists.end(),
                        [&each](const ListEntry& list) { return list.list == each.list; }))
            codes.push_back(each.source->code);
    std::sort(codes.begin(), codes.end());
    codes.erase(std::unique(codes.begin(), codes.end()), codes.end());
    return codes;
}

std::span<const FieldMap::Entry> FieldMap::find(const List* list, const Field& field) const {
    std::size_t first = _expected;
    if (first >= _wanted.size() || _wanted[first].list != list || _wanted[first].field != &field) {
        const auto found = std::lower_bound(
            _wanted.begin(), _wanted.end(), &field,
            [list](const Entry& entry, const Field* wanted) { return isBefore(entry, list, wanted); });
        first = static_cast<std::size_t>(found - _wanted.begin());
    }
    std::size_t end = first;
    while (end < _wanted.size() && _wanted[end].list == list && _wanted[end].field == &field)
        ++end;
    _expected = end;
    return {_wanted.data() + first, end - first};
}

std::span<const FieldMap::TableEntry> FieldMap::addTable(const List* list, const Layout& layout,
                                                         std::uint32_t code) const {
    Table& table = _tables.emplace_back(Table{list, layout.fields, code, {}});
    for (const Field& field : layout.fields)
        for (const Entry& entry : find(list, field))
            if (entry.source->code == code)
                table.entries.push_back(tableEntry(entry));
    return table.entries;
}

const CatalogueField* FieldMap::leafOf(std::string_view label) const {
    for (const Entry& entry : _wanted)
        if (!entry.list && entry.field->label == label)
            return entry.node->leaf();
    return nullptr;
}

std::span<const FieldMap::ListEntry> FieldMap::findList(const List* outer, const List& list) const {
    const auto matches = [outer, &list](const ListEntry& entry) {
        return entry.outer == outer && entry.list == &list;
    };
    const auto first = std::find_if(_wantedLists.begin(), _wantedLists.end(), matches);
    const auto end = std::find_if_not(first, _wantedLists.end(), matches);
    return {first, end};
}

} // namespace velmora
