// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/Value.h"

#include <algorithm>
#include <utility>

namespace velmora {

std::string_view nameOf(Value::Kind kind) {
    switch (kind) {
    case Value::Kind::None: return "none";
    case Value::Kind::String: return "string";
    case Value::Kind::Integer: return "integer";
    case Value::Kind::Real: return "real";
    case Value::Kind::Boolean: return "boolean";
    case Value::Kind::Date: return "date";
    case Value::Kind::Data: return "data";
    case Value::Kind::Array: return "array";
    case Value::Kind::Dictionary: return "dictionary";
    }
    return "none";
}

Value::Value(ArrayRef array) {
    if (array)
        _held = std::move(array);
}

Value::Value(DictionaryRef dictionary) {
    if (dictionary)
        _held = std::move(dictionary);
}

Array* Value::asArray() const {
    const auto* array = std::get_if<ArrayRef>(&_held);
    return array ? array->get() : nullptr;
}

Dictionary* Value::asDictionary() const {
    const auto* dictionary = std::get_if<DictionaryRef>(&_held);
    return dictionary ? dictionary->get() : nullptr;
}

ArrayRef Value::arrayRef() const {
    const auto* array = std::get_if<ArrayRef>(&_held);
    return array ? *array : nullptr;
}

DictionaryRef Value::dictionaryRef() const {
    const auto* dictionary = std::get_if<DictionaryRef>(&_held);
    return dictionary ? *dictionary : nullptr;
}

bool Value::isOnlyReference() const {
    if (const auto* array = std::get_if<ArrayRef>(&_held))
        return array->use_count() == 1;
    const auto* dictionary = std::get_if<DictionaryRef>(&_held);
    return dictionary && dictionary->use_count() == 1;
}

Value Value::copy() const {
    // What is frozen holds nothing that can change, so a copy of a copy is the copy itself.
    if (const Array* array = asArray(); array && !array->isFrozen())
        return array->frozenCopy();
    if (const Dictionary* dictionary = asDictionary(); dictionary && !dictionary->isFrozen())
        return dictionary->frozenCopy();
    return *this;
}

void Value::setText(std::string_view text) {
    if (auto* string = std::get_if<std::string>(&_held))
        string->assign(text);
    else
        _held.emplace<std::string>(text);
}

bool operator==(const Value& a, const Value& b) {
    if (a.kind() != b.kind())
        return false;
    if (const Array* left = a.asArray()) {
        const Array* right = b.asArray();
        return left == right || std::equal(left->begin(), left->end(), right->begin(), right->end());
    }
    if (const Dictionary* left = a.asDictionary()) {
        const Dictionary* right = b.asDictionary();
        if (left == right)
            return true;
        return left->size() == right->size() &&
               std::all_of(left->begin(), left->end(), [right](const Dictionary::Entry& entry) {
                   const Value* other = right->find(entry.key);
                   return other && entry.value == *other;
               });
    }
    return a._held == b._held;
}

} // namespace velmora
