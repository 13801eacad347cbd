// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogMessages/RecordTime.h"
#include "Platform/TelephonyService.h"
#include "Telephony/Drives/DriveScenario.h"
#include "Telephony/Drives/ScenarioRegistry.h"
#include "Tests/Telephony/Drives/ExpectedDrives.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <memory>
#include <vector>

/// What holds for every scenario. What is particular to one is in its own file.

namespace velmora {
namespace {

using namespace std::chrono_literals;

Drive driveOf(std::string_view name, std::uint64_t seed, std::chrono::nanoseconds duration) {
    const std::unique_ptr<Scenario> scenario = scenarioKindNamed(name)->make(seed);
    return velmora::driveOf(*scenario, duration);
}

struct Spoken {
    const char* name;
    std::string_view technology;
};

class ScenarioTest : public testing::TestWithParam<Spoken> {};

TEST_P(ScenarioTest, speaksItsTechnology) {
    EXPECT_EQ(scenarioKindNamed(GetParam().name)->make(1)->technology(), GetParam().technology);
}

TEST_P(ScenarioTest, theSameSeedGivesTheSameBytes) {
    const Drive first = driveOf(GetParam().name, 1, 20min);
    const Drive again = driveOf(GetParam().name, 1, 20min);
    ASSERT_EQ(again.size(), first.size());
    for (std::size_t i = 0; i < again.size(); ++i) {
        ASSERT_EQ(again[i].offset, first[i].offset) << "message " << i;
        ASSERT_EQ(again[i].message, first[i].message) << "message " << i;
    }
}

INSTANTIATE_TEST_SUITE_P(Drives, ScenarioTest,
                         testing::Values(Spoken{"gsm", kVoxLogChannelTechnology_Ostrel_GSM},
                                         Spoken{"c2k", kVoxLogChannelTechnology_Ostrel_CDMA},
                                         Spoken{"lte", kVoxLogChannelTechnology_Ostrel_LTE},
                                         Spoken{"utran", kVoxLogChannelTechnology_Ostrel_UTRAN2},
                                         Spoken{"ifx", kVoxLogChannelTechnology_IFX},
                                         Spoken{"modem", kVoxLogChannelTechnology_Modem}),
                         [](const auto& scenario) { return std::string(scenario.param.name); });

/// The scenarios whose messages are log records.
class RecordScenarioTest : public testing::TestWithParam<ExpectedDrive> {
protected:
    [[nodiscard]] Drive drive(std::uint64_t seed, std::chrono::nanoseconds duration) const {
        return driveOf(expected.name, seed, duration);
    }

