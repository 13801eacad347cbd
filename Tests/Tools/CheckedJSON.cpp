// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/CheckedJSON.h"

#include "Tests/Tools/ToolProcess.h"

#include <gtest/gtest.h>

namespace velmora {

std::string checkJSON(const std::string& schema, const std::string& text) {
    ToolProcess::Setup setup;
    setup.arguments = {VELMORA_SOURCE_DIR "/Tests/Tools/Decode/check-json.py",
                       VELMORA_SOURCE_DIR "/Resources/" + schema};
    setup.input = text;
    setup.environment = {{"LD_PRELOAD", ""}};
    ToolProcess checker(setup, "/usr/bin/python3");
    const std::optional<int> status = checker.exitStatus();
    return status == 0 ? checker.output()
                       : "status " + testing::PrintToString(status) + ": " + checker.errors();
}

} // namespace velmora
