// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Picture/Technologies/TechnologyTable.h"
#include "LogGenerator/Observations/Catalogue.h"

#include <cstddef>
#include <cstdint>

namespace velmora {

/// The values of one radio technology are kept apart from those of another; what no technology is known of
/// has a side of its own.
using RadioSide = std::uint8_t;
inline constexpr RadioSide commonSide = radioTechnologies;
inline constexpr std::size_t radioSides = radioTechnologies + 1;

[[nodiscard]] constexpr RadioSide sideOf(RadioTechnology technology) {
    return static_cast<RadioSide>(technology);
}

/// Whether it is a role of the serving cell, of which nothing is known any more when that changes.
[[nodiscard]] constexpr bool isServing(Role role) {
    return (role >= Role::ServingCountryCode && role <= Role::ServingQuality) ||
           role == Role::BlockErrorRate || role == Role::DataRate;
}
[[nodiscard]] constexpr bool isNeighbour(Role role) {
    return role >= Role::NeighbourChannel && role <= Role::NeighbourQuality;
}

/// What the picture makes of a leaf.
struct LeafUse {
    bool isUsed = false; ///< at all
    bool isOfNeighbour = false;
    bool isOfSide = false;  ///< it reports something of a serving cell or of the mode
    Role role = Role::None; ///< none for one that is ignored
    RadioSide side = commonSide;
    bool namesTechnology = false; ///< of the serving cell
    NeighbourPart part = NeighbourPart::None;
    const ModeTable* modes = nullptr;
    const ModeEvidence* evidence = nullptr;
    const CatalogueNode* list = nullptr; ///< that holds its row; null outside of lists
    bool isOfDetectedCell = false;
};

[[nodiscard]] LeafUse useOf(const CatalogueField& leaf, const TechnologyTable& table);

} // namespace velmora
