// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/Events/EventsFixture.h"

#include "Platform/Linux/LoopTimer.h"

#include <chrono>
#include <cstddef>
#include <fstream>
#include <utility>

namespace velmora {

const std::string recordings = VELMORA_SOURCE_DIR "/Tests/Recordings/";

EventsTest::EventsTest() {
    // Searching for a network (4), camped on a cell (5), and searching again.
    writeRecording("drive.pcapng", "Ostrel_GSM",
                   {{at(0), rrState(4)}, {at(10'000), rrState(5)}, {at(20'000), rrState(4)}});
}

ToolProcess::Setup EventsTest::shipped(std::vector<std::string> arguments) const {
    ToolProcess::Setup setup = tool(std::move(arguments));
    setup.environment["VELMORA_RESOURCES"] = VELMORA_SOURCE_DIR "/Resources";
    setup.environment["XDG_CONFIG_HOME"] = path("config");
    return setup;
}

std::vector<nlohmann::json> EventsTest::listed(std::vector<std::string> arguments, int status) const {
    arguments.insert(arguments.begin(), {"events", "--format", "jsonl"});
    ToolProcess process(shipped(arguments));
    EXPECT_EQ(process.exitStatus(), status) << process.errors();
    return linesOf(process.output());
}

std::vector<nlohmann::json> EventsTest::linesOf(const std::string& output) {
    std::vector<nlohmann::json> lines;
    for (std::size_t begin = 0, end = 0; (end = output.find('\n', begin)) != output.npos; begin = end + 1)
        lines.push_back(nlohmann::json::parse(output.substr(begin, end - begin)));
    return lines;
}

bool EventsTest::comesToBe(const std::function<bool()>& condition) {
    LoopTimer look([] {});
    look.startRepeating(std::chrono::milliseconds(20));
    return eventually(condition);
}

std::string EventsTest::withRules(const std::string& text) const {
    std::ofstream(path("my.toml")) << text;
    return path("my.toml");
}

} // namespace velmora
