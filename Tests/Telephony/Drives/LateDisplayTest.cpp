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

// What a drive shows does not depend on when somebody looks: sections hand their records to the display,
// which turns them into text only then.

namespace velmora {
namespace {

/// A decoder with a state of its own.
struct Decoding {
    std::unique_ptr<LogGenerator> decoder;
    Dictionary state;
};

class LateDisplayTest : public testing::TestWithParam<const char*> {
protected:
    LateDisplayTest() {
        for (const char* name : {"Ostrel_GSM", "LTE", "Ostrel_UTRAN", "C2KTemplate"})
            resources.put(name, "plist", shippedResource(std::string(name) + ".plist"));
    }

    Decoding decoding(std::string_view technology) {
        return {LogGenerator::generatorFromTechnology(technology, clock), {}};
    }

    CapturedLog log{LogPriority::Emergency};
    FakeClock clock;
    FakeResources resources;
};

TEST_P(LateDisplayTest, LookingAtEveryMessageChangesNothing) {
    const std::unique_ptr<Scenario> scenario = scenarioKindNamed(GetParam())->make(7);
    Decoding watched = decoding(scenario->technology());
    Decoding late = decoding(scenario->technology());
    ASSERT_NE(watched.decoder, nullptr);
    for (int i = 0; i < 6000; ++i) {
        const ScenarioEvent event = scenario->next();
        watched.decoder->updateState(watched.state, event.message);
        late.decoder->updateState(late.state, event.message);
        // Comparing looks at every value there is.
        EXPECT_EQ(watched.state["Display"], watched.state["Display"].copy());
        if (i % 20 != 19)
            continue;
        static_cast<void>(watched.decoder->generateLogUsingState(watched.state));
        static_cast<void>(late.decoder->generateLogUsingState(late.state));
        if (i % 100 != 99)
            continue;
        // Five entries, the oldest made 80 messages ago.
        ASSERT_EQ(late.state["History"].asArray()->size(), 5u);
        ASSERT_EQ(late.state["History"], watched.state["History"]) << "after message " << i;
        if (i % 300 == 299) {
            ASSERT_EQ(late.state["Display"], watched.state["Display"]) << "after message " << i;
        }
    }
}

INSTANTIATE_TEST_SUITE_P(Drives, LateDisplayTest, testing::Values("gsm", "c2k", "lte", "utran"),
                         [](const auto& drive) { return std::string(drive.param); });

} // namespace
} // namespace velmora
