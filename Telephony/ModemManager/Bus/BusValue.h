// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"

#include <cstddef>
#include <string>
#include <string_view>

class QVariant;

namespace velmora {

/// Limits of what is read from one bus message. A modem's data is a few kilobytes; what exceeds these limits
/// is implausible and skipped.
namespace BusBounds {
inline constexpr std::size_t text = 1024;    ///< bytes of a string
inline constexpr std::size_t values = 65536; ///< values of a message, at all depths together
inline constexpr int depth = 12;             ///< of containers in containers
} // namespace BusBounds

/// What a message of the bus holds, as a value: numbers become integers or reals, strings, object paths and
/// signatures become strings, bytes data, arrays and structures arrays, dictionaries dictionaries whose keys
/// are text (numbers in decimal); a variant becomes what is in it. None for what exceeds the limits, for an
/// unsigned number out of the signed range, and for unsupported types; dictionaries and arrays omit it, but
/// not structures, whose positions have a meaning.
[[nodiscard]] Value busValue(const QVariant& content);

/// External text made safe for a log line: truncated to 200 bytes, control characters as question marks.
[[nodiscard]] std::string printableForLog(std::string_view text);

} // namespace velmora
