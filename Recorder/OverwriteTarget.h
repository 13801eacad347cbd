// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"

#include <filesystem>
#include <string>

namespace velmora {

/// The file that is replaced when a command overwrites `path`: what a symbolic link leads to, otherwise
/// `path` itself, which need not exist. A link is followed only to a regular file of the same user, since in
/// a shared directory any user may have made it.
[[nodiscard]] Result<std::filesystem::path> overwriteTarget(const std::string& path);

/// The message of a command that refuses to overwrite a file.
[[nodiscard]] std::string existingFileMessage(const std::string& path);

} // namespace velmora
