// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Tables/TableCellAccessory.h"

#include <string>

namespace velmora {

/// What a screen reader says of a row that is not on the screen, and so has no cell.
struct TableRowSummary {
    std::string name; ///< as the cell's `rowName` would be
    TableCellAccessory accessory = TableCellAccessory::none;
};

} // namespace velmora
