// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"

#include <string>
#include <string_view>

namespace velmora {

/// The file operations that the application needs. Main thread only.
class FileSystem {
public:
    virtual ~FileSystem() = default;
    /// Whether a file or directory exists at this absolute path, looked up under the program's system root if
    /// it has one.
    [[nodiscard]] virtual bool exists(std::string_view absolutePath) const = 0;
    /// Where snapshots go, without a trailing "/". It need not exist.
    [[nodiscard]] virtual std::string diagnosticLogDirectory() const = 0;
    /// Creates the file at `path`, or replaces its content in place: a concurrent reader sees part of it. A
    /// missing directory is a failure.
    virtual Result<Done> writeDirectly(const std::string& path, std::string_view content) = 0;
};

} // namespace velmora
