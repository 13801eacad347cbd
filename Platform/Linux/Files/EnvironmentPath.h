// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdlib>
#include <filesystem>

namespace velmora {

/// The path that an environment variable holds; empty where it is not set.
[[nodiscard]] inline std::filesystem::path environmentPath(const char* variable) {
    const char* value = std::getenv(variable);
    return value ? value : "";
}

/// One of the user's base directories: what the variable names, else `standard` in the home directory. A
/// relative path in the variable is not followed. Without a home it is below "/".
[[nodiscard]] inline std::filesystem::path userDirectory(const char* variable, const char* standard) {
    if (auto named = environmentPath(variable); named.is_absolute())
        return named;
    const auto home = environmentPath("HOME");
    return (home.is_absolute() ? home : "/") / standard;
}

} // namespace velmora
