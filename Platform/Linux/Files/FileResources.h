// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Resources.h"

#include <filesystem>
#include <string>
#include <vector>

namespace velmora {

/// Resources that are files `name`.`type` in a row of directories. Each resource is taken from the first
/// directory that has it, so that an engineer can put a single template of his own before the installed ones.
class FileResources final : public Resources {
public:
    explicit FileResources(std::vector<std::filesystem::path> directories = standardDirectories());

    /// $VELMORA_RESOURCES, $XDG_CONFIG_HOME/velmora (~/.config/velmora), share/velmora beside the
    /// executable's directory, the installed data directory, the source tree's Resources/ where the build was
    /// told to look there; each once.
    [[nodiscard]] static std::vector<std::filesystem::path> standardDirectories();

    /// A resource that is there but cannot be read is a failure; the directories after it are not looked at.
    [[nodiscard]] Result<Data> read(std::string_view name, std::string_view type) const override;
    [[nodiscard]] std::vector<std::string> list(std::string_view type) const override;
    [[nodiscard]] std::optional<std::string> bundleVersion() const override;
    [[nodiscard]] std::string buildStamp() const override;

private:
    std::vector<std::filesystem::path> _directories;
};

} // namespace velmora
