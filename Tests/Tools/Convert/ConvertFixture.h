// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/PropertyList.h"
#include "Recording/OpenMessages.h"
#include "Tests/Tools/ToolFixture.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace velmora {

/// Runs `convert` on a small drive of a GSM phone.
class ConvertTest : public ToolTest {
protected:
    ConvertTest() {
        writeRecording("drive.pcapng", "Ostrel_GSM", _drive);
        std::filesystem::create_directory(path("out"));
    }

    /// Runs `velmora-log convert` and returns its messages; checks its exit status.
    std::string convert(std::vector<std::string> arguments, int status,
                        std::optional<std::string> input = std::nullopt) {
        arguments.insert(arguments.begin(), "convert");
        ToolProcess::Setup setup = tool(std::move(arguments));
        setup.input = std::move(input);
        ToolProcess process(setup);
        EXPECT_EQ(process.exitStatus(), status) << process.errors();
        EXPECT_EQ(process.output(), "");
        return ownMessages(process.errors());
    }
    /// What is in the directory that the tests write to.
    [[nodiscard]] std::vector<std::string> outputs() const {
        std::vector<std::string> names;
        for (const auto& entry : std::filesystem::directory_iterator(_directory / "out"))
            names.push_back(entry.path().filename().string());
        return names;
    }
    [[nodiscard]] std::vector<Data> messagesOf(const std::string& name) const {
        std::vector<Data> messages;
        const auto reader = openMessages(path(name));
        if (!reader) {
            ADD_FAILURE() << reader.reason();
            return messages;
        }
        while (const auto message = (*reader)->next())
            messages.push_back(Data::copyOf(message->message.bytes()));
        EXPECT_EQ((*reader)->lossTotals().losses, 0U);
        return messages;
    }
    [[nodiscard]] Value snapshot(const std::string& name) const {
        const std::string text = contentOf(name);
        const auto list =
            readPropertyList(Bytes(reinterpret_cast<const std::uint8_t*>(text.data()), text.size()));
        return list ? *list : Value();
    }

    const std::vector<TimedMessage> _drive = {
        {at(0), rrState(4)}, {at(500), record(0x4125, "03")}, {at(4100), rrState(5)}};
};

} // namespace velmora
