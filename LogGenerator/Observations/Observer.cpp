// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Observations/Observer.h"

#include "LogGenerator/Observations/PhysicalValue.h"
#include "LogGenerator/Observations/TextNumber.h"
#include "PropertyLists/Value.h"

#include <algorithm>
#include <cmath>

namespace velmora {

void Observer::beginMessage() {
    ++_messages;
    _damage = Damage::None;
    _map = nullptr;
    _sections.clear();
    _observations.clear();
    _lists.clear();
    _removed.clear();
    _levels.clear();
    _texts.clear();
    _rows.clear();
    _row = {};
}

bool Observer::beginSection(const FieldMap& map, std::uint32_t code) {
    const std::pair section(&map, code);
    if (std::find(_sections.begin(), _sections.end(), section) != _sections.end())
        return false;
    _sections.push_back(section);
    _map = &map;
    _code = code;
    return true;
}

ObservedMessage Observer::message(Time arrival, std::optional<std::uint32_t> code,
                                  std::optional<std::uint64_t> timestamp) const {
    for (const auto& [map, recordCode] : _sections)
        map->setLatestRecord(arrival);
    return {_messages, arrival, code, timestamp, _observations, _lists, _removed, _damage};
}

template <class Observe>
void Observer::forEachLeaf(const Field& field, Observe observe) {
    beginValue();
    for (const FieldMap::Entry& entry : _map->find(currentList(), field))
        if (entry.source->code == _code && _wanted.has(*entry.node->leaf()))
            observe(entry, add(*entry.node->leaf(), entry.source));
}

template <class Entry>
void Observer::setNumber(const Entry& entry, std::int64_t raw, Observation& observation) {
    const Field& field = *entry.field;
    observation.text = Observation::Text::OfRaw;
    observation.raw = raw;
    if (field.format.hasSpecial && raw == field.format.specialValue)
        return; // absent
    observation.kind = entry.kind;
    if (entry.kind == ObservedKind::Number)
        observation.number = shownNumber(field, raw) * entry.scale + entry.offset;
    else if (entry.kind == ObservedKind::Text)
        setCode(field, codeText(field, raw, _texts), observation);
}

void Observer::fields(const Record& record, const Layout& layout) {
    const List* const list = currentList();
    if (list && list->entries == List::Entries::Values) {
        for (const Field& field : layout.fields)
            number(field, field.place.read(record));
        return;
    }
    tableFields(_map->findAll(list, layout, _code), record);
}

void Observer::tableFields(std::span<const FieldMap::TableEntry> entries, const Record& record) {
    for (const FieldMap::TableEntry& entry : entries) {
        const std::int64_t raw = entry.place.read(record);
        Observation& observation = add(*entry.leaf, entry.source);
        if (!entry.isLine) {
            setNumber(entry, raw, observation);
            continue;
        }
        observation.text = Observation::Text::OfRaw;
        observation.raw = raw;
        if (entry.hasSpecial && raw == entry.specialValue)
            continue; // absent
        observation.kind = ObservedKind::Number;
        observation.number =
            (static_cast<double>(raw) * entry.shownScale + entry.shownOffset) * entry.scale + entry.offset;
    }
}

void Observer::rows(const List& list, const CountedList& entries, const Layout& layout) {
    beginList(list);
    const std::span<const FieldMap::TableEntry> found = _map->findAll(&list, layout, _code);
    const std::size_t count = entries.completeCount();
    for (std::size_t i = 0; i < count && !found.empty(); ++i) {
        beginRow();
        tableFields(found, entries[i]);
        endRow();
    }
    _levels.back().next = static_cast<std::uint32_t>(count);
    endList();
}

void Observer::number(const Field& field, std::int64_t raw) {
    forEachLeaf(field, [&](const FieldMap::Entry& entry, Observation& observation) {
        setNumber(entry, raw, observation);
    });
}

void Observer::real(const Field& field, double value) {
    forEachLeaf(field, [&](const FieldMap::Entry& entry, Observation& observation) {
        observation.text = Observation::Text::OfReal;
        observation.shown = value;
        if (!std::isfinite(value))
            return; // absent
        observation.kind = entry.kind;
        observation.number = value * entry.scale + entry.offset;
    });
}

void Observer::text(const Field& field, std::string_view text) {
    const std::string_view kept = _texts.copy(text);
    forEachLeaf(field, [&](const FieldMap::Entry& entry, Observation& observation) {
        observation.given = kept;
        if (entry.kind != ObservedKind::Text)
            return; // a text in place of the value
        if (field.means.digits != 0) {
            setCode(field, kept, observation);
            return;
        }
        observation.kind = ObservedKind::Text;
        observation.words = kept;
    });
}

void Observer::supplied(const Field& field, const Value& value) {
    beginValue();
    for (const FieldMap::Entry& entry : _map->find(currentList(), field)) {
        if (entry.source->code != _code)
            continue;
        const std::size_t first = _observations.size();
        if (value.asDictionary() || value.asArray()) {
            tree(_map->catalogue(), *entry.node, _map->section(), value);
            setKey(first, entry.node->keys());
        } else {
            leaf(*entry.node->leaf(), value);
        }
        if (_levels.empty()) // the rows of a list go with the list
            removeOthers(*entry.node, first);
    }
}

void Observer::removeOthers(const Catalogue::Node& node, std::size_t first) {
    const auto shown = _observations.begin() + static_cast<std::ptrdiff_t>(first);
    const CatalogueField* const leaf = node.leaf();
    const auto isLeaf = [leaf](const Observation& each) { return each.leaf == leaf; };
    if (leaf && _wanted.has(*leaf) && std::none_of(shown, _observations.end(), isLeaf))
        _removed.push_back(leaf);
    for (const std::unique_ptr<Catalogue::Node>& child : node.children())
        removeOthers(*child, first);
}

void Observer::display(Catalogue& catalogue, const Value& value) {
    tree(catalogue, catalogue.root(), {}, value);
    _displayed.assign(catalogue.fields().size(), false);
    for (const Observation& each : _observations)
        _displayed[each.leaf->index] = true;
    for (std::size_t i = 0; i < _displayedBefore.size(); ++i)
        if (_displayedBefore[i] && !_displayed[i])
            _removed.push_back(&catalogue.fields()[i]);
    std::swap(_displayed, _displayedBefore);
}

void Observer::leaf(const CatalogueField& leaf, const Value& value) {
    if (!_wanted.has(leaf))
        return;
    setSupplied(value, _texts, add(leaf, leaf.sources.empty() ? nullptr : &leaf.sources.front()));
}

void Observer::tree(Catalogue& catalogue, Catalogue::Node& node, std::string_view section,
                    const Value& value) {
    if (const Dictionary* const dictionary = value.asDictionary()) {
        for (const auto& [key, child] : *dictionary)
            if (Catalogue::Node* const place = catalogue.isFull() ? node.find(key) : &node.child(key))
                tree(catalogue, *place, section, child);
    } else if (const Array* const array = value.asArray()) {
        _lists.push_back({&node, static_cast<std::uint32_t>(array->size())});
        const ObservedRows::Numbers outer = _row;
        for (std::size_t i = 0; i < array->size(); ++i) {
            _row = _rows.add(outer, static_cast<std::uint32_t>(i));
            const std::size_t first = _observations.size();
            tree(catalogue, node.rows(), section, (*array)[i]);
            setKey(first, node.rows().keys());
        }
        _row = outer;
    } else if (!value.isNone()) {
        const bool isNew = !node.leaf();
        CatalogueField& shown = catalogue.leafAt(node, section);
        if (isNew && catalogue.readsNumbersFromTexts())
            if (const std::string* const text = value.asString())
                if (const std::optional<TextNumber> number = readTextNumber(*text)) {
                    shown.isReadFromText = true;
                    shown.kind = ObservedKind::Number;
                    shown.unit = number->unit;
                }
        leaf(shown, value);
    }
}

void Observer::removed(std::string_view label) {
    if (const CatalogueField* const leaf = _map->leafOf(label))
        _removed.push_back(leaf);
}

void Observer::beginWhole() {
    _firstOfWhole = _observations.size();
}

void Observer::endWhole() {
    _named.assign(_map->catalogue().fields().size(), false);
    for (std::size_t i = _firstOfWhole; i < _observations.size(); ++i)
        _named[_observations[i].leaf->index] = true;
    for (const FieldMap::Entry& entry : _map->entries()) {
        if (entry.list)
            continue; // goes with the list
        const CatalogueField& leaf = *entry.node->leaf();
        if (!_wanted.has(leaf))
            continue;
        if (!_named[leaf.index] && mayBeShown(leaf))
            _removed.push_back(&leaf);
        setShown(leaf, _named[leaf.index]);
    }
}

void Observer::setShown(const CatalogueField& leaf, bool isShown) {
    if (leaf.index >= _shown.size())
        _shown.resize(leaf.index + 1, true);
    _shown[leaf.index] = isShown;
}

void Observer::beginList(const List& list) {
    _levels.push_back({&list, _row});
}

void Observer::beginValue() {
    if (_levels.empty() || _levels.back().list->entries != List::Entries::Values)
        return;
    Level& level = _levels.back();
    _row = _rows.add(level.outerRow, level.next++);
}

void Observer::beginRow() {
    Level& level = _levels.back();
    _row = _rows.add(level.outerRow, level.next++);
    level.firstOfRow = _observations.size();
}

void Observer::endRow() {
    const Level& level = _levels.back();
    _row = level.outerRow;
    setKey(level.firstOfRow, level.list->keys);
}

void Observer::setKey(std::size_t first, std::span<const std::string_view> names) {
    if (names.empty() || first == _observations.size() || !_wanted.hasRowKeys())
        return;
    _keys.set(std::span(_observations).subspan(first), names, _texts);
}

void Observer::entryNumber(std::size_t, std::uint16_t number) {
    Level& level = _levels.back();
    _row = _rows.add(level.outerRow, number);
    ++level.next;
    if (_wanted.hasRowKeys())
        level.numberKey = _texts.add() = std::to_string(number);
}

void Observer::endList() {
    const Level level = _levels.back();
    _levels.pop_back();
    _row = level.outerRow;
    for (const FieldMap::ListEntry& entry : _map->findList(currentList(), *level.list)) {
        _lists.push_back({entry.node, level.next});
        if (level.next == 0 && !level.list->whenEmpty.empty() && _wanted.has(*entry.node->leaf()))
            add(*entry.node->leaf(), nullptr).given = level.list->whenEmpty;
    }
}

} // namespace velmora
