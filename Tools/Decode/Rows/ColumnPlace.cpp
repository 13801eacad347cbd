// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Rows/ColumnPlace.h"

#include "LogGenerator/Observations/PathPattern.h"
#include "Model/NodePath.h"
#include "Model/VelmoraModelNode.h"

#include <optional>

namespace velmora {

ColumnPlace::ColumnPlace(std::string_view path, const Value& display, std::span<const ChangingPlace> places) {
    const Dictionary* const root = display.asDictionary();
    if (root && path != rootNodePath) {
        look(*root, path, true, places);
        return;
    }
    _isManifold = true;
    dependOnAllIn(display, places);
}

void ColumnPlace::look(const Dictionary& dictionary, std::string_view rest, bool atRoot,
                       std::span<const ChangingPlace> places) {
    if (dictionary.contains(sortedMarker)) {
        _isManifold = true;
        for (const auto& [key, child] : dictionary) {
            dependOn(dictionary, key, places);
            dependOnAllIn(child, places);
        }
        return;
    }
    for (auto entry = dictionary.begin(); entry != dictionary.end(); ++entry) {
        const std::optional<std::string_view> left = PathPattern::after(rest, atRoot, entry->key);
        if (!left)
            continue;
        const Value& child = entry->value;
        if (dependOn(dictionary, entry->key, places)) {
            dependOnAllIn(child, places);
            ++_starts;
            _dictionary = &dictionary;
            _index = static_cast<std::size_t>(entry - dictionary.begin());
            _key = entry->key;
            _rest = *left;
        } else if (left->empty() || !child.asDictionary()) {
            _isManifold = true;
            dependOnAllIn(child, places);
        } else {
            look(*child.asDictionary(), *left, false, places);
        }
    }
}

bool ColumnPlace::dependOn(const Dictionary& dictionary, std::string_view key,
                           std::span<const ChangingPlace> places) {
    bool found = false;
    for (std::size_t i = 0; i < places.size(); ++i)
        if (places[i].dictionary == &dictionary && places[i].key == key) {
            _places.push_back(i);
            found = true;
        }
    return found;
}

void ColumnPlace::dependOnAllIn(const Value& value, std::span<const ChangingPlace> places) {
    const Dictionary* const dictionary = value.asDictionary();
    if (!dictionary)
        return;
    for (const auto& [key, child] : *dictionary) {
        dependOn(*dictionary, key, places);
        dependOnAllIn(child, places);
    }
}

} // namespace velmora
