// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"
#include "Tools/Text/TextBuffer.h"

#include <string_view>

namespace velmora {

/// Property-list values as JSON: dictionaries in their order, data as base64, dates as ISO 8601 in UTC, none
/// (and a real that is no number) as null. Bytes that are no UTF-8 show as U+FFFD each, so that the text is
/// valid whatever a string holds. All append, and allocate nothing once the buffer is large enough.

/// A string with its quotes and escapes.
void appendJsonString(TextBuffer& out, std::string_view text);

/// A value on one line, without blanks.
void appendJson(TextBuffer& out, const Value& value);

/// A value indented by two blanks a level. `level` is the value's depth; its first line is not indented.
void appendIndentedJson(TextBuffer& out, const Value& value, int level = 0);

} // namespace velmora
