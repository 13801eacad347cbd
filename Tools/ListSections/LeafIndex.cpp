// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/ListSections/LeafIndex.h"

#include <algorithm>

namespace velmora {

namespace {

/// The list whose rows the node belongs to.
const CatalogueNode* listOf(const CatalogueNode* node) {
    while (node && !node->isRow())
        node = node->parent();
    return node ? node->parent() : nullptr;
}

void addOnce(std::vector<const CatalogueNode*>& lists, const CatalogueNode* list) {
    if (std::find(lists.begin(), lists.end(), list) == lists.end())
        lists.push_back(list);
}

} // namespace

LeafIndex::LeafIndex(const Catalogue& catalogue) {
    for (const CatalogueField& leaf : catalogue.fields())
        for (const CatalogueSource& source : leaf.sources) {
            _leaves[{leaf.section, source.code, source.list, source.field}].push_back(&leaf);
            if (source.list)
                addOnce(_lists[{leaf.section, source.list}], listOf(leaf.node));
        }
}

const LeafIndex::Leaves& LeafIndex::of(std::string_view section, std::uint32_t code, const List* list,
                                       const Field& field) const {
    static const Leaves none;
    const auto found = _leaves.find({section, code, list, &field});
    return found == _leaves.end() ? none : found->second;
}

std::vector<const CatalogueNode*> LeafIndex::listsOf(std::string_view section, const List& list) const {
    const auto found = _lists.find({section, &list});
    return found == _lists.end() ? std::vector<const CatalogueNode*>() : found->second;
}

} // namespace velmora
