// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Statistics/GroupStatistics.h"

#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// Statistics of two inputs that belong together; null, or absent, where one has none. Never both.

struct RolePair {
    Role role = Role::None;
    Unit unit = Unit::None;
    std::optional<RoleStatistics> a{};
    std::optional<RoleStatistics> b{};
};

struct LeafPair {
    const LeafStatistics* a = nullptr;
    const LeafStatistics* b = nullptr;

    [[nodiscard]] const LeafStatistics& any() const { return b ? *b : *a; }
};

struct TechnologyPair {
    std::string technology; ///< the short name
    const TechnologyPart* a = nullptr;
    const TechnologyPart* b = nullptr;
    std::vector<LeafPair> leaves; ///< in the catalogue's order
};

/// In the order of the roles.
[[nodiscard]] std::vector<RolePair> pairRoles(const GroupStatistics& a, const GroupStatistics& b);
/// In the order of A's technologies, and then of those that B has alone.
[[nodiscard]] std::vector<TechnologyPair> pairTechnologies(const GroupStatistics& a,
                                                           const GroupStatistics& b);

} // namespace velmora
