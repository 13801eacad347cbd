// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <chrono>
#include <concepts>
#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <variant>

namespace velmora {

class Array;
class Dictionary;
using ArrayRef = std::shared_ptr<Array>;
using DictionaryRef = std::shared_ptr<Dictionary>;

/// The kinds of value; none is the kind of a Value that holds nothing.
enum class ValueKind : std::uint8_t { None, String, Integer, Real, Boolean, Date, Data, Array, Dictionary };

/// A point in time as in a property list: whole seconds, UTC.
using Date = std::chrono::sys_seconds;

/// A property-list value: string, integer, real, boolean, date, data, array, dictionary, or none.
///
/// Scalars are held by value. Arrays and dictionaries are shared by reference: copying the Value makes a
/// second reference to the same node, so that a decoder section and the display hold the same object.
/// `copy()` returns an independent one. Main thread only, as everything that holds nodes.
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
    /// A null reference makes none: every array or dictionary that a Value reports exists.
    Value(ArrayRef array);
    Value(DictionaryRef dictionary);

    [[nodiscard]] Kind kind() const { return static_cast<Kind>(_held.index()); }
    [[nodiscard]] bool isNone() const { return kind() == Kind::None; }

    /// Each returns the held value, or null where the value is of another kind. Nothing is converted.
    [[nodiscard]] const std::string* asString() const { return std::get_if<std::string>(&_held); }
    [[nodiscard]] const std::int64_t* asInteger() const { return std::get_if<std::int64_t>(&_held); }
    [[nodiscard]] const double* asReal() const { return std::get_if<double>(&_held); }
    [[nodiscard]] const bool* asBoolean() const { return std::get_if<bool>(&_held); }
    [[nodiscard]] const Date* asDate() const { return std::get_if<Date>(&_held); }
    [[nodiscard]] const Data* asData() const { return std::get_if<Data>(&_held); }
    /// The shared node itself, which may be modified through the pointer unless it is frozen.
    [[nodiscard]] Array* asArray() const;
    [[nodiscard]] Dictionary* asDictionary() const;
    /// As above, with shared ownership; null where the value is of another kind.
    [[nodiscard]] ArrayRef arrayRef() const;
    [[nodiscard]] DictionaryRef dictionaryRef() const;
    /// Whether this is an array or dictionary that no other reference shares.
    [[nodiscard]] bool isOnlyReference() const;

    /// An independent, deep, frozen copy. Strings are copied; data, which cannot change, and what is frozen
    /// already are shared.
    [[nodiscard]] Value copy() const;

    /// Makes this a string with the given text; a string that is there already keeps its storage.
    void setText(std::string_view text);

    /// Deep equality: same kind, same content; arrays in order, dictionaries in any order.
    friend bool operator==(const Value& a, const Value& b);

private:
    std::variant<std::monostate, std::string, std::int64_t, double, bool, Date, Data, ArrayRef, DictionaryRef>
        _held;
};

/// The name of a kind as messages show it ("string", "array" ...).
[[nodiscard]] std::string_view nameOf(Value::Kind kind);

} // namespace velmora

// A Value is of little use without its nodes, whose types need it to be complete.
#include "PropertyLists/Array.h"
#include "PropertyLists/Dictionary.h"
