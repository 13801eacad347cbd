// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/FileSystem.h"

#include <filesystem>

namespace velmora {

/// The machine's files, with a system root as prefix of the paths that the platform fixes: for tests, and for
/// machines that have no such tree.
class LinuxFileSystem final : public FileSystem {
public:
    struct Options {
        /// Put before absolute paths; empty for none.
        std::filesystem::path sysroot;
        /// The snapshots' directory, used unchanged; empty for the default: $XDG_STATE_HOME/velmora
        /// (~/.local/state/velmora) under the system root.
        std::filesystem::path logDirectory;
    };

    explicit LinuxFileSystem(Options options = {});

    /// Creates the default directory for snapshots if it is missing; one that the user named is not created.
    /// The reason names the directory.
    Result<Done> makeStandardLogDirectory() const;

    [[nodiscard]] bool exists(std::string_view absolutePath) const override;
    [[nodiscard]] std::string diagnosticLogDirectory() const override { return _logDirectory.string(); }
    Result<Done> writeDirectly(const std::string& path, std::string_view content) override;

private:
    std::filesystem::path _sysroot;
    std::filesystem::path _logDirectory;
    bool _isStandard;
};

} // namespace velmora
