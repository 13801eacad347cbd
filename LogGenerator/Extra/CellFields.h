// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Extra/Cell.h"
#include "LogGenerator/Fields/FieldVisitor.h"

#include <cstdint>
#include <span>
#include <string_view>

namespace velmora {

/// Which part of a cell's number is shown.
enum class CellNumber : std::uint8_t {
    Whole,      ///< all of it, unchanged
    Low16,      ///< the low 16 bits, unsigned
    SignedLow16 ///< the low 16 bits, signed
};

/// What a level of a cell reads while the phone has not measured it; it shows as no text at all.
inline constexpr std::int64_t levelNotMeasured = 32767;

/// One row of the table of what a section shows of a cell in the cell information array. A table has at most
/// 32 rows.
struct CellField {
    constexpr CellField(CellKey cellKey, CellNumber part, std::string_view label, const TextFormat& format,
                        std::string_view failureLine, const Meaning& means = {})
        : key(cellKey), number(part), field{label, computed, format, means}, failure(failureLine) {}

    CellKey key;
    CellNumber number;
    Field field;
    std::string_view failure; ///< the error line where the cell has no such number; empty for none
};

/// Which of the fields the cell has, the first row in bit 0.
[[nodiscard]] std::uint32_t fieldsOf(const Cell& cell, std::span<const CellField> fields);

/// Logs the error line of each field that the cell does not have, in table order.
void logMissingFields(const Cell& cell, std::span<const CellField> fields);

/// Names every field that the cell has, in table order.
void visitCell(const Cell& cell, std::span<const CellField> fields, FieldVisitor& visitor);

} // namespace velmora
