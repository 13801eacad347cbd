// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Statistics/CountedLeaves.h"

#include <algorithm>
#include <utility>

namespace velmora {

bool CountedLeaf::isInRows(const Observation& observation) const {
    return std::any_of(rows.begin(), rows.end(),
                       [&](const auto& each) { return velmora::isInRows(observation, each); });
}

CountedLeaf& CountedLeaves::make(const CatalogueField& leaf) {
    if (leaf.index >= _leaves.size())
        _leaves.resize(leaf.index + 1);
    CountedLeaf& use = _leaves[leaf.index];
    use.isKnown = true;
    std::optional<LeafChoice::Leaf> chosen = _choice.choose(leaf);
    if (!chosen)
        return use;
    use.isChosen = true;
    use.isIdentifying = leaf.identity != Identity::None;
    use.name = std::move(chosen->name);
    use.rows = std::move(chosen->rows);
    use.measure = WorstMinute::measureOf(leaf.role);
    // A path without a row's number chooses every row.
    const auto isAny = [](const PathPattern::Rows& rows) {
        return std::none_of(rows.begin(), rows.end(), [](const auto& row) { return row.has_value(); });
    };
    if (std::any_of(use.rows.begin(), use.rows.end(), isAny))
        use.rows.clear();
    return use;
}

} // namespace velmora
