// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tests/Tools/FakeLogService.h"
#include "Tests/Tools/ToolFixture.h"

#include <gmock/gmock.h>

#include <chrono>
#include <csignal>
#include <filesystem>
#include <optional>
#include <regex>

#include <termios.h>

namespace velmora {

inline constexpr const char* enterScreen = "\x1b[?1049h\x1b[?25l";
inline constexpr const char* leaveScreen = "\x1b[?25h\x1b[?1049l";

inline const std::string noService =
    "velmora-log: no telephony service answers; start one with velmora-telephonyd --source modemmanager (the "
    "modem) or velmora-telephonyd --source scenario:gsm,seed=1 (a synthetic drive)\n";

/// The text with every status line's time as "TIME".
inline std::string withoutTimes(const std::string& text) {
    static const std::regex time("Updated [0-9]{4}-[0-9]{2}-[0-9]{2} at [0-9]{2}:[0-9]{2}:[0-9]{2}");
    return std::regex_replace(text, time, "Updated TIME");
}

class WatchCommandTest : public ToolTest {
protected:
    void startService(const std::string& technology = "IFX") {
        _service.emplace(_directory / "ports", technology);
    }
    /// Waits until so many start commands have come; more where the program has not waited for an answer.
    [[nodiscard]] bool isStreaming(std::size_t clients = 1) {
        return eventually([&] { return _service->streaming() >= clients; });
    }
    /// Sends the message until the program shows the text.
    [[nodiscard]] bool isShownFor(const Data& message, const ToolProcess& process, const std::string& text) {
        for (int i = 0; i < 20; ++i) {
            _service->send(message);
            if (testLoop().runUntil([&] { return process.output().find(text) != std::string::npos; },
                                    std::chrono::seconds(3)))
                return true;
        }
        return false;
    }
    void sendBand(const std::string& band) {
        const DictionaryRef display = makeDictionary();
        display->set("Band", band);
        _service->send(serialized(display));
    }
    [[nodiscard]] ToolProcess::Setup onTerminal(std::vector<std::string> arguments) const {
        ToolProcess::Setup setup = tool(std::move(arguments));
        setup.onTerminal = true;
        return setup;
    }

    std::optional<FakeLogService> _service;
};

} // namespace velmora
