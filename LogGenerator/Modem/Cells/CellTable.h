// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/FieldVisitor.h"
#include "LogGenerator/Modem/Cells/CellRanges.h"
#include "LogGenerator/Modem/Cells/ReportedCell.h"

#include <cstdint>
#include <span>
#include <string_view>

namespace velmora::LiveModem {

/// The roles of a cell's fields: those of the serving cell, of a neighbour, or none.
struct CellRoles {
    Role countryCode = Role::None;
    Role networkCode = Role::None;
    Role area = Role::None;
    Role cell = Role::None;
    Role channel = Role::None;
    Role physicalCell = Role::None;
    Role level = Role::None;
    Role quality = Role::None;
};

/// What a row shows of a cell: a number of the message, or what is computed of several.
struct CellRow {
    using Show = void (*)(const ReportedCell& cell, const CellRow& row, FieldVisitor& visitor);

    RadioTechnologies technologies; ///< that have the value
    bool isOfPlace;                 ///< known of a cell that is known by its identity alone
    std::string_view key;           ///< empty where it is computed
    Range range;                    ///< of the message's number
    Show show;
    Field field;
};

/// The rows of a cell, in the order in which they are shown.
[[nodiscard]] std::span<const CellRow> servingCellRows();
[[nodiscard]] std::span<const CellRow> secondaryCellRows();
[[nodiscard]] std::span<const CellRow> neighborCellRows();

/// Names all that the rows show of the cell.
void visitCell(const ReportedCell& cell, std::span<const CellRow> rows, FieldVisitor& visitor);

} // namespace velmora::LiveModem
