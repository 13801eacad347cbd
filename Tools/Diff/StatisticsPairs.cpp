// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Diff/StatisticsPairs.h"

#include <algorithm>
#include <map>

namespace velmora {

namespace {

const TechnologyPart* find(const GroupStatistics& group, const std::string& technology) {
    const auto found = std::find_if(group.parts.begin(), group.parts.end(),
                                    [&](const auto& part) { return part->technology == technology; });
    return found == group.parts.end() ? nullptr : found->get();
}

/// By path: the leaves that all decoders of a technology know have the same index, those that messages name
/// need not.
std::vector<LeafPair> pairLeaves(const TechnologyPart* a, const TechnologyPart* b) {
    std::vector<LeafPair> pairs;
    std::map<std::string_view, std::size_t> byPath;
    if (a)
        for (const auto& leaf : a->leaves)
            if (leaf) {
                byPath[leaf->leaf.path] = pairs.size();
                pairs.push_back({leaf.get(), nullptr});
            }
    if (b)
        for (const auto& leaf : b->leaves) {
            if (!leaf)
                continue;
            if (const auto found = byPath.find(leaf->leaf.path); found != byPath.end())
                pairs[found->second].b = leaf.get();
            else
                pairs.push_back({nullptr, leaf.get()});
        }
    std::stable_sort(pairs.begin(), pairs.end(), [](const LeafPair& one, const LeafPair& other) {
        return one.any().leaf.index < other.any().leaf.index;
    });
    return pairs;
}

} // namespace

std::vector<RolePair> pairRoles(const GroupStatistics& a, const GroupStatistics& b) {
    std::vector<RolePair> pairs;
    for (const RoleName& name : roleNames())
        pairs.push_back({name.role, name.unit});
    const auto pairOf = [&pairs](Role role) -> RolePair& {
        return *std::find_if(pairs.begin(), pairs.end(),
                             [role](const RolePair& pair) { return pair.role == role; });
    };
    for (RoleStatistics& role : rolesOf(a))
        pairOf(role.role).a = std::move(role);
    for (RoleStatistics& role : rolesOf(b))
        pairOf(role.role).b = std::move(role);
    std::erase_if(pairs, [](const RolePair& pair) { return !pair.a && !pair.b; });
    return pairs;
}

std::vector<TechnologyPair> pairTechnologies(const GroupStatistics& a, const GroupStatistics& b) {
    std::vector<TechnologyPair> pairs;
    for (const auto& part : a.parts)
        pairs.push_back({part->technology, part.get(), find(b, part->technology), {}});
    for (const auto& part : b.parts)
        if (!find(a, part->technology))
            pairs.push_back({part->technology, nullptr, part.get(), {}});
    for (TechnologyPair& pair : pairs)
        pair.leaves = pairLeaves(pair.a, pair.b);
    return pairs;
}

} // namespace velmora
