// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Resources.h"

#include <filesystem>
#include <string>
#include <vector>

namespace velmora {

/// Resources that are files `name`.`type` in a list of directories. Each resource is taken from the first
/// directory that has it, so that an engineer can override a single installed template.
class FileResources final : public Resources {
public:
    explicit FileResources(std::vector<std::filesystem::path> directories = standardDirectories());

    /// $VELMORA_RESOURCES, $XDG_CONFIG_HOME/velmora (~/.config/velmora), share/velmora beside the
    /// executable's directory, the installed data directory, the source tree's Resources/ if the build was
    /// configured so; each once.
    [[nodiscard]] static std::vector<std::filesystem::path> standardDirectories();

    /// The first two of these.
    [[nodiscard]] static std::vector<std::filesystem::path> ownDirectories();

    /// A resource that exists but cannot be read is a failure; later directories are not searched.
    [[nodiscard]] Result<Data> read(std::string_view name, std::string_view type) const override;
    [[nodiscard]] std::vector<std::string> list(std::string_view type) const override;
    [[nodiscard]] std::optional<std::string> bundleVersion() const override;
    [[nodiscard]] std::string buildStamp() const override;

private:
    std::vector<std::filesystem::path> _directories;
};

} // namespace velmora
