// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Paths/NodeSelection.h"

#include "LogGenerator/LogGenerator.h"
#include "LogGenerator/Observations/PathPattern.h"
#include "Model/NodePath.h"

#include <algorithm>
#include <charconv>
#include <optional>

namespace velmora {

namespace {

/// What is left of paths after the path of a node: "/0" of "/Serving Cell/0" after "/Serving Cell". The
/// root's own path adds nothing in front when paths are joined.
using Rests = std::vector<std::string_view>;

std::string_view nameOf(std::string_view key, bool isSorted) {
    return isSorted ? nameOfSortedKey(key) : key;
}

const Value* findAfter(const Value& value, std::string_view rest, bool atRoot);

const Value* findIn(const Dictionary& dictionary, std::string_view rest, bool atRoot) {
    const bool isSorted = dictionary.contains(sortedMarker);
    const Value* found = nullptr;
    const std::string* foundKey = nullptr;
    for (const auto& [key, child] : dictionary) {
        if (key == sortedMarker || child.isNone())
            continue;
        const std::optional<std::string_view> left = PathPattern::after(rest, atRoot, nameOf(key, isSorted));
        // The later row: in a sorted dictionary the one of the greater key.
        if (!left || (isSorted && foundKey && key < *foundKey))
            continue;
        if (const Value* inside = left->empty() ? &child : findAfter(child, *left, false)) {
            found = inside;
            foundKey = &key;
        }
    }
    return found;
}

const Value* findIn(const Array& array, std::string_view rest, bool atRoot) {
    const std::string_view number = rest.substr(1, rest.find('/', 1) - 1);
    std::size_t index = 0;
    const auto [end, error] = std::from_chars(number.data(), number.data() + number.size(), index);
    if (error != std::errc() || end != number.data() + number.size() || index >= array.size())
        return nullptr;
    // Only the number as the tree writes it: "0", not "00".
    const std::optional<std::string_view> left = PathPattern::after(rest, atRoot, std::to_string(index));
    if (!left)
        return nullptr;
    return left->empty() ? &array[index] : findAfter(array[index], *left, false);
}

/// Precondition: `rest` is not empty.
const Value* findAfter(const Value& value, std::string_view rest, bool atRoot) {
    if (const Dictionary* dictionary = value.asDictionary())
        return findIn(*dictionary, rest, atRoot);
    if (const Array* array = value.asArray())
        return findIn(*array, rest, atRoot);
    return nullptr;
}

/// What the paths through its parent select of a child.
struct Share {
    bool isSelected = false; ///< all of it
    Rests inside;            ///< else these paths lead into it
};

Share shareOf(const Rests& rests, bool atRoot, std::string_view name) {
    Share share;
    for (const std::string_view rest : rests)
        if (const std::optional<std::string_view> left = PathPattern::after(rest, atRoot, name)) {
            if (left->empty())
                share.isSelected = true;
            else
                share.inside.push_back(*left);
        }
    return share;
}

Value restrictedAfter(const Value& value, const Rests& rests, bool atRoot);

/// What of the child is selected, or none.
Value selectedPart(const Value& child, const Share& share) {
    if (share.isSelected)
        return child;
    return share.inside.empty() ? Value() : restrictedAfter(child, share.inside, false);
}

Value restrictedAfter(const Value& value, const Rests& rests, bool atRoot) {
    if (const Dictionary* dictionary = value.asDictionary()) {
        const bool isSorted = dictionary->contains(sortedMarker);
        const DictionaryRef result = makeDictionary();
        bool hasAny = false;
        for (const auto& [key, child] : *dictionary) {
            Value part = key == sortedMarker
                             ? child
                             : selectedPart(child, shareOf(rests, atRoot, nameOf(key, isSorted)));
            if (part.isNone())
                continue;
            hasAny = hasAny || key != sortedMarker;
            result->set(key, std::move(part));
        }
        return hasAny ? Value(result) : Value();
    }
    if (const Array* array = value.asArray()) {
        const ArrayRef result = makeArray();
        for (std::size_t i = 0; i < array->size(); ++i) {
            Value part = selectedPart((*array)[i], shareOf(rests, atRoot, std::to_string(i)));
            if (part.isNone())
                continue;
            while (result->size() < i)
                result->append(Value());
            result->append(std::move(part));
        }
        return result->empty() ? Value() : Value(result);
    }
    return {};
}

NodeRef restrictedAfter(const VelmoraModelNode& node, const Rests& rests, bool atRoot) {
    std::vector<NodeRef> children;
    if (const std::vector<NodeRef>* all = node.childNodes())
        for (const NodeRef& child : *all) {
            const Share share = shareOf(rests, atRoot, child->displayName());
            if (share.isSelected)
                children.push_back(child);
            else if (NodeRef part =
                         share.inside.empty() ? nullptr : restrictedAfter(*child, share.inside, false))
                children.push_back(std::move(part));
        }
    if (children.empty())
        return nullptr;
    return std::make_shared<VelmoraModelTreeNode>(node.displayName(), std::move(children));
}

void findAllAfter(const Value& value, std::string_view rest, bool atRoot, std::vector<const Value*>& found) {
    const auto look = [&](std::string_view name, const Value& child) {
        const std::optional<std::string_view> left = PathPattern::after(rest, atRoot, name);
        if (left && left->empty())
            found.push_back(&child);
        else if (left)
            findAllAfter(child, *left, false, found);
    };
    if (const Dictionary* const dictionary = value.asDictionary()) {
        const bool isSorted = dictionary->contains(sortedMarker);
        for (const auto& [key, child] : *dictionary)
            if (key != sortedMarker && !child.isNone())
                look(nameOf(key, isSorted), child);
    } else if (const Array* const array = value.asArray()) {
        for (std::size_t i = 0; i < array->size(); ++i)
            look(std::to_string(i), (*array)[i]);
    }
}

} // namespace

NodeSelection::NodeSelection(const std::vector<std::string>& texts) {
    for (const std::string& text : texts) {
        const std::size_t name = text.starts_with('/') ? 0 : text.find("=/");
        _paths.push_back(name == 0 ? text : text.substr(name + 1));
        _names.push_back(name == 0 ? text : text.substr(0, name));
    }
}

bool NodeSelection::isPath(std::string_view text) {
    const std::size_t path = text.find("=/");
    return text.starts_with('/') || (path != std::string_view::npos && path != 0);
}

void NodeSelection::limit(LogGenerator& decoder) const {
    if (!selectsAll())
        decoder.setWantedPaths(_paths);
}

const Value* NodeSelection::findBelow(const Value& place, std::string_view rest) {
    return findAfter(place, rest, false);
}

void NodeSelection::findAllBelow(const Value& place, std::string_view rest,
                                 std::vector<const Value*>& found) {
    findAllAfter(place, rest, false, found);
}

void NodeSelection::findAll(const Value& display, std::string_view path, std::vector<const Value*>& found) {
    findAllAfter(display, path, true, found);
}

bool NodeSelection::hasWildcard(std::string_view path) {
    for (std::size_t at = path.find("/*"); at != std::string_view::npos; at = path.find("/*", at + 1))
        if (at + 2 == path.size() || path[at + 2] == '/')
            return true;
    return false;
}

const Value* NodeSelection::find(const Value& display, std::string_view path) {
    if (display.isNone())
        return nullptr;
    return path == rootNodePath ? &display : findAfter(display, path, true);
}

Value NodeSelection::restricted(const Value& display) const {
    return selectsAll() ? display : restrictedAfter(display, Rests(_paths.begin(), _paths.end()), true);
}

Value NodeSelection::restrictedAt(const CatalogueNode& place, const Value& value) const {
    if (selectsAll())
        return value;
    Rests inside;
    for (const std::string& each : _paths) {
        const std::optional<std::string_view> left = PathPattern::below(each, place);
        if (left && left->empty())
            return value;
        if (left)
            inside.push_back(*left);
    }
    return inside.empty() ? Value() : restrictedAfter(value, inside, false);
}

NodeRef NodeSelection::restricted(const NodeRef& root) const {
    return selectsAll() ? root : restrictedAfter(*root, Rests(_paths.begin(), _paths.end()), true);
}

bool NodeSelection::selectsAll() const {
    return _paths.empty() || std::find(_paths.begin(), _paths.end(), rootNodePath) != _paths.end();
}

} // namespace velmora
