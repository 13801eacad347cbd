// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LogGenerator.h"
#include "Platform/Linux/Files/FileResources.h"
#include "Platform/TelephonyService.h"
#include "Telephony/Drives/GSM/GSMScenario.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Tools/ToolFixture.h"

#include <nlohmann/json.hpp>

#include <set>
#include <string>
#include <vector>

// A drive as the telephony service makes it, recorded and decoded with the display templates that are
// shipped.

namespace velmora {
namespace {

using Json = nlohmann::ordered_json;

/// Sections that decode nothing, or whose lists are never filled.
const std::set<std::string> emptySections = {
    "Coding Scheme",       "Cell Change Counters", "UMTS RR Measurement", "Non-Ranked GSM Set",
    "Non-Ranked UMTS Set", "Detected Set",         "Monitored Set",       "Virtual Active Set"};

/// The names of the empty nodes of a display.
void collectEmpty(const Value& display, std::vector<std::string>& names) {
    for (const auto& [key, value] : *display.asDictionary()) {
        const Array* array = value.asArray();
        const Dictionary* dictionary = value.asDictionary();
        if ((array && array->empty()) || (dictionary && dictionary->empty()))
            names.push_back(key);
        else if (dictionary)
            collectEmpty(value, names);
    }
}

std::vector<std::string> emptyNodes(const Json& display) {
    std::vector<std::string> names;
    for (const auto& [key, value] : display.items()) {
        if (value.empty())
            names.push_back(key);
        else if (value.is_object())
            for (const std::string& name : emptyNodes(value))
                names.push_back(name);
    }
    return names;
}

TEST_F(ToolTest, RecordedDriveFillsEverySectionButThoseThatStayEmpty) {
    ::setenv("VELMORA_RESOURCES", VELMORA_SOURCE_DIR "/Resources", 1);
    FileResources shipped;
    Resources* const earlier = setResources(&shipped);
    const FakeClock clock;
    const auto decoder = LogGenerator::generatorFromTechnology(kVoxLogChannelTechnology_Ostrel_GSM, clock);
    Dictionary state;
    GSMScenario scenario(1);
    std::vector<TimedMessage> messages;
    // A drive comes round within ten minutes; at some moment of it all sections show something.
    std::vector<std::string> empty = {"all"};
    while (std::set(empty.begin(), empty.end()) != emptySections) {
        const ScenarioEvent event = scenario.next();
        ASSERT_LT(event.offset, std::chrono::minutes(10)) << testing::PrintToString(empty);
        messages.push_back({at(0) + event.offset, event.message});
        decoder->updateState(state, event.message);
        empty.clear();
        collectEmpty(decoder->display(state), empty);
    }
    setResources(earlier);

    writeRecording("drive.pcapng", "Ostrel_GSM", messages);
    ToolProcess::Setup setup = tool({"decode", "--format", "json", "--log-level", "0", path("drive.pcapng")});
    setup.environment["VELMORA_RESOURCES"] = VELMORA_SOURCE_DIR "/Resources";
    ToolProcess process(setup);
    ASSERT_EQ(process.exitStatus(), 0) << process.errors();
    const Json decoded = Json::parse(process.output());
    EXPECT_EQ(decoded["messages"], messages.size());
    const std::vector<std::string> shown = emptyNodes(decoded["display"]);
    EXPECT_EQ(std::set(shown.begin(), shown.end()), emptySections);
    EXPECT_EQ(shown.size(), emptySections.size());
}

} // namespace
} // namespace velmora
