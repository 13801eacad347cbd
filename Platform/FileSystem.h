// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"

#include <string>
#include <string_view>

namespace velmora {

/// What the application asks of the machine's files. Main thread only.
class FileSystem {
public:
    virtual ~FileSystem() = default;
    /// Whether there is anything, file or directory, at this absolute path. Where the program was given a
    /// system root, the path is looked for under it.
    [[nodiscard]] virtual bool exists(std::string_view absolutePath) const = 0;
    /// Where snapshots go; without a "/" at the end. It need not exist.
    [[nodiscard]] virtual std::string diagnosticLogDirectory() const = 0;
    /// Makes the file at `path` as it stands, or replaces its content in place: who reads it meanwhile sees
    /// part of it. A missing directory is a failure.
    virtual Result<Done> writeDirectly(const std::string& path, std::string_view content) = 0;
};

} // namespace velmora
