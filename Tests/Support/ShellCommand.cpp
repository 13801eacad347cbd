// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Support/ShellCommand.h"

#include <array>
#include <cstdio>

#include <sys/wait.h>

namespace velmora {

ShellOutcome runShell(const std::string& command) {
    ShellOutcome outcome;
    // In a subshell, so that all of a line of several commands is covered.
    std::FILE* const pipe = ::popen(("(" + command + "\n) 2>/dev/null").c_str(), "r");
    if (pipe == nullptr)
        return outcome;
    std::array<char, 4096> buffer{};
    while (const std::size_t count = std::fread(buffer.data(), 1, buffer.size(), pipe))
        outcome.output.append(buffer.data(), count);
    if (const int status = ::pclose(pipe); status != -1 && WIFEXITED(status))
        outcome.status = WEXITSTATUS(status);
    return outcome;
}

std::string shellQuoted(const std::string& words) {
    std::string quoted = "'";
    for (const char character : words)
        if (character == '\'')
            quoted += "'\\''";
        else
            quoted += character;
    return quoted + "'";
}

} // namespace velmora
