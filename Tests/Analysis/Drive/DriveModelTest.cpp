// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Drive/DriveModel.h"
#include "Tests/Analysis/Drive/KeptSamples.h"
#include "Tests/LogGenerator/Observations/DecodedTechnology.h"
#include "Tests/Support/CapturedLog.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using namespace std::chrono_literals;

/// A drive of the LTE scenario.
class DriveModelTest : public testing::Test {
protected:
    DriveModelTest() { drive.setDecoder(&technology.decoder()); }
    ~DriveModelTest() override { drive.setDecoder(nullptr); }

    void play(int messages) {
        for (int i = 0; i < messages; ++i) {
            const ScenarioEvent event = scenario->next();
            technology.clock().setNow(FakeClock::defaultNow() + event.offset);
            technology.decoder().updateState(technology.state, event.message);
        }
    }

    TechnologyUnderTest technology{decodedTechnologies[1]};
    std::unique_ptr<Scenario> scenario = scenarioKindNamed("lte")->make(1);
    KeptSamples kept;
    DriveModel drive{kept, technology.clock()};
};

TEST_F(DriveModelTest, KnowsNothingAtFirst) {
    EXPECT_FALSE(drive.now().technology);
    EXPECT_FALSE(drive.now().level);
    EXPECT_TRUE(drive.neighbours().empty());
    EXPECT_TRUE(drive.events().empty());
    EXPECT_FALSE(drive.latest());
}

TEST_F(DriveModelTest, ShowsServingCellNeighboursAndEvents) {
    play(3000);
    const DriveNow now = drive.now();
    ASSERT_TRUE(now.technology);
    ASSERT_TRUE(now.channel);
    ASSERT_TRUE(now.band);
    ASSERT_TRUE(now.level);
    EXPECT_EQ(*now.technology, RadioTechnology::LTE);
    EXPECT_LT(now.level->number, 0);
    EXPECT_EQ(now.level->text.front(), '-');
    EXPECT_LE(now.level->time, *drive.latest());
    EXPECT_THAT(now.band->text, testing::HasSubstr("band"));
    EXPECT_FALSE(drive.events().empty());
    EXPECT_FALSE(kept.changes.empty());
}

TEST_F(DriveModelTest, TimesAreThoseOfTheMessages) {
    play(500);
    for (const auto& [series, samples] : kept.samples)
        for (const KeptSamples::Sample& each : samples) {
            EXPECT_GE(each.time, FakeClock::defaultNow());
            EXPECT_LE(each.time, *drive.latest());
        }
}

TEST_F(DriveModelTest, ForgetsTheRadioAtAnInterruptionAndKeepsWhatHappened) {
    play(3000);
    const std::size_t events = drive.events().size();
    drive.interrupt();
    EXPECT_FALSE(drive.now().level);
    EXPECT_TRUE(drive.neighbours().empty());
    EXPECT_GE(drive.events().size(), events);
    EXPECT_FALSE(kept.samples.empty());
    EXPECT_FALSE(kept.changes.back().technology);
}

TEST_F(DriveModelTest, ForgetsAllAtAReset) {
    play(3000);
    drive.reset();
    EXPECT_FALSE(drive.now().level);
    EXPECT_TRUE(drive.events().empty());
    EXPECT_TRUE(kept.samples.empty());
    EXPECT_FALSE(drive.latest());
    EXPECT_EQ(drive.messages(), 0U);
    play(500);
    EXPECT_TRUE(drive.latest());
}

TEST_F(DriveModelTest, GoesOnWithAnotherDecoder) {
    const std::string level = "/Serving Cell/Serving Cell Measurements/Measured RSRP";
    ASSERT_TRUE(drive.togglePin(level));
    play(1000);
    const std::size_t samples = kept.samples[firstPinnedSeries].size();
    ASSERT_GT(samples, 0U);
    TechnologyUnderTest other{decodedTechnologies[1]};
    drive.setDecoder(&other.decoder());
    play(500); // the earlier one's messages count no more
    EXPECT_EQ(kept.samples[firstPinnedSeries].size(), samples);
    EXPECT_FALSE(drive.now().level);
    for (int i = 0; i < 500; ++i) {
        const ScenarioEvent event = scenario->next();
        other.clock().setNow(FakeClock::defaultNow() + event.offset);
        other.decoder().updateState(other.state, event.message);
    }
    EXPECT_GT(kept.samples[firstPinnedSeries].size(), samples);
    drive.setDecoder(nullptr);
}

TEST_F(DriveModelTest, PinsRowsThatHaveNumbersAlone) {
    const std::string level = "/Serving Cell/Serving Cell Measurements/Measured RSRP";
    EXPECT_TRUE(drive.canPin(level));
    EXPECT_TRUE(drive.canPin("/Idle Mode Neighbors/Neighbor Cells List/0/Measured RSRP"));
    EXPECT_FALSE(drive.canPin("/Serving Cell/Serving Cell Info/Download Bandwidth")); // an enumeration
    EXPECT_FALSE(drive.canPin("/no such row"));
    EXPECT_TRUE(drive.togglePin(level));
    EXPECT_TRUE(drive.isPinned(level));
    EXPECT_EQ(drive.series().back().name, level);
    EXPECT_EQ(drive.series().back().unit, Unit::DBm);
    EXPECT_EQ(kept.pins, std::vector<std::string>{level});
    EXPECT_TRUE(drive.togglePin(level));
    EXPECT_FALSE(drive.isPinned(level));
    EXPECT_TRUE(kept.pins.empty());
}

TEST_F(DriveModelTest, APinnedRowOfAListIsThatRowAlone) {
    const std::string row = "/Idle Mode Neighbors/Neighbor Cells List/1/Measured RSRP";
    ASSERT_TRUE(drive.togglePin(row));
    ASSERT_TRUE(drive.togglePin("/Idle Mode Neighbors/Neighbor Cells List/*/Measured RSRP"));
    play(3000);
    const std::size_t ofRow = kept.samples[firstPinnedSeries].size();
    EXPECT_GT(ofRow, 0U);
    EXPECT_GT(kept.samples[firstPinnedSeries + 1].size(), ofRow);
}

TEST(DriveRulesTest, FindsEventsOfRulesAndLogsTheirMistakes) {
    TechnologyUnderTest technology{decodedTechnologies[1]};
    CapturedLog log;
    KeptSamples kept;
    DriveModel drive(kept, technology.clock(), [] {
        return std::vector<RuleFile>{{"my.toml",
                                      "[[rule]]\nname = \"seen\"\nseverity = \"warning\"\n"
                                      "when = \"serving.level < 0 dBm\"\ntext = \"seen\"\n",
                                      1},
                                     {"bad.toml", "[[rule]]\n", 1}};
    });
    drive.setDecoder(&technology.decoder());
    EXPECT_THAT(log.textsAt(LogPriority::Error), testing::Contains(testing::StartsWith("bad.toml:")));
    const std::unique_ptr<Scenario> scenario = scenarioKindNamed("lte")->make(1);
    for (int i = 0; i < 500; ++i) {
        const ScenarioEvent event = scenario->next();
        technology.clock().setNow(FakeClock::defaultNow() + event.offset);
        technology.decoder().updateState(technology.state, event.message);
    }
    EXPECT_THAT(drive.events(), testing::Contains(testing::Field(&Event::kind, "seen")));
    drive.setDecoder(nullptr);
}

} // namespace
} // namespace velmora
