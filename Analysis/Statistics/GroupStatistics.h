// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Statistics/StateCounts.h"
#include "Analysis/Statistics/ValueCounts.h"
#include "Analysis/Statistics/WorstMinute.h"
#include "LogGenerator/Observations/Catalogue.h"
#include "Platform/Clock.h"

#include <array>
#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// The statistics of a leaf.
struct LeafStatistics {
    LeafStatistics(const CatalogueField& field, std::string ownName, std::size_t mostValues)
        : leaf(field), name(std::move(ownName)), numbers(mostValues) {}

    /// Whether it has numbers to show: where it has reported none, whether it should.
    [[nodiscard]] bool hasNumbers() const {
        return numbers.count() != 0 || (leaf.kind == ObservedKind::Number && states.samples() == 0);
    }
    [[nodiscard]] bool hasStates() const {
        return !states.values().empty() || (leaf.kind != ObservedKind::Number && numbers.count() == 0);
    }
    [[nodiscard]] bool isInList() const;

    const CatalogueField& leaf;
    std::string name; ///< as the user calls it; empty for none but its path
    ValueCounts numbers;
    StateCounts states;       ///< without times and transitions in a list, whose rows hold several at a time
    std::uint64_t absent = 0; ///< how often a message said that there is no value
};

/// The statistics of what one technology's messages reported.
struct TechnologyPart {
    explicit TechnologyPart(std::string technologyName) : technology(std::move(technologyName)) {}

    /// The leaf's; null where there are none.
    [[nodiscard]] LeafStatistics* find(const CatalogueField& leaf) const {
        return leaf.index < leaves.size() ? leaves[leaf.index].get() : nullptr;
    }
    /// Null for a role without a worst minute, or without values.
    [[nodiscard]] const WorstMinute* worstMinute(Role role) const {
        return minutes[static_cast<std::size_t>(role)].get();
    }

    std::string technology; ///< the short name
    std::uint64_t messages = 0;
    std::optional<Time> first; ///< the time of the first message
    std::optional<Time> last;  ///< the latest one
    std::vector<std::unique_ptr<LeafStatistics>>
        leaves;                ///< by index in the catalogue, null where there are none
    std::uint64_t omitted = 0; ///< observations of leaves beyond the limit of how many are kept
    std::array<std::unique_ptr<WorstMinute>, static_cast<std::size_t>(Role::DataRate) + 1>
        minutes; ///< by role
};

/// What distinguishes a group from others.
struct GroupKey {
    std::string technology;             ///< the short name; empty where a group may be of several
    std::optional<std::uint32_t> input; ///< the file
    std::optional<std::uint32_t> cell;  ///< its number, see ServingCells
    std::optional<Time> minute;         ///< its begin

    friend bool operator==(const GroupKey&, const GroupKey&) = default;
    friend auto operator<=>(const GroupKey&, const GroupKey&) = default;
};

/// The statistics of a group of messages: of all, of a file, a technology, a cell or a minute.
struct GroupStatistics {
    /// The part of that technology, which is made where there is none.
    TechnologyPart& partOf(const std::string& technology);

    GroupKey key;
    std::string cell; ///< as people name the key's cell; empty for an unknown one and for all further ones
    std::vector<std::unique_ptr<TechnologyPart>> parts; ///< in the order of their first messages
};

/// The statistics of a role, over all its leaves with numbers.
struct RoleStatistics {
    Role role = Role::None;
    Unit unit = Unit::None;
    ValueCounts numbers;
    std::uint64_t absent = 0;
    std::optional<WorstMinute::Measure> measure; ///< where it has worse and better values
    std::optional<WorstMinute::Minute> worst;
    std::string worstTechnology; ///< the one whose minute that is
};

/// The roles that have numbers in the group, in their order.
[[nodiscard]] std::vector<RoleStatistics> rolesOf(const GroupStatistics& group);

} // namespace velmora
