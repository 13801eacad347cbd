// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Expression/PathLeaves.h"

#include <algorithm>
#include <string>

namespace velmora {

namespace {

/// Whether the path leads into an open node of the display.
bool leadsIntoOpen(const CatalogueNode& node, std::string_view path) {
    for (const auto& child : node.children()) {
        if (const auto rest = PathPattern::below(path, *child); child->isOpen() && rest && !rest->empty())
            return true;
        if (leadsIntoOpen(*child, path))
            return true;
    }
    return false;
}

} // namespace

std::optional<PathLeaf> leafAt(const CatalogueField& leaf, std::string_view path) {
    if (path.size() < 2)
        return std::nullopt; // the root
    const PathPattern pattern{std::string(path)};
    std::optional<PathPattern::Rows> rows = pattern.select(leaf);
    // What leads to a node above the leaf also leads to it with one more name.
    if (!rows || PathPattern(pattern.text() + "/*").select(leaf))
        return std::nullopt;
    return PathLeaf{&leaf, std::move(*rows)};
}

std::vector<PathLeaf> leavesAt(const Catalogue& catalogue, std::string_view path) {
    std::vector<PathLeaf> leaves;
    for (const CatalogueField& leaf : catalogue.fields())
        if (std::optional<PathLeaf> found = leafAt(leaf, path))
            leaves.push_back(std::move(*found));
    return leaves;
}

bool canHaveFurtherLeaf(const Catalogue& catalogue, std::string_view path) {
    return catalogue.root().isOpen() || leadsIntoOpen(catalogue.root(), path);
}

} // namespace velmora
