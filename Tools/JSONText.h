#pragma once

#include "Platform/Value.h"

#include <string>
#include <string_view>

namespace velmora {

/// A property-list value as JSON, indented by two blanks a level: dictionaries in their order, data as
/// base64, dates as ISO 8601 in UTC, none (and a real that is no number) as null. Bytes that are no UTF-8
/// show as U+FFFD, so that the text is valid whatever a string holds. `level` is how deep the value stands;
/// its first line is not indented.
[[nodiscard]] std::string jsonText(const Value& value, int level = 0);

/// A string with its quotes and escapes, in valid UTF-8.
[[nodiscard]] std::string jsonString(std::string_view text);

} // namespace velmora
