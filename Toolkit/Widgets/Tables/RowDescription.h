// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Tables/TableRowSummary.h"

#include <QAccessible>
#include <QString>

#include <cstddef>

namespace velmora {

class TableWidget;

/// The cell's name and accessory, or what the data source says of a row without a cell.
[[nodiscard]] TableRowSummary rowSummary(const TableWidget& table, std::size_t row);
/// What screen readers get of a row besides its name, whether or not it is on the screen.
[[nodiscard]] QAccessible::State rowState(const TableWidget& table, std::size_t row,
                                          TableCellAccessory accessory);
/// "Opens a list" for a row that does; else empty.
[[nodiscard]] QString rowDescription(TableCellAccessory accessory);
/// Presses or focuses the row, which comes onto the screen first.
void doRowAction(TableWidget& table, std::size_t row, const QString& action);

} // namespace velmora
