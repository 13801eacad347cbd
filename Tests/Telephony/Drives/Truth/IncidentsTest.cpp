// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/ScenarioRegistry.h"
#include "Tests/Telephony/Drives/Truth/KeptTruth.h"

#include <gmock/gmock.h>

#include <memory>

namespace velmora {
namespace {

/// The truth of the scenario's round of incidents.
KeptTruth incidentsOf(std::string_view scenario, std::uint64_t seed, double duration_s) {
    KeptTruth truth;
    const std::unique_ptr<Scenario> drive = scenarioKindNamed(scenario)->make(seed);
    drive->addIncidents();
    drive->tellTruth(truth);
    while (secondsOf(drive->next().offset) < duration_s) {
    }
    drive->finishTruth();
    return truth;
}

TEST(IncidentsTest, ofGSMHaveACallThatIsReestablishedAndOneThatIsLost) {
    const KeptTruth truth = incidentsOf("gsm", 1, 280);
    EXPECT_EQ(truth.of("call-setup").size(), 2U);
    EXPECT_EQ(truth.of("re-establishment").size(), 2U);
    EXPECT_EQ(truth.of("call-end").size(), 1U);
    ASSERT_EQ(truth.of("call-lost").size(), 1U);
    EXPECT_LT(truth.of("call-end")[0].at, truth.of("call-lost")[0].at);
}

TEST(IncidentsTest, haveReselectionsThatAreLateAndEarly) {
    for (const char* scenario : {"gsm", "lte"}) {
        std::size_t late = 0;
        std::size_t early = 0;
        for (std::uint64_t seed = 1; seed <= 5; ++seed) {
            const KeptTruth truth = incidentsOf(scenario, seed, 280);
            late += truth.of("late-reselection").size();
            early += truth.of("early-reselection").size();
        }
        EXPECT_GT(late, 2U) << scenario;
        EXPECT_GT(early, 2U) << scenario;
    }
}

TEST(IncidentsTest, haveStallsOfWhichAShortOneIsNone) {
    for (const char* scenario : {"c2k", "modem"}) {
        const auto stalls = incidentsOf(scenario, 1, 150).of("data-stall");
        ASSERT_EQ(stalls.size(), 2U) << scenario;
        for (const TruthEvent& each : stalls) {
            ASSERT_TRUE(each.end.has_value()) << scenario;
            EXPECT_GE(*each.end - each.at, std::chrono::seconds(10)) << scenario;
        }
    }
}

TEST(IncidentsTest, areInNoOtherDrive) {
    for (const char* kind : {"call-lost", "re-establishment", "data-stall"})
        for (const char* scenario : {"gsm", "c2k", "modem"})
            EXPECT_TRUE(truthOf(scenario, 1, 300).of(kind).empty()) << scenario << ' ' << kind;
}

} // namespace
} // namespace velmora
