// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"

#include <memory>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

namespace velmora {

class VelmoraModelNode;
using NodeRef = std::shared_ptr<const VelmoraModelNode>;
/// The key that makes a display dictionary a sorted one. It is no row itself.
inline constexpr std::string_view sortedMarker = "_sorted";

/// The name that a key of a sorted dictionary shows: what follows its one ";", else the entire key.
[[nodiscard]] std::string_view nameOfSortedKey(std::string_view key);

/// Path ("/", "/Serving Cell/0") to the node built for it.
using PathDictionary = std::unordered_map<std::string, NodeRef>;

/// One row of the screens: a name and either a value (a leaf) or an ordered list of children (an inner node).
/// Trees are built from scratch from a display dictionary and never change; panes keep nodes of an old tree
/// until they are given new ones.
class VelmoraModelNode {
public:
    explicit VelmoraModelNode(std::string name) : _name(std::move(name)) {}
    virtual ~VelmoraModelNode() = default;
    VelmoraModelNode(const VelmoraModelNode&) = delete;
    VelmoraModelNode& operator=(const VelmoraModelNode&) = delete;

    [[nodiscard]] virtual const std::string& displayName() const { return _name; }
    /// The children in display order; null exactly for a leaf. An inner node may have none.
    [[nodiscard]] virtual const std::vector<NodeRef>* childNodes() const { return nullptr; }
    /// The leaf's text; null for an inner node.
    [[nodiscard]] virtual const std::string* value() const { return nullptr; }

    /// Builds the tree of a display object under the name "Velmora" and the path "/", and records every node
    /// in `paths`. A string becomes a leaf, a dictionary or an array an inner node, anything else a leaf that
    /// shows
    /// "(unknown)". A dictionary that holds the key "_sorted" shows its keys in ascending byte order, and a
    /// key of exactly two parts around one ";" by its second part. Where two siblings have the same name,
    /// both are rows and the path leads to the later one.
    [[nodiscard]] static NodeRef makeTreeFromObject(const Value& object, PathDictionary& paths);

private:
    std::string _name;
};

/// A row with a value.
class VelmoraModelLeafNode final : public VelmoraModelNode {
public:
    VelmoraModelLeafNode(std::string name, std::string value)
        : VelmoraModelNode(std::move(name)), _string(std::move(value)) {}
    [[nodiscard]] const std::string* value() const override { return &_string; }

private:
    std::string _string;
};

/// A row that opens a pane of its own.
class VelmoraModelTreeNode final : public VelmoraModelNode {
public:
    VelmoraModelTreeNode(std::string name, std::vector<NodeRef> children)
        : VelmoraModelNode(std::move(name)), _childNodes(std::move(children)) {}
    [[nodiscard]] const std::vector<NodeRef>* childNodes() const override { return &_childNodes; }

private:
    std::vector<NodeRef> _childNodes;
};

} // namespace velmora
