// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Samples/SampleColumns.h"

#include "LogGenerator/Observations/PathPattern.h"

#include <algorithm>

namespace velmora {

namespace {

std::string titleOf(const std::string& name, const CatalogueField& leaf) {
    const std::string_view unit = leaf.kind == ObservedKind::Number ? nameOf(leaf.unit) : std::string_view();
    return unit.empty() ? name : name + " (" + std::string(unit) + ")";
}

/// Whether another of the leaves has the same name.
bool hasNamesake(const std::vector<const CatalogueField*>& leaves, const CatalogueField& leaf) {
    return std::any_of(leaves.begin(), leaves.end(), [&leaf](const CatalogueField* other) {
        return other != &leaf && other->node->name() == leaf.node->name();
    });
}

} // namespace

void SampleColumns::add(const NodeSelection& selection, const Catalogue& catalogue) {
    for (std::size_t path = 0; path < selection.paths().size(); ++path) {
        const PathPattern pattern(selection.paths()[path]);
        const bool isNamed = selection.names()[path] != selection.paths()[path];
        std::vector<const CatalogueField*> leaves;
        for (const CatalogueField& leaf : catalogue.fields())
            if (pattern.select(leaf))
                leaves.push_back(&leaf);
        for (const CatalogueField* const leaf : leaves) {
            if (contains(path, leaf->path))
                continue;
            // Where one name selects several leaves, the leaf's own name makes the title unique, or its path.
            const std::string& name = selection.names()[path];
            std::string title = leaves.size() == 1 ? name : leaf->path;
            if (leaves.size() > 1 && isNamed)
                title = name + (hasNamesake(leaves, *leaf) ? leaf->path : "/" + leaf->node->name());
            _columns.push_back({titleOf(title, *leaf), leaf->path, path});
        }
        // A tree that names its own leaves may have it.
        if (leaves.empty() && pattern.isPossible(catalogue) && !contains(path, {}))
            _columns.push_back({selection.names()[path], {}, path});
    }
}

bool SampleColumns::contains(std::size_t path, const std::string& leaf) const {
    return std::any_of(_columns.begin(), _columns.end(), [&](const Column& column) {
        return column.path == path && (leaf.empty() || column.leaf == leaf);
    });
}

bool SampleColumns::hasRows() const {
    return std::any_of(_columns.begin(), _columns.end(), [](const Column& column) {
        return column.leaf.empty() || NodeSelection::hasWildcard(column.leaf);
    });
}

} // namespace velmora
