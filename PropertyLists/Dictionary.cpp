// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/Dictionary.h"

#include <stdexcept>
#include <utility>

namespace velmora {

namespace {

/// Below this many entries comparing keys one by one beats hashing them.
constexpr std::size_t indexedFrom = 17;

const Value& noValue() {
    static const Value none;
    return none;
}

} // namespace

Dictionary::Dictionary(std::initializer_list<Entry> entries) {
    for (const Entry& entry : entries)
        set(entry.key, entry.value);
}

std::size_t Dictionary::indexOf(std::string_view key) const {
    if (!_index.empty()) {
        const auto found = _index.find(key);
        return found == _index.end() ? nowhere : found->second;
    }
    for (std::size_t i = 0; i < _entries.size(); ++i)
        if (_entries[i].key == key)
            return i;
    return nowhere;
}

const Value* Dictionary::find(std::string_view key) const {
    const std::size_t index = indexOf(key);
    return index != nowhere ? &_entries[index].value : nullptr;
}

const Value& Dictionary::operator[](std::string_view key) const {
    const Value* value = find(key);
    return value ? *value : noValue();
}

Value& Dictionary::slot(std::string_view key) {
    expectMutable();
    std::size_t index = _next;
    if (index >= _entries.size() || _entries[index].key != key)
        index = indexOf(key);
    if (index == nowhere)
        return add(key);
    _next = index + 1;
    return _entries[index].value;
}

Value& Dictionary::add(std::string_view key) {
    _entries.push_back({std::string(key), Value()});
    _next = _entries.size();
    if (!_index.empty())
        _index.emplace(key, _entries.size() - 1);
    else if (_entries.size() >= indexedFrom)
        rebuildIndex();
    return _entries.back().value;
}

void Dictionary::set(std::string_view key, Value value) {
    slot(key) = std::move(value);
}

void Dictionary::setText(std::string_view key, std::string_view text) {
    slot(key).setText(text);
}

Value& Dictionary::slotAt(std::size_t index, std::string_view key) {
    expectMutable();
    if (index < _entries.size() && _entries[index].key == key)
        return _entries[index].value;
    truncate(index);
    return add(key);
}

void Dictionary::truncate(std::size_t count) {
    expectMutable();
    if (count >= _entries.size())
        return;
    _entries.erase(_entries.begin() + static_cast<std::ptrdiff_t>(count), _entries.end());
    rebuildIndex();
}

bool Dictionary::remove(std::string_view key) {
    expectMutable();
    const std::size_t index = indexOf(key);
    if (index == nowhere)
        return false;
    _entries.erase(_entries.begin() + static_cast<std::ptrdiff_t>(index));
    rebuildIndex();
    return true;
}

DictionaryRef Dictionary::frozenCopy() const {
    const DictionaryRef copy = makeDictionary();
    copy->_entries.reserve(_entries.size());
    for (const auto& [key, value] : _entries)
        copy->_entries.push_back({key, value.copy()});
    copy->rebuildIndex();
    copy->_frozen = true;
    return copy;
}

void Dictionary::rebuildIndex() {
    if (!_index.empty())
        _index.clear();
    if (_entries.size() < indexedFrom)
        return;
    for (std::size_t i = 0; i < _entries.size(); ++i)
        _index.emplace(_entries[i].key, i);
}

void Dictionary::expectMutable() const {
    if (_frozen)
        throw std::logic_error("a frozen dictionary cannot be changed");
}

} // namespace velmora
