// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/Values/ValueRow.h"

namespace velmora::LiveModem {

void visitValue(const Value& value, const ValueRow& row, FieldVisitor& visitor) {
    switch (row.field.format.kind) {
    case TextFormat::Kind::Real:
        if (const auto number = numberOf(value, row.range))
            visitor.real(row.field, *number / row.divisor);
        break;
    case TextFormat::Kind::Flag:
        if (const bool* const flag = value.asBoolean())
            visitor.number(row.field, *flag ? 1 : 0);
        break;
    case TextFormat::Kind::Text:
        if (const auto text = row.toText(value))
            visitor.text(row.field, *text);
        break;
    default:
        if (const auto number = wholeNumberOf(value, row.range))
            visitor.number(row.field, *number);
        break;
    }
}

void visitValues(const Dictionary& values, std::span<const ValueRow> rows, FieldVisitor& visitor) {
    for (const ValueRow& row : rows)
        visitValue(values[row.key], row, visitor);
}

void describeValues(std::span<const ValueRow> rows, ContentVisitor& visitor) {
    for (const ValueRow& row : rows)
        visitor.keyed(row.field, {row.key, row.range.least, row.range.most, row.divisor});
}

} // namespace velmora::LiveModem
