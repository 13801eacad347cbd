// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Observations/WantedLeaves.h"

#include <algorithm>

namespace velmora {

namespace {

bool isKeyOfItsRow(const CatalogueField& leaf) {
    return std::find(leaf.keys.begin(), leaf.keys.end(), leaf.node->name()) != leaf.keys.end();
}

} // namespace

bool WantedLeaves::ask(const CatalogueField& leaf) const {
    const bool isWanted = !_sink || _sink->wants(leaf) || (_hasRowKeys && isKeyOfItsRow(leaf));
    if (leaf.index >= _known.size())
        _known.resize(leaf.index + 1, Known::No);
    _known[leaf.index] = isWanted ? Known::Wanted : Known::Unwanted;
    return isWanted;
}

bool WantedLeaves::hasAnyAt(const CatalogueNode& node) const {
    if (!node.leaf() && node.children().empty())
        return true; // a list whose rows have no fields: how many there are is all that it reports
    return node.isOpen() || (node.leaf() && has(*node.leaf())) ||
           std::any_of(node.children().begin(), node.children().end(),
                       [this](const auto& child) { return hasAnyAt(*child); });
}

} // namespace velmora
