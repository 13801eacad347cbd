// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/Value.h"

#include <algorithm>
#include <limits>
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

/// Precondition: no key is to come or go yet.
std::size_t Dictionary::indexOf(std::string_view key) const {
    // Neighbouring addresses go to places far from each other (multiplicative hashing by the golden ratio).
    constexpr std::uint64_t goldenRatio = 0x9E3779B97F4A7C15;
    const auto address = static_cast<std::uint64_t>(reinterpret_cast<std::uintptr_t>(key.data()));
    std::uint8_t& hint = _found[address * goldenRatio >> 60];
    static_assert(sizeof _found == 16);
    if (hint < _count && _entries[hint].key == key)
        return hint;
    std::size_t index = 0;
    if (!_index.empty()) {
        const auto found = _index.find(key);
        if (found == _index.end())
            return nowhere;
        index = found->second;
    } else {
        while (index < _count && _entries[index].key != key)
            ++index;
        if (index == _count)
            return nowhere;
    }
    if (index <= std::numeric_limits<std::uint8_t>::max())
        hint = static_cast<std::uint8_t>(index);
    return index;
}

const Value* Dictionary::find(std::string_view key) const {
    static_cast<void>(written());
    const std::size_t index = indexOf(key);
    return index != nowhere ? &_entries[index].value : nullptr;
}

const Value& Dictionary::operator[](std::string_view key) const {
    const Value* value = find(key);
    return value ? *value : noValue();
}

/// The value under the key, which is there afterwards.
Value& Dictionary::slot(std::string_view key) {
    expectMutable();
    static_cast<void>(written());
    if (const std::size_t index = indexOf(key); index != nowhere)
        return _entries[index].value;
    return add(key);
}

/// A new entry, whose value is yet to be set: it may be what `clear` has left.
Value& Dictionary::add(std::string_view key) {
    if (_count == _entries.size())
        _entries.push_back({std::string(key), Value()});
    else if (_entries[_count].key != key)
        _entries[_count].key = key;
    ++_count;
    _keysChanged = ++_changes;
    if (!_index.empty())
        _index.emplace(key, _count - 1);
    else if (_count >= indexedFrom)
        rebuildIndex();
    return _entries[_count - 1].value;
}

void Dictionary::addText(std::string_view key, std::string_view text) {
    expectMutable();
    static_cast<void>(written());
    add(key).setText(text);
    _entriesChanged = ++_changes;
}

void Dictionary::set(std::string_view key, Value value) {
    _holdsNodes = _holdsNodes || value.isNode();
    slot(key) = std::move(value);
    _entriesChanged = ++_changes;
}

void Dictionary::setText(std::string_view key, std::string_view text) {
    Value& value = slot(key);
    if (const std::string* present = value.asString(); present && *present == text)
        return;
    value.setText(text);
    _entriesChanged = ++_changes;
}

bool Dictionary::remove(std::string_view key) {
    expectMutable();
    static_cast<void>(written());
    const std::size_t index = indexOf(key);
    if (index == nowhere)
        return false;
    erase(index);
    for (Later& later : _later)
        later.hasKeys = false;
    return true;
}

void Dictionary::clear() {
    expectMutable();
    for (Later& later : _later) {
        later.turn = 0;
        later.hasKeys = false;
    }
    _due = false;
    _count = 0;
    _index.clear();
    _keysChanged = _entriesChanged = ++_changes;
}

void Dictionary::erase(std::size_t index) {
    _entries.erase(_entries.begin() + static_cast<std::ptrdiff_t>(index));
    --_count;
    rebuildIndex();
    _keysChanged = _entriesChanged = ++_changes;
}

void Dictionary::eraseKey(Dictionary& dictionary, Bytes key, const void*) {
    const std::size_t index = dictionary.indexOf({reinterpret_cast<const char*>(key.data()), key.size()});
    if (index != nowhere)
        dictionary.erase(index);
}

void Dictionary::removeLater(std::string_view key) {
    expectMutable();
    const Writing<Dictionary> writing{eraseKey, nullptr};
    const Bytes bytes(reinterpret_cast<const std::uint8_t*>(key.data()), key.size());
    auto later = std::find_if(_later.begin(), _later.end(),
                              [&writing](const Later& known) { return known.writing == writing; });
    if (later == _later.end()) {
        later = _later.insert(later, Later{{writing, {}, 0}, true});
    } else if (!std::equal(bytes.begin(), bytes.end(), later->bytes.begin(), later->bytes.end())) {
        remove(key);
        return;
    }
    later->ask(writing, bytes, ++_changes);
    _due = true;
}

