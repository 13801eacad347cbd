// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Extra/CellFields.h"

#include "Platform/SystemLog.h"

namespace velmora {

namespace {

std::int64_t part(std::int32_t number, CellNumber wanted) {
    switch (wanted) {
    case CellNumber::Low16: return static_cast<std::uint16_t>(number);
    case CellNumber::SignedLow16: return static_cast<std::int16_t>(number);
    case CellNumber::Whole: break;
    }
    return number;
}

} // namespace

std::uint32_t fieldsOf(const Cell& cell, std::span<const CellField> fields) {
    std::uint32_t result = 0;
    for (std::size_t i = 0; i < fields.size(); ++i)
        if (cell.has(fields[i].key))
            result |= std::uint32_t{1} << i;
    return result;
}

void logMissingFields(const Cell& cell, std::span<const CellField> fields) {
    for (const CellField& row : fields)
        if (!row.failure.empty() && !cell.has(row.key))
            logLine(LogPriority::Error, row.failure);
}

void visitCell(const Cell& cell, std::span<const CellField> fields, FieldVisitor& visitor) {
    for (const CellField& row : fields)
        if (const auto number = cell.number(row.key))
            visitor.number(row.field, part(*number, row.number));
}

} // namespace velmora
