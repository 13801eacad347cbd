// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Statistics/StatisticsGroups.h"

#include <algorithm>

namespace velmora {

GroupStatistics& StatisticsGroups::of(GroupKey key) {
    const auto found = _byKey.find(key);
    if (found != _byKey.end())
        return *found->second;
    GroupStatistics& group = *_groups.emplace_back(std::make_unique<GroupStatistics>());
    group.key = key;
    _byKey.emplace(std::move(key), &group);
    return group;
}

LeafStatistics* StatisticsGroups::of(TechnologyPart& part, const CatalogueField& leaf,
                                     const std::string& name) {
    if (LeafStatistics* const found = part.find(leaf))
        return found;
    if (_leaves == mostLeaves)
        return nullptr;
    if (leaf.index >= part.leaves.size())
        part.leaves.resize(leaf.index + 1);
    const std::size_t mostValues = _leaves < leavesOfManyValues ? ValueCounts::usualMost : fewValues;
    ++_leaves;
    return (part.leaves[leaf.index] = std::make_unique<LeafStatistics>(leaf, name, mostValues)).get();
}

void StatisticsGroups::complete(GroupStatistics& group) {
    _complete(group);
    for (const auto& part : group.parts)
        _leaves -= static_cast<std::size_t>(std::count_if(part->leaves.begin(), part->leaves.end(),
                                                          [](const auto& leaf) { return leaf != nullptr; }));
    _byKey.erase(group.key);
    std::erase_if(_groups, [&group](const auto& each) { return each.get() == &group; });
}

void StatisticsGroups::finish() {
    while (!_groups.empty())
        complete(*_groups.front());
}

} // namespace velmora
