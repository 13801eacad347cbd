// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/MessageReport.h"
#include "Analysis/Picture/CellIdentity.h"
#include "Analysis/Picture/LeafTable.h"
#include "Analysis/Picture/LeafUse.h"
#include "Analysis/Picture/NeighbourCells.h"
#include "Analysis/Picture/PictureMemory.h"
#include "Analysis/Picture/RadioSideState.h"
#include "Analysis/Picture/RadioTechnology.h"
#include "Analysis/Picture/Reading.h"
#include "Analysis/Picture/RoleReadings.h"
#include "Analysis/Picture/ServingChange.h"
#include "LogGenerator/Fields/Role.h"
#include "LogGenerator/Observations/Catalogue.h"
#include "Platform/Clock.h"

#include <array>
#include <chrono>
#include <optional>
#include <span>
#include <vector>

namespace velmora {

/// What the messages of one technology have reported of the radio network: the latest values of the roles, by
/// the radio technology of the serving cell, and the neighbour cells. A value that the messages withdrew, or
/// that was of another serving cell, is not in it; a damaged message changes nothing.
class RadioPicture {
public:
    /// A serving cell that no message has reported anything of for so long is not known any more.
    static constexpr std::chrono::seconds servingLifetime{5};

    /// The catalogue, which may grow, must outlive it.
    explicit RadioPicture(const Catalogue& catalogue);

    /// Whether it uses what messages report of the leaf.
    [[nodiscard]] bool wants(const CatalogueField& leaf) const { return velmora::useOf(leaf, _table).isUsed; }
    void update(const MessageReport& report);
    /// Nothing is known any more.
    void clear();

    /// What is known, which another picture of this technology may continue from.
    [[nodiscard]] PictureMemory memory() const;
    /// Continues from there instead of from nothing.
    void setMemory(const PictureMemory& memory);

    [[nodiscard]] const Catalogue& catalogue() const { return _catalogue; }
    /// Null where it is not known. For the roles of neighbours that of the strongest one of the serving
    /// cell's radio technology.
    [[nodiscard]] const Reading* find(Role role) const;
    /// The same of that radio technology, where the phone has a serving cell of several: null where it has
    /// none.
    [[nodiscard]] const Reading* find(Role role, RadioTechnology technology) const;
    /// The strongest first; those without a level last.
    [[nodiscard]] std::span<const Neighbour> neighbours() const { return _neighbours.cells(); }
    /// Absent where no message has reported it.
    [[nodiscard]] std::optional<RadioTechnology> technology() const { return _technology; }
    [[nodiscard]] std::optional<RadioMode> mode() const;
    [[nodiscard]] CellIdentity serving() const;
    /// The same without its network and area.
    [[nodiscard]] CellIdentity servingCell() const { return identity(_current); }
    /// Set where the latest message reported another serving cell; null otherwise.
    [[nodiscard]] const ServingChange* servingChange() const { return _change ? &*_change : nullptr; }
    /// Whether the phone has serving cells of several radio technologies at the same time.
    [[nodiscard]] bool isHybrid() const { return _table.isHybrid; }

private:
    const LeafUse& useOf(const CatalogueField& leaf);
    void addReported(RadioSide side);
    /// Notes what the message says of serving cells and neighbours, before any of it is kept.
    void gather(const MessageReport& report);
    void forgetOld(Time now);
    void forgetWithdrawn(const ObservedMessage& message);
    void change(const MessageReport& report);
    void keep(const MessageReport& report);
    /// Forgets what was in a list of serving cells that the message replaced.
    void forgetReplaced(const MessageReport& report);
    void forgetCell(RadioSide side);
    /// There is no serving cell any more: of that side or, where it is the common one, of any.
    void forgetCells(RadioSide side);
    void findCurrent();
    void findStrongest();
    [[nodiscard]] RadioSideState& current() { return _sides[_current]; }
    [[nodiscard]] const RadioSideState& current() const { return _sides[_current]; }
    [[nodiscard]] CellIdentity identity(RadioSide side) const;

    const Catalogue& _catalogue;
    const TechnologyTable& _table;
    LeafTable<LeafUse> _uses;
    std::array<RadioSideState, radioSides> _sides;
    std::vector<RadioSide>
        _reported; ///< those that leaves report anything of, in order; of others nothing is known
    NeighbourCells _neighbours;
    RoleReadings _strongest; ///< the strongest neighbour's
    std::optional<RadioTechnology> _technology;
    std::optional<RadioTechnology> _named; ///< the radio technology that the message names
    RadioSide _current = commonSide;       ///< of the serving cell
    std::optional<ServingChange> _change;
    std::vector<const Observation*> _toKeep; ///< of the message: values of roles but neighbours'
    ObservedText _text;
    /// The lists of serving cells, as far as they have been seen.
    struct ServingList {
        const CatalogueNode* list;
        RadioSide side;
        Role role;
        friend bool operator==(const ServingList&, const ServingList&) = default;
    };
    std::vector<ServingList> _servingLists;
};

} // namespace velmora
