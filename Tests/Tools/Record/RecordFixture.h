// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/LoopTimer.h"
#include "Recording/OpenMessages.h"
#include "Tests/Tools/FakeLogService.h"
#include "Tests/Tools/ToolFixture.h"

#include <filesystem>
#include <optional>

namespace velmora {

/// A recorder's surroundings: a telephony service on the test's event loop, and access to its files.
class RecordTest : public ToolTest {
protected:
    void startService(const std::string& technology = "Ostrel_GSM") {
        _service.emplace(_directory / "ports", technology);
    }
    [[nodiscard]] bool isStreaming(std::size_t clients = 1) {
        return eventually([&] { return _service->streaming() == clients; });
    }
    /// The messages of a recording that must be complete.
    [[nodiscard]] std::vector<Data> messagesOf(const std::string& name, const std::string& technology) const {
        const auto reader = openMessages(path(name));
        if (!reader) {
            ADD_FAILURE() << reader.reason();
            return {};
        }
        std::vector<Data> messages;
        while (const auto message = (*reader)->next())
            messages.push_back(Data::copyOf(message->message.bytes()));
        EXPECT_EQ((*reader)->technology(), technology);
        EXPECT_EQ((*reader)->lossTotals().losses, 0U);
        return messages;
    }
    /// Waits until so many messages are in the file: no more than a second, as the program promises, and its
    /// start.
    [[nodiscard]] bool fileHolds(std::size_t count) {
        bool looked = false;
        LoopTimer look([&] { looked = messagesOf("drive.pcapng", "Ostrel_GSM").size() == count; });
        look.startRepeating(std::chrono::milliseconds(20));
        return eventually([&] { return looked; });
    }
    [[nodiscard]] bool exists(const std::string& name) const { return std::filesystem::exists(path(name)); }

    std::optional<FakeLogService> _service;
};

} // namespace velmora
