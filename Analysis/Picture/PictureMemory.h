// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Picture/LeafUse.h"
#include "Analysis/Picture/RadioSideState.h"
#include "Analysis/Picture/Reading.h"

#include <cstddef>
#include <optional>
#include <utility>
#include <vector>

namespace velmora {

/// What a picture knows, for a picture of another decoder of the same technology to continue from. What it
/// refers to is in the catalogue of the decoder that it was made with, which must exist when it is used.
struct PictureMemory {
    std::vector<std::pair<RadioSide, RadioSideState>> sides; ///< of which anything is known
    std::vector<Neighbour> neighbours;                       ///< in the order of their levels
    std::vector<const CatalogueNode*> lists;                 ///< that each of them is of
    std::optional<RadioTechnology> technology;
    RadioSide current = commonSide;

    /// About how much memory it needs, in bytes.
    [[nodiscard]] std::size_t size() const {
        return sizeof *this + sides.size() * sizeof sides[0] +
               neighbours.size() * (sizeof(Neighbour) + sizeof(CatalogueNode*));
    }
};

} // namespace velmora
