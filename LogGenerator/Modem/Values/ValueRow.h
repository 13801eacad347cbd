// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/FieldVisitor.h"
#include "LogGenerator/Modem/Values/TypedValue.h"
#include "LogGenerator/Observations/ContentVisitor.h"

#include <span>
#include <string>
#include <string_view>

namespace velmora::LiveModem {

/// One row of the table of what is shown of a message's dictionary: which value, within which range, and how.
/// The field's format says what the value has to be: a whole number for an integer or an enumeration, a
/// number for a real, a boolean for a flag, what TypedValue.h makes a text of for a text.
struct ValueRow {
    std::string_view key;
    Field field;
    Range range{};      ///< of the message's number
    double divisor = 1; ///< what makes a real one in the field's unit
    /// Makes the text of a value that is none by itself; it is absent where this returns none.
    std::optional<std::string> (*toText)(const Value& value) = textOf;
};

/// Names the value, if it is there.
void visitValue(const Value& value, const ValueRow& row, FieldVisitor& visitor);
/// Names all that are there, in table order.
void visitValues(const Dictionary& values, std::span<const ValueRow> rows, FieldVisitor& visitor);
/// The fields of the table, for the catalogue.
void describeValues(std::span<const ValueRow> rows, ContentVisitor& visitor);

} // namespace velmora::LiveModem
