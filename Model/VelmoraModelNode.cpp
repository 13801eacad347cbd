// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Model/VelmoraModelNode.h"

#include "LogGenerator/ArrayLock.h"
#include "Model/NodePath.h"

#include <algorithm>

namespace velmora {

namespace {

NodeRef build(std::string name, const Value& object, std::string path, PathDictionary& paths);

std::vector<NodeRef> childrenOf(const Dictionary& dictionary, const std::string& path,
                                PathDictionary& paths) {
    const bool isSorted = dictionary.contains(sortedMarker);
    std::vector<const Dictionary::Entry*> entries;
    entries.reserve(dictionary.size());
    for (const Dictionary::Entry& entry : dictionary)
        if (entry.key != sortedMarker && !entry.value.isNone())
            entries.push_back(&entry);
    // By the keys' bytes, not by number: "10;7" comes before "2;7".
    if (isSorted)
        std::sort(entries.begin(), entries.end(),
                  [](const auto* a, const auto* b) { return a->key < b->key; });

    std::vector<NodeRef> children;
    children.reserve(entries.size());
    for (const Dictionary::Entry* entry : entries) {
        const std::string name(isSorted ? nameOfSortedKey(entry->key) : entry->key);
        if (NodeRef child = build(name, entry->value, appendingPathComponent(path, name), paths))
            children.push_back(std::move(child));
    }
    return children;
}

std::vector<NodeRef> childrenOf(const Array& array, const std::string& path, PathDictionary& paths) {
    const ArrayLock::Guard guard;
    std::vector<NodeRef> children;
    children.reserve(array.size());
    for (const Value& element : array) {
        const std::string name = std::to_string(children.size());
        if (NodeRef child = build(name, element, appendingPathComponent(path, name), paths))
            children.push_back(std::move(child));
    }
    return children;
}

NodeRef build(std::string name, const Value& object, std::string path, PathDictionary& paths) {
    NodeRef node;
    if (const std::string* text = object.asString())
        node = std::make_shared<VelmoraModelLeafNode>(std::move(name), *text);
    else if (const Dictionary* dictionary = object.asDictionary())
        node = std::make_shared<VelmoraModelTreeNode>(std::move(name), childrenOf(*dictionary, path, paths));
    else if (const Array* array = object.asArray())
        node = std::make_shared<VelmoraModelTreeNode>(std::move(name), childrenOf(*array, path, paths));
    else
        node = std::make_shared<VelmoraModelLeafNode>(std::move(name), "(unknown)");
    // After its children, so that of two siblings with one name the later keeps the path.
    paths.insert_or_assign(std::move(path), node);
    return node;
}

} // namespace

std::string_view nameOfSortedKey(std::string_view key) {
    const std::size_t first = key.find(';');
    if (first == std::string_view::npos || key.find(';', first + 1) != std::string_view::npos)
        return key;
    return key.substr(first + 1);
}

NodeRef VelmoraModelNode::makeTreeFromObject(const Value& object, PathDictionary& paths) {
    return build("Velmora", object, std::string(rootNodePath), paths);
}

} // namespace velmora
