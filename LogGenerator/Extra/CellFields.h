// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Extra/Cell.h"
#include "LogGenerator/Fields/Field.h"
#include "PropertyLists/Value.h"

#include <cstdint>
#include <span>
#include <string_view>
#include <vector>

namespace velmora {

/// Which part of a cell's number is shown.
enum class CellNumber : std::uint8_t {
    Whole,      ///< as it stands
    Low16,      ///< the low 16 bits, unsigned
    SignedLow16 ///< the low 16 bits, signed
};

/// What a level of a cell reads while the phone has not measured it; it shows as no text at all.
inline constexpr std::int64_t levelNotMeasured = 32767;

/// One row of the table of what a section shows of a cell in the cell information array. A table has at most
/// 31 rows.
struct CellField {
    CellKey key;
    CellNumber number;
    std::string_view label;
    Show show;
    std::string_view failure; ///< the error line where the cell has no such number; empty for none
};

/// Writes every field that the cell has, in table order. Where a number is missing its error line is written
/// instead, where there is one, the label is left as it is, and the next field follows. Without a node only
/// the error lines are written. The fields must be a constant.
void writeCellFields(Dictionary* node, const Cell& cell, std::span<const CellField> fields);

/// A list of cells: whose cells give a row, and what it shows.
struct CellRows {
    CellKind kind;
    std::span<const CellField> fields;
};

/// Makes the node's elements a row for each of the cells that the table is for, even where it has none of the
/// fields; error lines as above. `buffer` is used again from call to call. The table must be a constant.
void writeCellRows(Array* node, const std::vector<Cell>& cells, const CellRows& table,
                   std::vector<std::uint8_t>& buffer);

} // namespace velmora
