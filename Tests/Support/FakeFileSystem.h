// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/FileSystem.h"

#include <map>
#include <set>
#include <string>
#include <string_view>

namespace velmora {

/// Files in memory: the paths that exist, and what was written.
class FakeFileSystem final : public FileSystem {
public:
    std::set<std::string, std::less<>> paths;
    std::string logDirectory = "/logs";
    std::map<std::string, std::string> written;
    /// Where set, nothing can be written.
    bool isFull = false;

    [[nodiscard]] bool exists(std::string_view absolutePath) const override {
        return paths.find(absolutePath) != paths.end();
    }
    [[nodiscard]] std::string diagnosticLogDirectory() const override { return logDirectory; }
    Result<Done> writeDirectly(const std::string& path, std::string_view content) override {
        if (isFull)
            return Failure{"cannot be written: No space left on device"};
        written[path] = std::string(content);
        return Done();
    }
};

} // namespace velmora
