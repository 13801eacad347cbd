// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"

#include <cstddef>
#include <string>
#include <string_view>

class QVariant;

namespace velmora {

/// The bounds of what is taken from one message of the bus. A modem's data is a few kilobytes; what is beyond
/// these bounds is absurd, and is left out.
namespace BusBounds {
inline constexpr std::size_t text = 1024;   ///< bytes of a string
inline constexpr std::size_t values = 8192; ///< values of a message, at all depths together
inline constexpr int depth = 12;            ///< of containers in containers
} // namespace BusBounds

/// What a message of the bus holds, as a value: numbers become integers or reals, strings, object paths and
/// signatures become strings, bytes data, arrays and structures arrays, dictionaries dictionaries whose keys
/// are text (numbers in decimal); a variant becomes what is in it. None stands for what lies beyond the
/// bounds, for an unsigned number beyond the signed ones, and for what no value can hold; in a dictionary or
/// an array that is left out, but not in a structure, whose places have a meaning.
[[nodiscard]] Value busValue(const QVariant& content);

/// Text of others, fit for a log line: cut to 200 bytes, control characters as question marks.
[[nodiscard]] std::string quotable(std::string_view text);

} // namespace velmora
