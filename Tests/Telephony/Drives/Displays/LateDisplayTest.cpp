// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LogGenerator.h"
#include "Telephony/Drives/ScenarioRegistry.h"
#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeResources.h"
#include "Tests/Support/ShippedResources.h"

#include <gtest/gtest.h>

#include <memory>
#include <string>

// What a drive shows does not depend on how often the display is asked for, although sections write their
// latest records only then: not its texts and not the order of its keys.

namespace velmora {
namespace {

/// A decoder with a state of its own.
struct Decoding {
    std::unique_ptr<LogGenerator> decoder;
    Dictionary state;
};

/// The value with its keys in their order, on one line.
std::string inOrder(const Value& value) {
    if (const std::string* text = value.asString())
        return *text;
    std::string result;
    if (const Dictionary* dictionary = value.asDictionary())
        for (const auto& [key, entry] : *dictionary)
            result += key + "=" + inOrder(entry) + ";";
    if (const Array* array = value.asArray())
        for (const Value& element : *array)
            result += inOrder(element) + ",";
    if (const Data* data = value.asData())
        result.assign(data->bytes().begin(), data->bytes().end());
    return "(" + result + ")";
}

class LateDisplayTest : public testing::TestWithParam<const char*> {
protected:
    LateDisplayTest() {
        for (const char* name : {"Ostrel_GSM", "LTE", "Ostrel_UTRAN", "C2KTemplate", "Modem"})
            resources.put(name, "plist", shippedResource(std::string(name) + ".plist"));
    }

    Decoding decoding(std::string_view technology) {
        return {LogGenerator::generatorFromTechnology(technology, clock), {}};
    }

    CapturedLog log{LogPriority::Emergency};
    FakeClock clock;
    FakeResources resources;
};

TEST_P(LateDisplayTest, AskingForItAtEveryMessageChangesNothing) {
    const std::unique_ptr<Scenario> scenario = scenarioKindNamed(GetParam())->make(7);
    Decoding watched = decoding(scenario->technology());
    Decoding late = decoding(scenario->technology());
    ASSERT_NE(watched.decoder, nullptr);
    for (int i = 0; i < 6000; ++i) {
        const ScenarioEvent event = scenario->next();
        watched.decoder->updateState(watched.state, event.message);
        late.decoder->updateState(late.state, event.message);
        static_cast<void>(watched.decoder->display(watched.state));
        if (i % 20 != 19)
            continue;
        static_cast<void>(watched.decoder->generateLogUsingState(watched.state));
        static_cast<void>(late.decoder->generateLogUsingState(late.state));
        if (i % 100 != 99)
            continue;
        // Five entries, the oldest made 80 messages ago.
        ASSERT_EQ(late.state["History"].asArray()->size(), 5u);
        ASSERT_EQ(inOrder(late.state["History"]), inOrder(watched.state["History"])) << "after " << i;
        ASSERT_EQ(inOrder(late.decoder->display(late.state)), inOrder(watched.state["Display"]))
            << "after message " << i;
    }
}

INSTANTIATE_TEST_SUITE_P(Drives, LateDisplayTest, testing::Values("gsm", "c2k", "lte", "utran", "modem"),
                         [](const auto& drive) { return std::string(drive.param); });

} // namespace
} // namespace velmora
