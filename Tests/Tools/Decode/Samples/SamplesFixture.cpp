// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/Decode/Samples/SamplesFixture.h"

namespace velmora {

std::string SamplesTest::recording(const std::string& name) {
    return VELMORA_SOURCE_DIR "/Tests/Recordings/" + name + ".pcapng";
}

std::string SamplesTest::samplesOfRecording(std::vector<std::string> arguments) {
    arguments.insert(arguments.begin(), {"decode", "--samples", "--log-level", "0"});
    ToolProcess::Setup setup;
    setup.arguments = std::move(arguments);
    setup.environment = {{"VELMORA_RESOURCES", VELMORA_SOURCE_DIR "/Resources"}, {"TZ", "UTC"}};
    ToolProcess process(setup);
    EXPECT_EQ(process.exitStatus(), 0) << process.errors();
    return process.output();
}

std::vector<std::string> SamplesTest::recordValues(std::vector<std::string> arguments) {
    arguments.insert(arguments.begin(), VELMORA_SOURCE_DIR "/Tests/Tools/Decode/Samples/record-values.py");
    ToolProcess::Setup setup;
    setup.arguments = std::move(arguments);
    setup.environment = {{"LD_PRELOAD", ""}};
    ToolProcess reader(setup, "/usr/bin/python3");
    EXPECT_EQ(reader.exitStatus(), 0) << reader.errors();
    return lines(reader.output());
}

} // namespace velmora