    const ExpectedDrive& expected = GetParam();
};

/// How many records all codes have together.
std::size_t countOf(const std::map<std::uint32_t, std::vector<Bytes>>& records) {
    std::size_t count = 0;
    for (const auto& [code, each] : records)
        count += each.size();
    return count;
}

std::string scenarioName(const testing::TestParamInfo<ExpectedDrive>& info) {
    return info.param.name;
}

TEST_P(RecordScenarioTest, anotherSeedGivesAnotherDrive) {
    std::set<std::vector<unsigned>> drives;
    for (std::uint64_t seed = 1; seed <= 5; ++seed) {
        std::vector<unsigned> traits;
        for (const ScenarioEvent& event : drive(seed, 2min))
            if (const auto header = LogMessage::parse(event.message.bytes()))
                if (const auto trait = expected.trait(*header))
                    traits.push_back(*trait);
        drives.insert(traits);
    }
    EXPECT_EQ(drives.size(), 5U);
}

TEST_P(RecordScenarioTest, everyCodeComesWithinARound) {
    for (const std::uint64_t seed : severalSeeds) {
        std::set<std::uint32_t> missing = expected.codes;
        for (const ScenarioEvent& event : drive(seed, expected.round))
            if (const auto header = LogMessage::parse(event.message.bytes());
                header && expected.good(*header))
                missing.erase(header->logCode());
        EXPECT_THAT(missing, testing::IsEmpty()) << "codes without a good record, seed " << seed;
    }
}

TEST_P(RecordScenarioTest, aboutSoManyMessagesComeASecond) {
    const std::chrono::seconds duration = expected.length;
    const double rate =
        static_cast<double>(drive(1, duration).size()) / static_cast<double>(duration.count());
    EXPECT_GE(rate, expected.leastRate);
    EXPECT_LE(rate, expected.mostRate);
}

TEST_P(RecordScenarioTest, timeAscendsAndStampsFollowIt) {
    std::chrono::nanoseconds last{0};
    for (const ScenarioEvent& event : drive(1, expected.length)) {
        EXPECT_GE(event.offset, last);
        last = event.offset;
        if (const auto header = LogMessage::parse(event.message.bytes())) {
            EXPECT_EQ(header->timestamp(), recordTimestamp(DriveScenario::startTime() + event.offset));
        }
    }
}

INSTANTIATE_TEST_SUITE_P(Drives, RecordScenarioTest,
                         testing::Values(expectedGSMDrive(), expectedC2KDrive(), expectedLTEDrive(),
                                         expectedUTRANDrive(), expectedModemDrive()),
                         scenarioName);

/// Those of them whose records have tables of requirements, and that send the extra stream.
class SectionScenarioTest : public RecordScenarioTest {};

TEST_P(SectionScenarioTest, recordsMatchTheirTablesExceptUnusualOnes) {
    const ExpectedOddRecords& odd = expected.odd;
    const Drive searched = drive(1, odd.length);
    const RecordCensus census = censusOf(searched, *expected.requirements);
    EXPECT_EQ(codesOf(census.good), expected.codes);
    EXPECT_THAT(codesOf(census.belowMinimum), odd.shortCodes);
    EXPECT_THAT(countOf(census.belowMinimum), odd.shortCount);
    for (const auto& [code, records] : census.belowMinimum)
        for (const Bytes record : records)
            EXPECT_THAT(expected.requirements->at(code).minimum - record.size(), odd.missing);
    EXPECT_THAT(codesOf(census.overrun), odd.overrunCodes);
    EXPECT_THAT(countOf(census.overrun), odd.overrunCount);
    for (const auto& [code, records] : census.overrun)
        EXPECT_THAT(records.size(), odd.overrunsOfEachCode) << std::hex << code;
    EXPECT_THAT(countOf(census.belowMinimum) + countOf(census.overrun), odd.count);
}

TEST_P(SectionScenarioTest, everyKindOfUnusualMessageOccurs) {
    int tooShort = 0;
    int prefixed = 0;
    int wrongType = 0;
    int unknownCode = 0;
    for (const ScenarioEvent& event : drive(1, expected.length)) {
        const auto header = LogMessage::parse(event.message.bytes());
        if (!header) {
            EXPECT_EQ(event.message.size(), 5U);
            EXPECT_EQ(event.message.bytes()[0], 1);
            ++tooShort;
        } else if (header->prefixed) {
            EXPECT_EQ(header->type, 1);
            EXPECT_TRUE(expected.good(*header)) << std::hex << header->logCode();
            ++prefixed;
        } else if (header->type == 2) {
            ++wrongType;
        } else {
            EXPECT_THAT(header->type, testing::AnyOf(1, 0xFF));
            unknownCode += !expected.codes.contains(header->logCode());
        }
    }
    for (const int count : {tooShort, prefixed, wrongType, unknownCode})
        EXPECT_GE(count, 3);
}

TEST_P(SectionScenarioTest, extraPayloadsAreReadablePropertyListsOfBothForms) {
    expectExtraLists(drive(4, 15min), [](unsigned code, const Value& list) {
        if (code == 0) {
            for (const auto& [key, value] : *list.asDictionary()) {
                EXPECT_TRUE(key.starts_with("kSimFile_")) << key;
                EXPECT_TRUE(value.asString()) << key;
            }
        } else {
            for (const Value& each : *list.asArray())
                EXPECT_TRUE(each.asDictionary());
        }
    });
}

INSTANTIATE_TEST_SUITE_P(Drives, SectionScenarioTest,
                         testing::Values(expectedGSMDrive(), expectedLTEDrive(), expectedUTRANDrive()),
                         scenarioName);

} // namespace
} // namespace velmora
