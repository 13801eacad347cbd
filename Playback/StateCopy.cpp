// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Playback/StateCopy.h"

#include <utility>

namespace velmora {

namespace {

/// What a node costs beside its entries: its control block and the allocator's own bytes.
constexpr std::size_t nodeOverhead = 64;
constexpr std::size_t allocationOverhead = 16;

std::size_t storageOf(const std::string& text) {
    return text.size() > std::string().capacity() ? text.size() + allocationOverhead : 0;
}

} // namespace

StateCopy::StateCopy(const Dictionary& state) {
    constexpr std::string_view templateKey = "Template";
    for (const auto& [key, value] : state)
        _copy.set(key, key == templateKey ? value : copyOf(value));
}

Value StateCopy::copyOf(const Value& value) {
    if (const Dictionary* const dictionary = value.asDictionary(); dictionary && !dictionary->isFrozen()) {
        if (const auto found = _copied.find(dictionary); found != _copied.end())
            return found->second;
        return _copied.emplace(dictionary, copyOf(*dictionary)).first->second;
    }
    if (const Array* const array = value.asArray(); array && !array->isFrozen()) {
        if (const auto found = _copied.find(array); found != _copied.end())
            return found->second;
        return _copied.emplace(array, copyOf(*array)).first->second;
    }
    if (const std::string* const text = value.asString())
        _size += storageOf(*text);
    return value;
}

DictionaryRef StateCopy::copyOf(const Dictionary& dictionary) {
    DictionaryRef copy = makeDictionary();
    copy->reserve(dictionary.size());
    _size += nodeOverhead + sizeof(Dictionary) + dictionary.size() * sizeof(Dictionary::Entry);
    for (const auto& [key, value] : dictionary) {
        _size += storageOf(key);
        copy->set(key, copyOf(value));
    }
    return copy;
}

ArrayRef StateCopy::copyOf(const Array& array) {
    ArrayRef copy = makeArray();
    copy->reserve(array.size());
    _size += nodeOverhead + sizeof(Array) + array.size() * sizeof(Value);
    for (const Value& value : array)
        copy->append(copyOf(value));
    return copy;
}

} // namespace velmora
