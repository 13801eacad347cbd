// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/Value.h"

#include <algorithm>
#include <stdexcept>
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

// A null reference is no value: every array or dictionary that a Value reports is there.
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

Value Value::copy() const {
    // What is frozen holds nothing that can change, so a copy of a copy is the copy itself.
    if (const Array* array = asArray())
        return array->_frozen ? *this : Value(array->frozenCopy());
    if (const Dictionary* dictionary = asDictionary())
        return dictionary->_frozen ? *this : Value(dictionary->frozenCopy());
    return *this;
}

void Value::assignCopy(const Value& other) {
    if (const std::string* text = other.asString())
        setText(*text);
    else
        *this = other.copy();
}

bool Value::isCopyOf(const Value& other) const {
    if (!other.isNode())
        return true; // whatever changes a scalar is a change of its node
    if (const Array* array = other.asArray())
        return asArray() == (array->_frozen ? array : array->frozenCopy().get());
    const Dictionary* dictionary = other.asDictionary();
    return asDictionary() == (dictionary->_frozen ? dictionary : dictionary->frozenCopy().get());
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

void Array::append(Value value) {
    expectMutable();
    static_cast<void>(written());
    _values.push_back(std::move(value));
    ++_changes;
}

Dictionary& Array::appendRow() {
    expectMutable();
    static_cast<void>(written());
    DictionaryRef row;
    if (_values.size() < _spent.values.size()) {
        auto* const spent = std::get_if<DictionaryRef>(&_spent.values[_values.size()]._held);
        if (spent && *spent && spent->use_count() == 1 && !(*spent)->isFrozen()) {
            row = std::move(*spent);
            row->clear();
        }
    }
    if (!row)
        row = makeDictionary();
    Dictionary& result = *row;
    _values.emplace_back(std::move(row));
    ++_changes;
    return result;
}

void Array::clear() {
    expectMutable();
    _later.turn = 0;
    _values.clear();
    ++_changes;
}

void Array::removeFirst(std::size_t count) {
    expectMutable();
    static_cast<void>(written());
    _values.erase(_values.begin(),
                  _values.begin() + static_cast<std::ptrdiff_t>(std::min(count, _values.size())));
    ++_changes;
}

void Array::writeLater(const Writing<Array>& writing, Bytes bytes) {
    expectMutable();
    _later.ask(writing, bytes, ++_changes);
}

void Array::writeNow() const {
    // What is observed does not change, only how it is held. No node is a constant object.
    auto& self = const_cast<Array&>(*this);
    const std::uint64_t changes = _changes;
    const std::uint64_t turn = std::exchange(self._later.turn, 0);
    const bool frozen = std::exchange(self._frozen, false);
    try {
        // Those that a longer list has left before stay behind them.
        std::vector<Value>& spent = self._spent.values;
        spent.resize(std::max(spent.size(), _values.size()));
        std::move(self._values.begin(), self._values.end(), spent.begin());
        self._values.clear();
        _later.writing.write(self, _later.bytes, _later.writing.table);
        if (frozen)
            for (Value& value : self._values)
                value = value.copy();
    } catch (...) {
        self._later.turn = turn; // memory was short: it stays to be written
        self._frozen = frozen;
        throw;
    }
    self._frozen = frozen;
    _copies.renumber(changes, _changes);
}

ArrayRef Array::frozenCopy() const {
    if (const ArrayRef& latest = _copies.latest(_changes); latest && isCopy(*latest))
        return latest;
    const ArrayRef& copy = _copies.next();
    copy->becomeCopyOf(*this);
    _copies.finish(_changes);
    return copy;
}

/// Whether the copy that was made after the array's last change of its own still shows what is in it.
bool Array::isCopy(const Array& copy) const {
    if (_later.isDue())
        return true;
    return !copy._later.isDue() &&
           std::equal(_values.begin(), _values.end(), copy._values.begin(), copy._values.end(),
                      [](const Value& value, const Value& copied) { return copied.isCopyOf(value); });
}

void Array::becomeCopyOf(const Array& source) {
    if (source._later.isDue()) {
        _later.ask(source._later.writing, source._later.bytes, source._later.turn);
    } else {
        _later.turn = 0;
        _values.resize(source._values.size());
        for (std::size_t i = 0; i < _values.size(); ++i)
            _values[i].assignCopy(source._values[i]);
    }
    _frozen = true;
}

void Array::expectMutable() const {
    if (_frozen)
        throw std::logic_error("a frozen array cannot be changed");
}

} // namespace velmora
