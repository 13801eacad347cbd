// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "PropertyLists/FrozenCopies.h"
#include "PropertyLists/LaterWriting.h"

#include <array>
#include <chrono>
#include <concepts>
#include <cstdint>
#include <memory>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <unordered_map>
#include <variant>
#include <vector>

namespace velmora {

class Array;
class Dictionary;
using ArrayRef = std::shared_ptr<Array>;
using DictionaryRef = std::shared_ptr<Dictionary>;

/// The kinds of value; none is the kind of a Value that holds nothing.
enum class ValueKind : std::uint8_t { None, String, Integer, Real, Boolean, Date, Data, Array, Dictionary };

/// A point in time as a property list carries it: whole seconds, UTC.
using Date = std::chrono::sys_seconds;

/// A property-list value: string, integer, real, boolean, date, data, array, dictionary, or none.
///
/// Scalars are held by value. Arrays and dictionaries are shared by reference: copying the Value gives a
/// second reference to the same node, so that a decoder section and the display hold the same object.
/// `copy()` gives an independent one. Main thread only, as everything that holds nodes.
class Value {
public:
    using Kind = ValueKind;

    Value() = default;
    Value(std::string text) : _held(std::move(text)) {}
    Value(std::string_view text) : _held(std::string(text)) {}
    Value(const char* text) : _held(std::string(text)) {}
    Value(std::same_as<bool> auto boolean) : _held(static_cast<bool>(boolean)) {}
    template <std::integral Integer>
    requires(!std::same_as<Integer, bool> && !std::same_as<Integer, char>) Value(Integer integer)
        : _held(static_cast<std::int64_t>(integer)) {}
    Value(double real) : _held(real) {}
    Value(Date date) : _held(date) {}
    Value(Data data) : _held(std::move(data)) {}
    Value(ArrayRef array);
    Value(DictionaryRef dictionary);

    [[nodiscard]] Kind kind() const { return static_cast<Kind>(_held.index()); }
    [[nodiscard]] bool isNone() const { return kind() == Kind::None; }

    /// Each gives the held value, or null where the value is of another kind. Nothing is converted.
    [[nodiscard]] const std::string* asString() const { return std::get_if<std::string>(&_held); }
    [[nodiscard]] const std::int64_t* asInteger() const { return std::get_if<std::int64_t>(&_held); }
    [[nodiscard]] const double* asReal() const { return std::get_if<double>(&_held); }
    [[nodiscard]] const bool* asBoolean() const { return std::get_if<bool>(&_held); }
    [[nodiscard]] const Date* asDate() const { return std::get_if<Date>(&_held); }
    [[nodiscard]] const Data* asData() const { return std::get_if<Data>(&_held); }
    /// The shared node itself, which may be changed through the pointer unless it is frozen.
    [[nodiscard]] Array* asArray() const;
    [[nodiscard]] Dictionary* asDictionary() const;
    /// As above, with a share in the ownership; null where the value is of another kind.
    [[nodiscard]] ArrayRef arrayRef() const;
    [[nodiscard]] DictionaryRef dictionaryRef() const;

    /// An independent, deep, frozen copy. Strings are copied, data is shared (it cannot change), and so are
    /// the copies of nodes that have not changed since their last one.
    [[nodiscard]] Value copy() const;

    /// Makes this a string with the given text; a string that is there already keeps its storage.
    void setText(std::string_view text);

    /// Deep equality: same kind, same content; arrays in order, dictionaries in any order.
    friend bool operator==(const Value& a, const Value& b);

private:
    friend class Array;
    friend class Dictionary;
    [[nodiscard]] bool isNode() const { return kind() >= Kind::Array; }
    /// Becomes a copy of the other, in the storage that is there.
    void assignCopy(const Value& other);
    /// Whether that would change nothing.
    [[nodiscard]] bool isCopyOf(const Value& other) const;

    std::variant<std::monostate, std::string, std::int64_t, double, bool, Date, Data, ArrayRef, DictionaryRef>
        _held;
};

/// The name of a kind as messages show it ("string", "array" ...).
[[nodiscard]] std::string_view nameOf(Value::Kind kind);

/// An ordered list of values. A frozen array (one made by `Value::copy`) throws std::logic_error when
/// changed.
class Array {
public:
    Array() = default;
    Array(std::initializer_list<Value> values) : _values(values) {}

    [[nodiscard]] std::size_t size() const { return written().size(); }
    [[nodiscard]] bool empty() const { return written().empty(); }
    /// Precondition: index < size().
    [[nodiscard]] const Value& operator[](std::size_t index) const { return written()[index]; }
    [[nodiscard]] auto begin() const { return written().begin(); }
    [[nodiscard]] auto end() const { return written().end(); }

    void append(Value value);
    /// Appends a dictionary without entries, to be filled in. While elements are written anew (`writeLater`)
    /// it is the one that stood in its place before, unless somebody else holds that: a list that is looked
    /// at after each record takes no more memory than its rows.
    Dictionary& appendRow();
    void clear();
    /// Removes the first `count` values (all of them where there are fewer).
    void removeFirst(std::size_t count);
    void reserve(std::size_t count) { _values.reserve(count); }
    /// Has the elements made of the bytes, in place of those that are there, when somebody looks for them.
    void writeLater(const Writing<Array>& writing, Bytes bytes);

    [[nodiscard]] bool isFrozen() const { return _frozen; }

private:
    friend class Value;
    /// The elements, after what was to be written later has been.
    const std::vector<Value>& written() const {
        if (_later.isDue())
            writeNow();
        return _values;
    }
    void writeNow() const;
    [[nodiscard]] ArrayRef frozenCopy() const;
    [[nodiscard]] bool isCopy(const Array& copy) const;
    void becomeCopyOf(const Array& source);
    void expectMutable() const;

