// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Statistics/GroupStatistics.h"

#include <algorithm>

namespace velmora {

bool LeafStatistics::isInList() const {
    const CatalogueNode* node = leaf.node;
    while (node && !node->isRow())
        node = node->parent();
    return node != nullptr;
}

TechnologyPart& GroupStatistics::partOf(const std::string& technology) {
    const auto found = std::find_if(parts.begin(), parts.end(),
                                    [&](const auto& part) { return part->technology == technology; });
    if (found != parts.end())
        return **found;
    return *parts.emplace_back(std::make_unique<TechnologyPart>(technology));
}

namespace {

void addWorst(RoleStatistics& role, const TechnologyPart& part) {
    const WorstMinute* const minutes = part.worstMinute(role.role);
    if (!minutes)
        return;
    const std::optional<WorstMinute::Minute> worst = minutes->worst();
    const auto worse = WorstMinute::worse(minutes->measure(), role.worst, worst);
    if (worse && (!role.worst || worse->begin != role.worst->begin || worse->figure != role.worst->figure))
        role.worstTechnology = part.technology;
    role.worst = worse;
}

} // namespace

std::vector<RoleStatistics> rolesOf(const GroupStatistics& group) {
    std::vector<RoleStatistics> roles;
    for (const RoleName& name : roleNames()) {
        RoleStatistics role;
        role.role = name.role;
        role.unit = name.unit;
        role.measure = WorstMinute::measureOf(name.role);
        for (const auto& part : group.parts) {
            for (const auto& leaf : part->leaves)
                if (leaf && leaf->leaf.role == name.role) {
                    role.numbers.add(leaf->numbers);
                    role.absent += leaf->absent;
                }
            addWorst(role, *part);
        }
        if (role.numbers.count() != 0)
            roles.push_back(std::move(role));
    }
    return roles;
}

} // namespace velmora
