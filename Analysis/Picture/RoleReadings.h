// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Picture/Reading.h"
#include "LogGenerator/Fields/Role.h"

#include <array>
#include <cstddef>

namespace velmora {

/// The latest reading of each role.
class RoleReadings {
public:
    /// Null where it is not known.
    [[nodiscard]] const Reading* find(Role role) const {
        const Slot& slot = _slots[static_cast<std::size_t>(role)];
        return slot.isKnown ? &slot.reading : nullptr;
    }

    /// Keeps what was observed. `text` makes the text of an enumeration; it is called only where the value is
    /// another one than before.
    void keep(Role role, const Observation& observation, const MessageReport& report, ObservedText& text);
    /// Keeps the values of the neighbour for the roles of neighbours.
    void keepNeighbour(const Neighbour& cell);
    /// Forgets the value of the role if it is from that leaf.
    void forgetLeaf(Role role, const CatalogueField& leaf);
    void forget(Role role) { _slots[static_cast<std::size_t>(role)].isKnown = false; }
    /// Those of the serving cell, or all.
    void forgetServing();
    void forgetAll();

    [[nodiscard]] bool isEmpty() const;
    /// Replaces the leaves that the readings are from; those without another are from none.
    template <class Find>
    void findLeaves(Find find) {
        for (Slot& each : _slots)
            each.reading.leaf = each.isKnown && each.reading.leaf ? find(*each.reading.leaf) : nullptr;
    }

private:
    struct Slot {
        Reading reading; ///< its text keeps its storage when the value is forgotten
        bool isKnown = false;
    };
    std::array<Slot, static_cast<std::size_t>(Role::DataRate) + 1> _slots;
};

} // namespace velmora
