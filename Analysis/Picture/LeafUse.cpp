// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Picture/LeafUse.h"

#include <algorithm>

namespace velmora {

namespace {

/// The list that holds the row, the innermost one.
const CatalogueNode* listOf(const CatalogueNode* node) {
    for (; node; node = node->parent())
        if (node->isRow())
            return node->parent();
    return nullptr;
}

template <class Row>
const Row* rowOf(std::span<const Row> rows, std::string_view path) {
    const auto found =
        std::find_if(rows.begin(), rows.end(), [path](const Row& row) { return row.path == path; });
    return found == rows.end() ? nullptr : &*found;
}

} // namespace

LeafUse useOf(const CatalogueField& leaf, const TechnologyTable& table) {
    LeafUse use;
    for (const TechnologyRow& row : table.technologies)
        if (isAtOrBelow(leaf.path, row.path)) {
            use.side = sideOf(row.technology);
            break;
        }
    if (std::find(table.ignored.begin(), table.ignored.end(), leaf.path) == table.ignored.end())
        use.role = leaf.role;
    use.list = listOf(leaf.node);
    use.namesTechnology = !table.servingTechnology.empty() && leaf.path == table.servingTechnology;
    for (const NeighbourRow& row : table.neighbours) {
        if (row.part == NeighbourPart::DetectedCell)
            use.isOfDetectedCell |= isAtOrBelow(leaf.path, row.path);
        else if (leaf.path == row.path)
            use.part = row.part;
    }
    use.modes = rowOf(table.modes, leaf.path);
    use.evidence = rowOf(table.evidence, leaf.path);
    use.isOfNeighbour = use.part != NeighbourPart::None || isNeighbour(use.role);
    use.isOfSide = (use.role != Role::None && !isNeighbour(use.role)) || use.modes || use.evidence;
    use.isUsed = use.isOfNeighbour || use.isOfSide || use.namesTechnology;
    return use;
}

} // namespace velmora
