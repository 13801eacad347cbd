// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogMessages/LogMessage.h"
#include "PropertyLists/PropertyList.h"
#include "Recording/OpenMessages.h"
#include "Tests/Tools/ToolFixture.h"

#include <gtest/gtest.h>

#include <filesystem>
#include <fstream>
#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace velmora {

/// Runs `mask` on a small drive of a GSM phone with a SIM.
class MaskTest : public ToolTest {
protected:
    static constexpr const char* iccid = "8900101000000000017";

    MaskTest() {
        const auto files = makeDictionary();
        files->set("kSimFile_ICCID", iccid);
        _drive = {{at(0), rrState(4)},
                  {at(500), extraRecord(0, Value(files))},
                  {at(1000), record(0x1375, "38 39 30 30")},
                  {at(4100), rrState(5)}};
        writeRecording("drive.pcapng", "Ostrel_GSM", _drive);
        std::filesystem::create_directory(path("out"));
        std::ofstream(path("key")) << "000102030405060708090a0b0c0d0e0f101112131415161718191a1b1c1d1e1f\n";
        std::filesystem::permissions(path("key"), std::filesystem::perms(0600));
    }

    struct Outcome {
        std::string output;
        std::string messages;
    };
    /// Runs `velmora-log mask`; checks its exit status.
    Outcome mask(std::vector<std::string> arguments, int status = 0,
                 std::optional<std::string> input = std::nullopt) {
        arguments.insert(arguments.begin(), "mask");
        ToolProcess::Setup setup = tool(std::move(arguments));
        setup.input = std::move(input);
        ToolProcess process(setup);
        EXPECT_EQ(process.exitStatus(), status) << process.errors();
        return {process.output(), ownMessages(process.errors())};
    }
    [[nodiscard]] std::vector<LoggedMessage> messagesOf(const std::string& name) const {
        std::vector<LoggedMessage> messages;
        const auto reader = openMessages(path(name));
        if (!reader) {
            ADD_FAILURE() << reader.reason();
            return messages;
        }
        while (auto message = (*reader)->next()) {
            message->message = Data::copyOf(message->message.bytes());
            messages.push_back(*std::move(message));
        }
        EXPECT_EQ((*reader)->lossTotals().losses, 0U);
        return messages;
    }
    /// The SIM's number in a file; empty where it has none.
    [[nodiscard]] std::string cardIn(const std::string& name) const {
        for (const LoggedMessage& each : messagesOf(name)) {
            const auto message = LogMessage::parse(each.message.bytes());
            if (!message || message->logCode() != ExtraCode::simFiles)
                continue;
            const Result<Value> list = readPropertyList(message->payload());
            return list ? *(*list->asDictionary())["kSimFile_ICCID"].asString() : std::string();
        }
        return {};
    }
    [[nodiscard]] std::vector<std::string> outputs() const {
        std::vector<std::string> names;
        for (const auto& entry : std::filesystem::directory_iterator(_directory / "out"))
            names.push_back(entry.path().filename().string());
        return names;
    }

    std::vector<TimedMessage> _drive;
    /// What the number becomes with the key, by an independent program.
    const std::string _masked = "8912596966232995399";
};

} // namespace velmora