void Dictionary::writeLater(const Writing<Dictionary>& writing, Bytes bytes) {
    expectMutable();
    auto later = std::find_if(_later.begin(), _later.end(),
                              [&writing](const Later& known) { return known.writing == writing; });
    if (later != _later.end() && later->hasKeys) {
        // What the writing was asked to write before is written over, wherever in the order that stood.
        later->ask(writing, bytes, ++_changes);
        _due = true;
        return;
    }
    static_cast<void>(written());
    writing.write(*this, bytes, writing.table);
    if (later == _later.end())
        later = _later.insert(later, Later{{writing, {}, 0}, false});
    later->hasKeys = true;
}

void Dictionary::writeNow() const {
    // What is observed does not change, only how it is held. No node is a constant object.
    auto& self = const_cast<Dictionary&>(*this);
    const bool frozen = std::exchange(self._frozen, false);
    const std::uint64_t changes = _changes;
    self._due = false;
    self._copiedEntries = neverChanged;
    self._copiedKeys = neverChanged;
    const auto isEarlier = [](const Later& a, const Later& b) { return a.turn - 1 < b.turn - 1; };
    try {
        for (;;) {
            // Those that have been written come last.
            const auto next = std::min_element(self._later.begin(), self._later.end(), isEarlier);
            if (!next->isDue())
                break;
            next->writing.write(self, next->bytes, next->writing.table);
            next->turn = 0;
        }
        if (frozen)
            for (Entry& entry : self.entries())
                if (entry.value.isNode())
                    entry.value = entry.value.copy();
    } catch (...) {
        self._due = true; // memory was short: it stays to be written
        self._frozen = frozen;
        throw;
    }
    self._frozen = frozen;
    _copies.renumber(changes, _changes);
}

DictionaryRef Dictionary::frozenCopy() const {
    if (const DictionaryRef& latest = _copies.latest(_changes); latest && isCopy(*latest))
        return latest;
    const DictionaryRef& copy = _copies.next();
    copy->becomeCopyOf(*this);
    _copies.finish(_changes);
    return copy;
}

/// As for an array.
bool Dictionary::isCopy(const Dictionary& copy) const {
    return !_holdsNodes || std::equal(entries().begin(), entries().end(), copy.entries().begin(),
                                      copy.entries().end(), [](const Entry& entry, const Entry& other) {
                                          return other.value.isCopyOf(entry.value);
                                      });
}

void Dictionary::becomeCopyOf(const Dictionary& source) {
    if (_copiedKeys != source._keysChanged) {
        _copiedKeys = neverChanged; // for when memory is short on the way
        _entries.resize(std::max(_entries.size(), source._count));
        _count = source._count;
        for (std::size_t i = 0; i < _count; ++i) {
            _entries[i].key = source._entries[i].key;
            _entries[i].value.assignCopy(source._entries[i].value);
        }
        rebuildIndex();
    } else if (_copiedEntries != source._entriesChanged || source._holdsNodes) {
        for (std::size_t i = 0; i < _count; ++i)
            _entries[i].value.assignCopy(source._entries[i].value);
    }
    _copiedKeys = source._keysChanged;
    _copiedEntries = source._entriesChanged;
    _holdsNodes = source._holdsNodes;
    _due = source._due;
    _later.resize(source._later.size());
    for (std::size_t i = 0; i < _later.size(); ++i) {
        const Later& later = source._later[i];
        if (later.isDue())
            _later[i].ask(later.writing, later.bytes, later.turn);
        else
            _later[i].turn = 0;
    }
    _frozen = true;
}

void Dictionary::rebuildIndex() {
    _index.clear();
    if (_count < indexedFrom)
        return;
    for (std::size_t i = 0; i < _count; ++i)
        _index.emplace(_entries[i].key, i);
}

void Dictionary::expectMutable() const {
    if (_frozen)
        throw std::logic_error("a frozen dictionary cannot be changed");
}

} // namespace velmora
