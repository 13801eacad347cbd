// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/Observations/ShownDisplay.h"

#include "Platform/DateText.h"

#include <algorithm>
#include <stdexcept>

namespace velmora {

namespace {

constexpr std::string_view mark = "\x01 not written";
constexpr std::string_view sortedMarker = "_sorted";

bool isMark(const Value& value) {
    const std::string* const text = value.asString();
    return text && *text == mark;
}

const Catalogue::Node* childOf(const Catalogue::Node* node, std::string_view name) {
    return node ? node->find(name) : nullptr;
}

std::string below(const std::string& path, std::string_view name) {
    std::string result = path == "/" ? path : path + "/";
    return result.append(name);
}

/// A leaf's text; none of these but a string is shown by a decoder of its own.
std::string textOf(const Value& value) {
    if (const std::string* const text = value.asString())
        return *text;
    if (const std::int64_t* const integer = value.asInteger())
        return std::to_string(*integer);
    if (const double* const real = value.asReal())
        return std::to_string(*real);
    if (const bool* const flag = value.asBoolean())
        return *flag ? "true" : "false";
    if (const Date* const date = value.asDate())
        return dateAndTimeText(*date, " ");
    return {};
}

void markBelow(const Value& value, const Catalogue::Node* node) {
    if (Array* const array = value.asArray()) {
        for (std::size_t i = 0; i < array->size(); ++i)
            array->slot(i) = Value(mark);
        array->append(Value(mark));
        return;
    }
    Dictionary& dictionary = *value.asDictionary();
    std::vector<std::string> keys;
    for (const auto& [key, child] : dictionary)
        if (key != sortedMarker)
            keys.emplace_back(key);
    for (const std::string& key : keys) {
        const Value& child = dictionary[key];
        const Catalogue::Node* const place = childOf(node, key);
        // What a service supplied is shared with it; a list in a dictionary is written anew.
        const bool isOwnNode =
            (child.asArray() || (child.asDictionary() && !childOf(place, "*"))) && place && !place->leaf();
        if (isOwnNode)
            markBelow(child, place);
        else
            dictionary.set(key, Value(mark));
    }
}

} // namespace

void markDisplay(const Value& display, Catalogue& catalogue) {
    if (display.asDictionary() || display.asArray())
        markBelow(display, &catalogue.root());
}

ShownDisplay::ShownDisplay(const Value& display, Catalogue& catalogue, bool hasNumberedLists)
    : _hasNumberedLists(hasNumberedLists) {
    if (!display.isNone())
        read(display, {"/", "/", &catalogue.root()});
}

void ShownDisplay::read(const Value& value, const Place& place) {
    if (const Dictionary* const dictionary = value.asDictionary()) {
        if (_hasNumberedLists && childOf(place.node, "*"))
            readNumbered(*dictionary, place);
        else
            readDictionary(*dictionary, place);
    } else if (const Array* const array = value.asArray()) {
        readArray(*array, place);
    } else if (isMark(value)) {
        marked[place.path] = place.pattern;
    } else {
        Leaf& leaf = leaves[place.path];
        leaf.pattern = place.pattern;
        leaf.texts.push_back(textOf(value));
    }
}

void ShownDisplay::readDictionary(const Dictionary& dictionary, const Place& place) {
    for (const auto& [key, value] : dictionary) {
        isAmbiguous |= key == "*" || key.find('/') != std::string::npos;
        if (key != sortedMarker)
            read(value, {below(place.path, key), below(place.pattern, key), childOf(place.node, key)});
    }
}

void ShownDisplay::readNumbered(const Dictionary& entries, const Place& place) {
    std::size_t count = 0;
    for (const auto& [key, value] : entries) {
        if (key == sortedMarker)
            continue;
        ++count;
        const std::string number = std::string(key).substr(key.find(';') + 1);
        read(value, {below(place.path, number), below(place.pattern, "*"), childOf(place.node, "*")});
    }
    lists[place.pattern].push_back(count);
}

void ShownDisplay::readArray(const Array& array, const Place& place) {
    const auto marks = static_cast<std::size_t>(std::count_if(array.begin(), array.end(), isMark));
    if (marks == array.size() && marks > 0)
        return;
    if (marks > 0)
        throw std::logic_error(place.path + " is written in part");
    lists[place.pattern].push_back(array.size());
    if (array.empty() && !childOf(place.node, "*"))
        emptyOnly.insert(place.pattern);
    for (std::size_t i = 0; i < array.size(); ++i)
        read(array[i],
             {below(place.path, std::to_string(i)), below(place.pattern, "*"), childOf(place.node, "*")});
}

} // namespace velmora
