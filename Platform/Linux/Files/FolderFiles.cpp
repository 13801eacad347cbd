// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Files/FolderFiles.h"

#include <algorithm>
#include <set>
#include <string>
#include <system_error>

namespace velmora {

namespace fs = std::filesystem;

std::vector<FolderFile> filesInFolder(std::span<const fs::path> directories, std::string_view folder,
                                      std::string_view type) {
    const fs::path suffix = std::string(".").append(type);
    std::vector<FolderFile> files;
    std::set<fs::path> names;
    int layer = static_cast<int>(directories.size());
    for (const fs::path& directory : directories) {
        std::set<fs::path> own;
        std::error_code error;
        fs::directory_iterator entries(directory / folder, error);
        for (; !error && entries != fs::directory_iterator(); entries.increment(error))
            if (const fs::path& path = entries->path();
                path.extension() == suffix && names.insert(path.filename()).second)
                own.insert(path);
        for (auto path = own.rbegin(); path != own.rend(); ++path)
            files.push_back({*path, layer});
        --layer;
    }
    std::reverse(files.begin(), files.end());
    return files;
}

} // namespace velmora
