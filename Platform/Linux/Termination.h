// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string_view>

namespace velmora {

/// How a program ends when an exception is caught nowhere, memory that cannot be had among them: with a line
/// that tells why, and without a core file. Nothing here asks for memory, since there may be none left.

/// Why, for a terminate handler: "out of memory", what the exception says of itself, or that there is none.
/// Good until the program has ended.
[[nodiscard]] const char* reasonOfTermination() noexcept;

/// Writes the text to standard error, as far as that can be.
void writeToStandardError(std::string_view text) noexcept;

/// From now on such an exception ends the program with "PROGRAM: REASON" on standard error and exit status 1.
/// The name must outlive everything.
void endOnUncaughtExceptions(const char* program);

} // namespace velmora
