// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Files/FileResources.h"

#include "Platform/Linux/BuildStamp.h"
#include "Platform/Linux/Files/EnvironmentPath.h"
#include "Platform/Linux/Files/Files.h"

#include <algorithm>
#include <set>
#include <system_error>
#include <utility>

namespace velmora {

namespace {

constexpr std::size_t maximumResourceSize = std::size_t{64} << 20;

} // namespace

FileResources::FileResources(std::vector<std::filesystem::path> directories)
    : _directories(std::move(directories)) {}

std::vector<std::filesystem::path> FileResources::ownDirectories() {
    std::vector<std::filesystem::path> directories;
    if (const auto own = environmentPath("VELMORA_RESOURCES"); !own.empty())
        directories.push_back(own);
    if (const auto config = environmentPath("XDG_CONFIG_HOME"); config.is_absolute())
        directories.push_back(config / "velmora");
    else if (const auto home = environmentPath("HOME"); home.is_absolute())
        directories.push_back(home / ".config/velmora");
    return directories;
}

std::vector<std::filesystem::path> FileResources::standardDirectories() {
    std::vector<std::filesystem::path> directories;
    const auto add = [&directories](const std::filesystem::path& directory) {
        if (std::find(directories.begin(), directories.end(), directory) == directories.end())
            directories.push_back(directory);
    };
    for (const std::filesystem::path& own : ownDirectories())
        add(own);
    std::error_code error;
    if (const auto program = std::filesystem::read_symlink("/proc/self/exe", error); !error)
        add((program.parent_path() / "../share/velmora").lexically_normal());
    add(VELMORA_INSTALLED_RESOURCES);
#ifdef VELMORA_SOURCE_RESOURCES
    add(VELMORA_SOURCE_RESOURCES);
#endif
    return directories;
}

Result<Data> FileResources::read(std::string_view name, std::string_view type) const {
    const std::string file = std::string(name) + "." + std::string(type);
    if (name.empty() || file.find('/') != file.npos || file.find('\0') != file.npos)
        return Failure{std::string("\"").append(file).append("\" is no resource's name")};
    std::string places;
    for (const auto& directory : _directories) {
        const auto path = directory / file;
        std::error_code error;
        if (std::filesystem::status(path, error).type() != std::filesystem::file_type::not_found) {
            auto content = readFile(path, maximumResourceSize);
            if (!content)
                return Failure{path.string() + ": " + content.reason()};
            return content;
        }
        places += (places.empty() ? " in " : ", ") + directory.string();
    }
    return Failure{"no resource " + file + places};
}

std::vector<std::string> FileResources::list(std::string_view type) const {
    const std::string suffix = std::string(".").append(type);
    std::set<std::string> names;
    for (const auto& directory : _directories) {
        std::error_code error;
        std::filesystem::directory_iterator entries(directory, error);
        for (; !error && entries != std::filesystem::directory_iterator(); entries.increment(error)) {
            std::string name = entries->path().filename().string();
            if (name.size() <= suffix.size() || !name.ends_with(suffix))
                continue;
            name.resize(name.size() - suffix.size());
            names.insert(std::move(name));
        }
    }
    return {names.begin(), names.end()};
}

std::optional<std::string> FileResources::bundleVersion() const {
    return VELMORA_VERSION;
}

std::string FileResources::buildStamp() const {
    return programBuildStamp();
}

} // namespace velmora
