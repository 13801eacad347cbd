// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"

#include <cstddef>
#include <functional>
#include <initializer_list>
#include <memory>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

namespace velmora {

/// String keys to values, kept in the order in which the keys were first set: templates and records are
/// written in reading order, and so the screens show them. A frozen dictionary (one made by `Value::copy`)
/// throws std::logic_error when changed. Look-up is linear while there are few keys and hashed from then on.
class Dictionary {
public:
    struct Entry {
        std::string key;
        Value value;
    };

    Dictionary() = default;
    /// Sets each entry in order, so that a repeated key keeps its first position and its last value.
    Dictionary(std::initializer_list<Entry> entries);

    [[nodiscard]] std::size_t size() const { return _entries.size(); }
    [[nodiscard]] bool empty() const { return _entries.empty(); }
    [[nodiscard]] auto begin() const { return _entries.begin(); }
    [[nodiscard]] auto end() const { return _entries.end(); }

    /// The value under `key`, or null. Valid until the dictionary is changed.
    [[nodiscard]] const Value* find(std::string_view key) const;
    [[nodiscard]] bool contains(std::string_view key) const { return find(key) != nullptr; }
    /// The value under `key`, or none.
    [[nodiscard]] const Value& operator[](std::string_view key) const;

    /// Stores the value; a key that is already there keeps its position in the order.
    void set(std::string_view key, Value value);
    /// `set` with a string, without giving up the storage of one that is there already.
    void setText(std::string_view key, std::string_view text);
    /// The value under `key`, to be changed; none for a key that was not there.
    [[nodiscard]] Value& slot(std::string_view key);
    /// The value of the entry at `index`, to be changed, for writing all entries again in order: an entry of
    /// another key at that index is removed with all after it. Precondition: index <= size(), and no earlier
    /// entry has that key.
    [[nodiscard]] Value& slotAt(std::size_t index, std::string_view key);
    /// Removes all entries from `count` on.
    void truncate(std::size_t count);
    /// Whether there was such a key.
    bool remove(std::string_view key);
    void clear() { truncate(0); }
    void reserve(std::size_t count) { _entries.reserve(count); }

    /// A deep, frozen copy.
    [[nodiscard]] DictionaryRef frozenCopy() const;
    [[nodiscard]] bool isFrozen() const { return _frozen; }

private:
    struct Hash {
        using is_transparent = void;
        std::size_t operator()(std::string_view key) const { return std::hash<std::string_view>{}(key); }
    };
    static constexpr std::size_t nowhere = ~std::size_t{0};

    /// The key's index in `_entries`, or nowhere.
    [[nodiscard]] std::size_t indexOf(std::string_view key) const;
    Value& add(std::string_view key);
    void rebuildIndex();
    void expectMutable() const;

    std::vector<Entry> _entries;
    /// Key to index in `_entries`; empty while there are few entries.
    std::unordered_map<std::string, std::size_t, Hash, std::equal_to<>> _index;
    /// The index after the entry set last: a table is written in order, so its next key is usually there.
    std::size_t _next = 0;
    bool _frozen = false;
};

[[nodiscard]] inline DictionaryRef makeDictionary() {
    return std::make_shared<Dictionary>();
}

} // namespace velmora
