#include "Platform/Value.h"

#include <algorithm>
#include <stdexcept>

namespace velmora {

namespace {

/// Below this many entries comparing keys one by one beats hashing them.
constexpr std::size_t indexedFrom = 17;

const Value& noValue() {
    static const Value none;
    return none;
}

} // namespace

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
    if (const Array* array = asArray()) {
        // What is frozen holds nothing that can change, so a copy of a copy is the copy itself.
        if (array->_frozen)
            return *this;
        auto result = makeArray();
        result->_values.reserve(array->size());
        for (const Value& value : *array)
            result->_values.push_back(value.copy());
        result->_frozen = true;
        return result;
    }
    if (const Dictionary* dictionary = asDictionary()) {
        if (dictionary->_frozen)
            return *this;
        auto result = makeDictionary();
        result->_entries.reserve(dictionary->size());
        for (const Dictionary::Entry& entry : *dictionary)
            result->_entries.push_back({entry.key, entry.value.copy()});
        result->rebuildIndex();
        result->_frozen = true;
        return result;
    }
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

void Array::append(Value value) {
    expectMutable();
    _values.push_back(std::move(value));
}

void Array::clear() {
    expectMutable();
    _values.clear();
}

void Array::removeFirst(std::size_t count) {
    expectMutable();
    _values.erase(_values.begin(),
                  _values.begin() + static_cast<std::ptrdiff_t>(std::min(count, _values.size())));
}

void Array::expectMutable() const {
    if (_frozen)
        throw std::logic_error("a frozen array cannot be changed");
}

Dictionary::Dictionary(std::initializer_list<Entry> entries) {
    for (const Entry& entry : entries)
        set(entry.key, entry.value);
}

std::optional<std::size_t> Dictionary::indexOf(std::string_view key) const {
    if (!_index.empty()) {
        const auto found = _index.find(key);
        if (found == _index.end())
            return std::nullopt;
        return found->second;
    }
    for (std::size_t i = 0; i < _entries.size(); ++i)
        if (_entries[i].key == key)
            return i;
    return std::nullopt;
}

const Value* Dictionary::find(std::string_view key) const {
    const auto index = indexOf(key);
    return index ? &_entries[*index].value : nullptr;
}

const Value& Dictionary::operator[](std::string_view key) const {
    const Value* value = find(key);
    return value ? *value : noValue();
}

Value& Dictionary::slot(std::string_view key) {
    expectMutable();
    if (const auto index = indexOf(key))
        return _entries[*index].value;
    _entries.push_back({std::string(key), Value()});
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

bool Dictionary::remove(std::string_view key) {
    expectMutable();
    const auto index = indexOf(key);
    if (!index)
        return false;
    _entries.erase(_entries.begin() + static_cast<std::ptrdiff_t>(*index));
    rebuildIndex();
    return true;
}

void Dictionary::rebuildIndex() {
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
