// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Picture/PictureMemory.h"

#include "Analysis/Picture/RadioPicture.h"

#include <utility>

// What a picture keeps for another one, and how that takes it over.

namespace velmora {

namespace {

/// The place of the same path in that catalogue; null where there is none.
const CatalogueNode* counterpart(const CatalogueNode& node, const Catalogue& catalogue) {
    if (!node.parent())
        return &catalogue.root();
    const CatalogueNode* const parent = counterpart(*node.parent(), catalogue);
    return parent ? parent->find(node.name()) : nullptr;
}

} // namespace

PictureMemory RadioPicture::memory() const {
    PictureMemory memory;
    for (RadioSide i = 0; i < radioSides; ++i)
        if (_sides[i].isAnythingKnown())
            memory.sides.emplace_back(i, _sides[i]);
    const std::span<const Neighbour> cells = neighbours();
    memory.neighbours.assign(cells.begin(), cells.end());
    memory.lists = _neighbours.lists();
    memory.technology = _technology;
    memory.current = _current;
    return memory;
}

void RadioPicture::setMemory(const PictureMemory& memory) {
    clear();
    for (const auto& [side, state] : memory.sides) {
        _sides[side] = state;
        _sides[side].list = nullptr; // of the message that was the latest
        _sides[side].readings.findLeaves([this](const CatalogueField& leaf) -> const CatalogueField* {
            const CatalogueNode* const node = counterpart(*leaf.node, _catalogue);
            return node ? node->leaf() : nullptr;
        });
    }
    std::vector<const CatalogueNode*> lists;
    for (const CatalogueNode* const each : memory.lists)
        lists.push_back(each ? counterpart(*each, _catalogue) : nullptr);
    _neighbours.setAll(memory.neighbours, std::move(lists));
    _technology = memory.technology;
    _current = memory.current;
    findStrongest();
}

} // namespace velmora
