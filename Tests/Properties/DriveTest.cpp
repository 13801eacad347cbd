// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/Observations/DecodedTechnology.h"
#include "Tests/Properties/Conversions.h"

#include <gtest/gtest.h>

#include <rapidcheck/gtest.h>

#include <chrono>

// Whatever the seed, a drive's messages can be decoded, recorded and read again.

namespace velmora {
namespace {

class Drives : public testing::TestWithParam<DecodedTechnology> {
protected:
    static constexpr std::size_t messages = 60;

    static std::vector<GivenMessage> driveOf(std::uint64_t seed, std::size_t count) {
        const auto scenario = scenarioKindNamed(GetParam().scenario)->make(seed);
        std::vector<GivenMessage> drive;
        while (drive.size() < count) {
            const ScenarioEvent event = scenario->next();
            drive.push_back({FakeClock::defaultNow() + event.offset, event.message});
        }
        return drive;
    }
};

TEST_P(Drives, AreDecodedWithoutAnException) {
    rc::detail::checkGTest([] {
        TechnologyUnderTest tested(GetParam());
        for (const GivenMessage& each : driveOf(*rc::gen::arbitrary<std::uint64_t>().as("seed"), messages))
            tested.decoder().updateState(tested.state, each.message);
        const Value display = tested.decoder().generateLogUsingState(tested.state);
        RC_ASSERT(bool(display.asDictionary()));
        RC_ASSERT(!display.asDictionary()->empty());
        RC_ASSERT(bool(writeXMLPropertyList(display)));
    });
}

TEST_P(Drives, AreInTheOrderOfTheirTimesAndSurviveARecording) {
    const std::string technology(scenarioKindNamed(GetParam().scenario)->make(1)->technology());
    rc::detail::checkGTest([&] {
        const auto drive = driveOf(*rc::gen::arbitrary<std::uint64_t>().as("seed"), messages);
        const auto isEarlier = [](const GivenMessage& a, const GivenMessage& b) { return a.time < b.time; };
        RC_ASSERT(std::is_sorted(drive.begin(), drive.end(), isEarlier));
        RC_ASSERT(messagesOf(recordingOf(drive, technology)) == drive);
    });
}

INSTANTIATE_TEST_SUITE_P(Technologies, Drives, testing::ValuesIn(decodedTechnologies),
                         [](const auto& decoded) { return std::string(decoded.param.scenario); });

} // namespace
} // namespace velmora
