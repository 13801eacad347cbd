// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/LTE/LTEScenario.h"

#include "Tests/Telephony/Drives/ExpectedDrives.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <map>
#include <set>
#include <vector>

namespace velmora {
namespace {

using namespace std::chrono_literals;

/// Twenty minutes of seed 1: several rounds.
const Drive& twentyMinutes() {
    static const Drive drive = driveOf<LTEScenario>(1, 20min);
    return drive;
}

/// The end of the candidate whose bytes reach furthest.
std::size_t candidatesEnd(Bytes record) {
    std::size_t end = 21;
    for (std::size_t i = 0; i < record[19]; ++i) {
        const std::size_t start = 21 + 4 * i;
        if (start + 4 > record.size())
            return start + 4;
        const unsigned type = u16(record, start + 2);
        end = std::max(end, start + (type < 3 ? 8 : type < 5 ? 12 : 4));
    }
    return end;
}

const Requirements requirements = {
    {0xB0C1, {22, nullptr}},
    {0xB0C2, {38, nullptr}},
    {0xB179, {29, [](Bytes r) { return std::size_t{29} + 6U * r[27] + 2U * r[28]; }}},
    {0xB17F, {33, nullptr}},
    {0xB180, {21, [](Bytes r) { return std::size_t{21} + 20U * ((u16(r, 19) >> 6 & 0x1F) + 1); }}},
    {0xB186, {21, candidatesEnd}},
    {0xFF0000, {14, nullptr}},
    {0xFF0001, {14, nullptr}},
    {0xFF0002, {14, nullptr}},
};

/// The requirements' codes.
const std::set<std::uint32_t> codes = codesOf(requirements);
const RecordCheck isGood = meets(requirements);

/// Calls `look` with every good record of that code.
void eachGood(std::uint32_t code, const std::function<void(Bytes)>& look) {
    eachRecord(twentyMinutes(), code, isGood, look);
}

const std::map<unsigned, unsigned> uplinks = {{1300, 19300}, {3175, 21175}, {6300, 24300},
                                              {9310, 27310}, {3625, 21625}, {2410, 20410}};

TEST(LTEScenarioTest, aRoundBringsEveryBandwidthAndTechnology) {
    for (const std::uint64_t seed : severalSeeds) {
        std::set<unsigned> bandwidths;
        std::set<unsigned> types;
        for (const ScenarioEvent& event : driveOf<LTEScenario>(seed, 3min)) {
            const auto header = LogMessage::parse(event.message.bytes());
            if (!header || !isGood(*header))
                continue;
            if (header->logCode() == 0xB0C2)
                bandwidths.insert(header->record[20]);
            if (header->logCode() == 0xB186)
                for (std::size_t i = 0; i < header->record[19]; ++i)
                    types.insert(u16(header->record, 23 + 4 * i));
        }
        EXPECT_EQ(bandwidths, (std::set<unsigned>{6, 15, 25, 50, 75, 100})) << seed;
        EXPECT_EQ(types, (std::set<unsigned>{0, 1, 2, 3, 4, 9})) << seed;
    }
}

TEST(LTEScenarioTest, theServingCellComesFirst) {
    bool servingFirst = false;
    expectExtraLists(twentyMinutes(), [&](unsigned code, const Value& list) {
        if (code != 1 || list.asArray()->size() < 4)
            return;
        const Dictionary& first = *(*list.asArray())[0].asDictionary();
        servingFirst =
            servingFirst || first["kVoxCellMonitorCellType"] == Value("kVoxCellMonitorCellTypeServing");
    });
    EXPECT_TRUE(servingFirst);
}

TEST(LTEScenarioTest, servingCellsArePlausible) {
    std::set<unsigned> areas;
    std::set<unsigned> carriers;
    std::set<unsigned> cells;
    eachGood(0xB0C2, [&](Bytes r) {
        EXPECT_LE(u16(r, 14), 503U);
        const auto uplink = uplinks.find(u16(r, 16));
        ASSERT_NE(uplink, uplinks.end());
        EXPECT_EQ(u16(r, 18), uplink->second);
        EXPECT_EQ(r[20], r[21]);
        EXPECT_LT(u16(r, 24), 1U << 12) << "28 bits";
        EXPECT_THAT(u16(r, 28), ::testing::AnyOf(3, 5, 7, 8, 20, 28));
        carriers.insert(u16(r, 16));
        cells.insert(u16(r, 22) | u16(r, 24) << 16);
        areas.insert(u16(r, 26));
    });
    EXPECT_EQ(carriers.size(), 6U);
    EXPECT_GE(cells.size(), 12U) << "the cell changes on the way";
    areas.erase(0); // of a damaged record
    EXPECT_EQ(areas, (std::set<unsigned>{7101, 7102, 8201}));
    std::set<unsigned> antennas;
    eachGood(0xB0C1, [&](Bytes r) { antennas.insert(r[20]); });
    EXPECT_EQ(antennas, (std::set<unsigned>{1, 2, 4}));
}

TEST(LTEScenarioTest, connectedMeasurementsArePlausible) {
    const auto inRange = [](Bytes r, std::size_t level) {
        EXPECT_LE(u16(r, level), (140U - 44) * 4);
        EXPECT_GE(u16(r, level + 2), 4U); // -19.5 dB
        EXPECT_LE(u16(r, level + 2), (20U - 3) * 8);
    };
    std::set<unsigned> levels;
    std::size_t mostNeighbours = 0;
    std::size_t mostDetected = 0;
    eachGood(0xB179, [&](Bytes r) {
        EXPECT_TRUE(uplinks.contains(u16(r, 17)));
        EXPECT_LE(u16(r, 19), 503U);
        EXPECT_LT(u16(r, 21), 10240U);
        inRange(r, 23);
        levels.insert(u16(r, 23));
        mostNeighbours = std::max<std::size_t>(mostNeighbours, r[27]);
        mostDetected = std::max<std::size_t>(mostDetected, r[28]);
        std::set<unsigned> cells = {u16(r, 19)};
        for (std::size_t i = 0; i < r[27]; ++i) {
            inRange(r, 31 + 6 * i);
            EXPECT_TRUE(cells.insert(u16(r, 29 + 6 * i)).second) << "each cell once";
        }
        for (std::size_t i = 0; i < r[28]; ++i)
            EXPECT_TRUE(cells.insert(u16(r, 29U + 6U * r[27] + 2 * i)).second);
        EXPECT_LE(*cells.rbegin(), 503U);
    });
    EXPECT_GE(levels.size(), 40U) << "levels rise and fall";
    EXPECT_EQ(mostNeighbours, 6U);
    EXPECT_EQ(mostDetected, 3U);
}

TEST(LTEScenarioTest, aThirdOfTheTimeOrMoreIsConnected) {
    // Looked at by the second: in connected mode only the one measurement comes, in idle mode the others.
    std::set<long> connected;
    std::set<long> idle;
    for (const ScenarioEvent& event : twentyMinutes()) {
        const auto header = LogMessage::parse(event.message.bytes());
        if (!header || !isGood(*header))
            continue;
        const long second = event.offset / std::chrono::seconds(1);
        if (header->logCode() == 0xB179)
            connected.insert(second);
        if (header->logCode() == 0xB17F)
            idle.insert(second);
    }
    EXPECT_GE(connected.size(), 300U);
    EXPECT_GE(idle.size(), 500U);
}

} // namespace

ExpectedDrive expectedLTEDrive() {
    const auto trait = [](const LogMessage& header) -> std::optional<unsigned> {
        if (header.logCode() != 0xB0C2)
            return std::nullopt;
        return u16(header.record, 14);
    };
    return {.name = "lte",
            .length = 20min,
            .round = 2min,
            .leastRate = 5,
            .mostRate = 9,
            .codes = codes,
            .good = isGood,
            .trait = trait,
            .requirements = &requirements,
            // One unusual message every ten seconds, a sixth of them of each kind, these codes in turn.
            .odd = {.length = 20min,
                    .shortCodes = std::set<std::uint32_t>{0xB0C2, 0xB179, 0xB17F, 0xB180, 0xB186},
                    .shortCount = testing::Le(40U),
                    .overrunCodes = std::set<std::uint32_t>{0xB179, 0xB180, 0xB186},
                    .overrunCount = testing::Le(40U),
                    .overrunsOfEachCode = testing::Ge(2U)}};
}

} // namespace velmora
