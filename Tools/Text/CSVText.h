// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"
#include "Tools/Text/TextBuffer.h"

#include <string_view>

namespace velmora {

/// Whether texts that a spreadsheet would take for a formula are guarded against that: one that begins with
/// =, +, -, @, a tab, a carriage return or a line feed and is no number gets an apostrophe in front.
enum class CSVGuard : bool { Off, On };

/// Cells of comma-separated values as RFC 4180 has them. Both append one cell, without the comma.

/// A text, in quotes where it holds a quote, comma, line break or control character, and where it is empty:
/// an empty cell without quotes is one that has no value. Bytes that are no UTF-8, and the zero character,
/// which readers of such files refuse, show as U+FFFD.
void appendCsvText(TextBuffer& out, std::string_view text, CSVGuard guard = CSVGuard::Off);

/// A value of the display: nothing for null, a string as text, any other kind as text in the form of JSON.
void appendCsvCell(TextBuffer& out, const Value* value, CSVGuard guard = CSVGuard::Off);

/// What ends a row.
inline constexpr std::string_view csvRowEnd = "\r\n";

} // namespace velmora
