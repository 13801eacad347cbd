// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>

namespace velmora {

/// The result of a shell command.
struct ShellOutcome {
    int status = -1;    ///< of its end: 0 to 255; -1 where it did not end by itself
    std::string output; ///< its standard output
};

/// Runs a command line with the shell and waits for its end. What it writes to standard error is left out,
/// unless the line itself sends it elsewhere.
[[nodiscard]] ShellOutcome runShell(const std::string& command);

/// The words as one word of a command line.
[[nodiscard]] std::string shellQuoted(const std::string& words);

/// Skips the test where the machine lacks a program.
// NOLINTBEGIN(bugprone-macro-parentheses) a literal, which is joined to another
#define NEEDS_PROGRAM(program)                                                                               \
    if (velmora::runShell("command -v " program).status != 0)                                                \
    GTEST_SKIP() << program << " is not installed"
// NOLINTEND(bugprone-macro-parentheses)

} // namespace velmora
