// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string_view>

namespace velmora {

/// How a program ends on an uncaught exception, out of memory included: with a line that reports the reason,
/// and without a core file. Nothing here allocates, since memory may be exhausted.

/// The reason, for a terminate handler: "out of memory", the exception's what(), or that there is no
/// exception. Valid until the program ends.
[[nodiscard]] const char* terminationReason() noexcept;

/// Writes the text to standard error, ignoring errors.
void writeToStandardError(std::string_view text) noexcept;

/// From now on such an exception ends the program with "PROGRAM: REASON" on standard error and exit status 1.
/// The name must outlive everything.
void endOnUncaughtExceptions(const char* program);

} // namespace velmora