    /// What a writing has left of the elements before. A copy of the array starts without any.
    struct Spent {
        Spent() = default;
        Spent(const Spent&) noexcept {}
        Spent& operator=(const Spent&) noexcept { return *this; }
        ~Spent() = default;

        std::vector<Value> values;
    };

    std::vector<Value> _values;
    Spent _spent;
    LaterWriting<Array> _later;
    std::uint64_t _changes = 0; ///< counts every change
    mutable FrozenCopies<Array> _copies;
    bool _frozen = false;
};

/// String keys to values, kept in the order in which the keys were first set: templates and records are
/// written in reading order, and so the screens show them. A frozen dictionary throws std::logic_error when
/// changed. Look-up is linear while there are few keys and hashed from then on.
class Dictionary {
public:
    struct Entry {
        std::string key;
        Value value;
    };

    Dictionary() = default;
    /// A copy is made even where the other could be taken over, whose number of entries must stay true.
    Dictionary(const Dictionary&) = default;
    Dictionary& operator=(const Dictionary&) = default;
    ~Dictionary() = default;
    /// Sets each entry in turn, so that a key given twice keeps its first place and its last value.
    Dictionary(std::initializer_list<Entry> entries);

    [[nodiscard]] std::size_t size() const { return written().size(); }
    [[nodiscard]] bool empty() const { return written().empty(); }
    [[nodiscard]] auto begin() const { return written().begin(); }
    [[nodiscard]] auto end() const { return written().end(); }

    /// The value under `key`, or null. Valid until the dictionary is changed.
    [[nodiscard]] const Value* find(std::string_view key) const;
    [[nodiscard]] bool contains(std::string_view key) const { return find(key) != nullptr; }
    /// The value under `key`, or none.
    [[nodiscard]] const Value& operator[](std::string_view key) const;

    /// Stores the value; a key that is already there keeps its place in the order.
    void set(std::string_view key, Value value);
    /// `set` with a string, without giving up the storage of one that is there already.
    void setText(std::string_view key, std::string_view text);
    /// `setText` without looking for the key. Precondition: there is no such key yet.
    void addText(std::string_view key, std::string_view text);
    void reserve(std::size_t count) { _entries.reserve(count); }
    /// Whether there was such a key.
    bool remove(std::string_view key);
    /// Removes all entries. Their storage stays for those that are set next, which are best set in the same
    /// order.
    void clear();
    /// Has the bytes written, as all that is set before and after would have it, when somebody looks for
    /// values. The first time, when the keys may not be there yet, they are written at once.
    void writeLater(const Writing<Dictionary>& writing, Bytes bytes);
    /// Has the key removed, likewise. For one key of a dictionary that comes and goes; a second one is
    /// removed at once, since the order in which several come back could not be told later.
    void removeLater(std::string_view key);

    [[nodiscard]] bool isFrozen() const { return _frozen; }

private:
    friend class Value;
    struct Hash {
        using is_transparent = void;
        std::size_t operator()(std::string_view key) const { return std::hash<std::string_view>{}(key); }
    };
    static constexpr std::uint64_t neverChanged = ~std::uint64_t{0};
    struct Later : LaterWriting<Dictionary> {
        bool hasKeys = false; ///< all its keys have been set and none has been removed, but for `removeLater`
    };

    /// The entries, after what was to be written later has been.
    std::span<const Entry> written() const {
        if (_due)
            writeNow();
        return entries();
    }
    [[nodiscard]] std::span<const Entry> entries() const { return {_entries.data(), _count}; }
    [[nodiscard]] std::span<Entry> entries() { return {_entries.data(), _count}; }
    void writeNow() const;
    [[nodiscard]] DictionaryRef frozenCopy() const;
    [[nodiscard]] bool isCopy(const Dictionary& copy) const;
    void becomeCopyOf(const Dictionary& source);
    static constexpr std::size_t nowhere = ~std::size_t{0};
    /// The key's place in `_entries`, or nowhere.
    [[nodiscard]] std::size_t indexOf(std::string_view key) const;
    Value& slot(std::string_view key);
    Value& add(std::string_view key);
    void erase(std::size_t index);
    /// What `removeLater` has done later: the bytes are the key.
    static void eraseKey(Dictionary& dictionary, Bytes key, const void*);
    void rebuildIndex();
    void expectMutable() const;

    std::vector<Entry> _entries; ///< and behind the first `_count` of them what `clear` has left
    std::size_t _count = 0;
    /// Where keys were found last, by where in memory they stood when they were asked for: most are constants
    /// and asked for again and again. Hints only.
    mutable std::array<std::uint8_t, 16> _found{};
    /// Key to place in `_entries`; empty while there are few entries.
    std::unordered_map<std::string, std::size_t, Hash, std::equal_to<>> _index;
    std::vector<Later> _later;
    bool _due = false;        ///< some of them are to be written yet
    bool _holdsNodes = false; ///< an array or dictionary has been set at some time
    bool _frozen = false;
    std::uint64_t _changes = 0;                  ///< counts every change
    std::uint64_t _entriesChanged = 0;           ///< what it was when the entries last changed
    std::uint64_t _keysChanged = 0;              ///< what it was when the keys last changed
    std::uint64_t _copiedEntries = neverChanged; ///< in a frozen copy: the source's `_entriesChanged`
    std::uint64_t _copiedKeys = neverChanged;    ///< in a frozen copy: the source's `_keysChanged`
    mutable FrozenCopies<Dictionary> _copies;
};

[[nodiscard]] inline ArrayRef makeArray() {
    return std::make_shared<Array>();
}
[[nodiscard]] inline DictionaryRef makeDictionary() {
    return std::make_shared<Dictionary>();
}

} // namespace velmora
