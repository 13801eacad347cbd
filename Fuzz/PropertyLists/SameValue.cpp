// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Fuzz/PropertyLists/SameValue.h"

#include <algorithm>
#include <cmath>

namespace velmora {

bool sameValue(const Value& a, const Value& b) {
    if (a.kind() != b.kind())
        return false;
    if (const Array* array = a.asArray()) {
        const Array& other = *b.asArray();
        return std::equal(array->begin(), array->end(), other.begin(), other.end(), sameValue);
    }
    if (const Dictionary* dictionary = a.asDictionary()) {
        const Dictionary& other = *b.asDictionary();
        return dictionary->size() == other.size() &&
               std::all_of(dictionary->begin(), dictionary->end(), [&](const Dictionary::Entry& entry) {
                   const Value* value = other.find(entry.key);
                   return value && sameValue(entry.value, *value);
               });
    }
    if (const double* real = a.asReal(); real && std::isnan(*real))
        return std::isnan(*b.asReal());
    return a == b;
}

} // namespace velmora
