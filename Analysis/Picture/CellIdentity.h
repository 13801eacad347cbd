// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Picture/RadioTechnology.h"

#include <optional>
#include <string>

namespace velmora {

/// Which cell it is, as far as messages reported it.
struct CellIdentity {
    std::optional<RadioTechnology> technology;
    std::optional<double> cell; ///< the values of the roles
    std::optional<double> channel;
    std::optional<double> physicalCell;
    std::optional<double> area;
    std::string network; ///< "001-01"; empty where it is not known

    /// Whether anything that identifies a cell is known: more than its network and area.
    [[nodiscard]] bool isKnown() const { return cell || channel || physicalCell; }
};

/// Whether both are one cell: absent where what is known of both does not tell. Network and area are not
/// compared: other records report them, which arrive later than those of a new cell.
[[nodiscard]] std::optional<bool> areSameCell(const CellIdentity& one, const CellIdentity& other);

/// "PCI 62 on EARFCN 6300", "cell 10131 on UARFCN 10588", "ARFCN 33": what people call it. Empty for an
/// unknown one.
[[nodiscard]] std::string nameOf(const CellIdentity& cell);

} // namespace velmora
