// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "App/AppPlatform.h"
#include "Platform/Clock.h"
#include "Platform/Linux/Files/FileResources.h"
#include "Platform/Linux/Files/Files.h"
#include "Platform/Linux/Files/FolderFiles.h"
#include "Platform/Linux/Files/LinuxFileSystem.h"
#include "Platform/Linux/Files/LinuxPreferences.h"
#include "Platform/Linux/MachineClock.h"
#include "Platform/Linux/Ports/LinuxMessagePorts.h"
#include "Platform/Linux/Ports/LinuxTelephonyService.h"
#include "Platform/Linux/QtMainQueue.h"
#include "Platform/SystemLog.h"

#include <algorithm>
#include <filesystem>
#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace velmora {

/// The machine as the application's platform. Main thread only; uses the application's event loop.
class LinuxAppPlatform final : public AppPlatform {
public:
    /// Makes the directory for snapshots where it is the standard one. `portName` is the application's own.
    explicit LinuxAppPlatform(const LinuxFileSystem::Options& files,
                              std::string portName = logChannelPortName())
        : _files(files), _portName(std::move(portName)) {
        if (const auto made = _files.makeStandardLogDirectory(); !made)
            logFormat(LogPriority::Error, "Snapshots: %s", made.reason().c_str());
    }
    [[nodiscard]] ModelPlatform model() override {
        return {_ports, _queue, _telephony, _clock, [name = _portName] { return std::optional(name); }};
    }
    [[nodiscard]] FileSystem& files() override { return _files; }
    [[nodiscard]] Preferences& preferences() override { return _preferences; }
    [[nodiscard]] std::vector<RuleFile> ruleFiles() override {
        const std::vector<std::filesystem::path> own = FileResources::ownDirectories();
        std::vector<RuleFile> files;
        for (const FolderFile& each : filesInFolder(FileResources::standardDirectories(), "rules", "toml")) {
            const Result<Data> content = readFile(each.path, RuleSet::mostBytes);
            if (!content) {
                logFormat(LogPriority::Error, "%s: %s", each.path.c_str(), content.reason().c_str());
                continue;
            }
            const bool isUsers =
                std::find(own.begin(), own.end(), each.path.parent_path().parent_path()) != own.end();
            const Bytes bytes = content->bytes();
            files.push_back(
                {each.path.string(), std::string(bytes.begin(), bytes.end()), each.layer, !isUsers});
        }
        return files;
    }

private:
    QtMainQueue _queue;
    LinuxMessagePorts _ports{PortOptions::forClients()};
    LinuxTelephonyService _telephony{_ports};
    MachineClock _clock;
    LinuxFileSystem _files;
    LinuxPreferences _preferences;
    std::string _portName;
};

} // namespace velmora
