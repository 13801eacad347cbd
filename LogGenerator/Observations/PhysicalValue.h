// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Observation.h"
#include "LogGenerator/Observations/TextArena.h"

#include <cstdint>
#include <optional>
#include <string_view>

namespace velmora {

class Value;

/// The number that the field's format shows of a raw value, but with the sign that it means.
[[nodiscard]] double shownNumber(const Field& field, std::int64_t raw);

/// That number as a line: the raw value times `scale` plus `offset`.
struct ShownLine {
    double scale;
    double offset;
};
/// Absent where the number is not on one line for all that the field's place can hold.
[[nodiscard]] std::optional<ShownLine> shownLine(const Field& field);

/// A mobile country or network code (3GPP TS 23.003 2.2) of a number, with the zeros in front that it has at
/// least; empty for a number that is none.
[[nodiscard]] std::string_view codeText(const Field& field, std::int64_t number, TextArena& texts);

/// The observation of such a code: what is left of the text without blanks around, absent where that is none.
void setCode(const Field& field, std::string_view text, Observation& observation);

/// The observation of a value that was supplied ready to be shown: no dictionary, array or none. A number is
/// read from a text only where the catalogue says so of the leaf.
void setSupplied(const Value& value, TextArena& texts, Observation& observation);

} // namespace velmora
