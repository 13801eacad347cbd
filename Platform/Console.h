// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdio>
#include <string_view>

namespace velmora {

/// Prints a line that is not for the log (to standard output unless redirected).
void printLine(std::string_view text);

/// Sends those lines to `stream` from now on; a program whose standard output carries a result keeps it clean
/// by sending them to standard error. Returns the earlier stream. The caller keeps `stream` open.
std::FILE* redirectConsole(std::FILE* stream);

} // namespace velmora
