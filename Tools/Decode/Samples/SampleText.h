// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Observation.h"
#include "Tools/Decode/DecodeOptions.h"
#include "Tools/Text/CSVText.h"
#include "Tools/Text/TextBuffer.h"

#include <cstdint>
#include <optional>
#include <string>

namespace velmora {

/// The shortest decimal number that reads back as the same double: "-71", "-97.25".
void appendNumber(TextBuffer& out, double number);
void appendNumber(TextBuffer& out, std::uint64_t number);

/// The cell of an observed value: a number in the leaf's unit, the raw number of an enumeration, "true" or
/// "false", a text, bytes in hexadecimal digits; nothing for an absent value.
void appendCsvValue(TextBuffer& out, const Observation& observation, CSVGuard guard);

/// Two digits a byte.
void appendHexadecimal(TextBuffer& out, Bytes bytes);

/// The names of the columns that each row begins with.
[[nodiscard]] std::string csvBeginning(const DecodeOptions& options);
/// A cell after its comma; nothing without a file.
[[nodiscard]] std::string csvCellOfFile(const std::string& file, CSVGuard guard);

/// A log code as "0x5137"; nothing where there is none.
void appendLogCode(TextBuffer& out, std::optional<std::uint32_t> code);

} // namespace velmora
