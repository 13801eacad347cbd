#pragma once

#include "LogGenerator/Field.h"
#include "Platform/Value.h"

#include <cstdint>
#include <span>
#include <string_view>

namespace velmora {

/// Which part of a cell's number is shown.
enum class CellNumber : std::uint8_t {
    Whole,      ///< as it stands
    Low16,      ///< the low 16 bits, unsigned
    SignedLow16 ///< the low 16 bits, signed
};

/// What a level of a cell reads while the phone has not measured it; it shows as no text at all.
inline constexpr std::int64_t levelNotMeasured = 32767;

/// One row of the table of what a section shows of a cell in the cell information array.
struct CellField {
    std::string_view key; ///< the telephony service's
    CellNumber number;
    std::string_view label;
    Show show;
    std::string_view failure; ///< the error line where the cell has no such number
};

/// Writes every field that the cell has, in table order. Where a number is missing its error line is written
/// instead, the label is left as it is, and the next field follows. Without a node only the error lines are
/// written.
void writeCellFields(Dictionary* node, const Dictionary& cell, std::span<const CellField> fields);

} // namespace velmora
