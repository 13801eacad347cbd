// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Picture/CellIdentity.h"
#include "Analysis/Picture/RadioTechnology.h"
#include "Analysis/Picture/Reading.h"

#include <optional>

namespace velmora {

/// A message reported another serving cell than the ones before it.
struct ServingChange {
    CellIdentity from;
    CellIdentity to; ///< as far as this message reports it
    /// What the radio did until then; where no message had reported it, what this one reports.
    std::optional<RadioMode> mode;
    /// Whether the network moved the phone, by that mode; absent where the mode does not tell.
    std::optional<bool> isMovedByNetwork;
    std::optional<double> level_dBm; ///< of the cell that it left, as last reported
    MessageNumber lastOfOld;         ///< the last message that reported anything of that cell
    // Where it has been known since the phone came to that cell:
    std::optional<CellIdentity> before; ///< the cell that it had left for it
    std::optional<Time> since;          ///< when it came
    MessageNumber firstOfOld;           ///< the message that reported that
};

} // namespace velmora
