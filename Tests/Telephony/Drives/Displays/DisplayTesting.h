// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/LogGenerator.h"
#include "Platform/SystemLog.h"
#include "Telephony/Drives/Scenario.h"
#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeResources.h"
#include "Tests/Support/ShippedResources.h"

#include <gtest/gtest.h>

#include <chrono>
#include <functional>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// A technology's decoder with the template that is shipped, for tests of what a drive comes to on the
/// screens.
class DisplayTest : public testing::Test {
protected:
    /// `templateName`: its resource name without extension.
    DisplayTest(std::string_view technology, const std::string& templateName) {
        resources.put(templateName, "plist", shippedResource(templateName + ".plist"));
        decoder = LogGenerator::generatorFromTechnology(technology, clock);
    }

    /// Decodes the first `duration` and calls `look` after every message; keeps the error lines.
    template <class Kind>
    void play(std::uint64_t seed, std::chrono::nanoseconds duration, const std::function<void()>& look) {
        Kind scenario(seed);
        const CapturedLog log(LogPriority::Error);
        for (ScenarioEvent event = scenario.next(); event.offset < duration; event = scenario.next()) {
            decoder->updateState(state, event.message);
            look();
        }
        errors = log.textsAt(LogPriority::Error);
    }

    /// A section's node, at the top of the display or in a group.
    [[nodiscard]] const Value& node(std::string_view section) {
        return (*decoder->display(state).asDictionary())[section];
    }
    [[nodiscard]] const Value& node(std::string_view group, std::string_view section) {
        return (*node(group).asDictionary())[section];
    }
    /// What a dictionary shows under a label.
    [[nodiscard]] static std::string text(const Value& row, std::string_view label) {
        const std::string* shown = (*row.asDictionary())[label].asString();
        return shown ? *shown : "(none)";
    }

    FakeClock clock;
    FakeResources resources;
    std::unique_ptr<LogGenerator> decoder;
    Dictionary state;
    std::vector<std::string> errors;
};

} // namespace velmora
