// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tests/Tools/ToolFixture.h"

#include <gmock/gmock.h>
#include <nlohmann/json.hpp>

#include <filesystem>
#include <fstream>
#include <iterator>

#include <string>
#include <vector>

namespace velmora {

inline const std::string recordings = VELMORA_SOURCE_DIR "/Tests/Recordings/";

/// Runs velmora-log with the templates and rules that are shipped.
class EventsTest : public ToolTest {
protected:
    EventsTest() {
        // Searching for a network (4), camped on a cell (5), and searching again.
        writeRecording("drive.pcapng", "Ostrel_GSM",
                       {{at(0), rrState(4)}, {at(10'000), rrState(5)}, {at(20'000), rrState(4)}});
    }

    [[nodiscard]] ToolProcess::Setup shipped(std::vector<std::string> arguments) const {
        ToolProcess::Setup setup = tool(std::move(arguments));
        setup.environment["VELMORA_RESOURCES"] = VELMORA_SOURCE_DIR "/Resources";
        setup.environment["XDG_CONFIG_HOME"] = path("config");
        return setup;
    }
    /// The events as the program lists them in JSON lines.
    [[nodiscard]] std::vector<nlohmann::json> listed(std::vector<std::string> arguments,
                                                     int status = 0) const {
        arguments.insert(arguments.begin(), {"events", "--format", "jsonl"});
        ToolProcess process(shipped(arguments));
        EXPECT_EQ(process.exitStatus(), status) << process.errors();
        return linesOf(process.output());
    }
    [[nodiscard]] static std::vector<nlohmann::json> linesOf(const std::string& output) {
        std::vector<nlohmann::json> lines;
        for (std::size_t begin = 0, end = 0; (end = output.find('\n', begin)) != output.npos; begin = end + 1)
            lines.push_back(nlohmann::json::parse(output.substr(begin, end - begin)));
        return lines;
    }
    [[nodiscard]] std::string withRules(const std::string& text) const {
        std::ofstream(path("my.toml")) << text;
        return path("my.toml");
    }
};

} // namespace velmora
