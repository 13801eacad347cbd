// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <filesystem>
#include <span>
#include <string_view>
#include <vector>

namespace velmora {

/// A file of one of several directories that override each other.
struct FolderFile {
    std::filesystem::path path;
    int layer; ///< of its directory: a larger one takes precedence
};

/// The files `folder`/*.`type` of the directories, of which an earlier one takes precedence: those of the
/// last directory first, and by name in each. A file that an earlier directory has under the same name is
/// left out. Directories that cannot be read have none.
[[nodiscard]] std::vector<FolderFile> filesInFolder(std::span<const std::filesystem::path> directories,
                                                    std::string_view folder, std::string_view type);

} // namespace velmora
