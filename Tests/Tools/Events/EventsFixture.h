// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tests/Tools/ToolFixture.h"

#include <gmock/gmock.h>
#include <nlohmann/json.hpp>

#include <functional>
#include <string>
#include <vector>

namespace velmora {

/// The folder of the recordings that the tests share, with a slash at its end.
extern const std::string recordings;

/// Runs velmora-log with the templates and rules that are shipped.
class EventsTest : public ToolTest {
protected:
    EventsTest();

    [[nodiscard]] ToolProcess::Setup shipped(std::vector<std::string> arguments) const;
    /// The events as the program lists them in JSON lines.
    [[nodiscard]] std::vector<nlohmann::json> listed(std::vector<std::string> arguments,
                                                     int status = 0) const;
    [[nodiscard]] static std::vector<nlohmann::json> linesOf(const std::string& output);
    /// As `eventually`, of what changes without an event of the loop.
    [[nodiscard]] static bool comesToBe(const std::function<bool()>& condition);
    [[nodiscard]] std::string withRules(const std::string& text) const;
};

} // namespace velmora
