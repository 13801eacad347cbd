// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Statistics/GroupStatistics.h"
#include "Analysis/Statistics/StatisticsPlan.h"

#include <cstddef>
#include <functional>
#include <map>
#include <memory>
#include <string>
#include <utility>
#include <vector>

namespace velmora {

/// The groups that the statistics of all technologies are divided into, and what they may keep in memory. A
/// minute is passed on when it is over, and forgotten; all other groups at the end, in the order of their
/// first messages.
class StatisticsGroups {
public:
    using Complete = std::function<void(const GroupStatistics& group)>;

    /// Further leaves of groups are not kept; their observations are counted as omitted.
    static constexpr std::size_t mostLeaves = std::size_t{1} << 15;
    /// Further leaves have `fewValues` different values at most before these are rounded.
    static constexpr std::size_t leavesOfManyValues = 1024;
    static constexpr std::size_t fewValues = 512;

    /// The group is valid during the call.
    StatisticsGroups(StatisticsPlan plan, Complete complete)
        : _plan(std::move(plan)), _complete(std::move(complete)) {}

    [[nodiscard]] const StatisticsPlan& plan() const { return _plan; }
    /// The group of that key, which is made where there is none.
    [[nodiscard]] GroupStatistics& of(GroupKey key);
    /// The statistics of the leaf, which are made where there are none; null where there are too many.
    [[nodiscard]] LeafStatistics* of(TechnologyPart& part, const CatalogueField& leaf,
                                     const std::string& name);

    /// Those that have not been passed on.
    [[nodiscard]] const std::vector<std::unique_ptr<GroupStatistics>>& groups() const { return _groups; }

    /// The group gets nothing more.
    void complete(GroupStatistics& group);
    /// There is nothing more.
    void finish();

private:
    StatisticsPlan _plan;
    Complete _complete;
    std::vector<std::unique_ptr<GroupStatistics>> _groups;
    std::map<GroupKey, GroupStatistics*> _byKey;
    std::size_t _leaves = 0; ///< of all groups
};

} // namespace velmora
