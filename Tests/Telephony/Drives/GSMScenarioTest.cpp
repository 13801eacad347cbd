// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/GSM/GSMScenario.h"

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

/// Ten minutes of seed 1: a complete round and most of the next.
const Drive& tenMinutes() {
    static const Drive drive = driveOf<GSMScenario>(1, 10min);
    return drive;
}

const Requirements requirements = {
    {0x4005, {15, [](Bytes r) { return 15U + std::max(7U * r[14], 10U * r[13]); }}},
    {0x4031, {16, [](Bytes r) { return 16U + 14U * r[14]; }}},
    {0x4116, {16, [](Bytes r) { return 16U + 9U * r[13]; }}},
    {0x4125, {14, nullptr}},
    {0x4127, {29, nullptr}},
    {0x4157, {19, nullptr}},
    {0x417A, {16, [](Bytes r) { return 16U + (15U + 44U) * r[15]; }}},
    {0x4221,
     {18,
      [](Bytes r) { return r[17] > 0 ? 18U + 162U * r[16] + 9U * r[17] : std::size_t{18} + 9U * r[16]; }}},
    {0x5072, {20, nullptr}},
    {0x5076, {17, nullptr}},
    {0x512C, {17, nullptr}},
    {0x5134, {26, nullptr}},
    {0x5137, {29, [](Bytes r) { return 29U + 14U * r[28]; }}},
    {0x51F4, {15, nullptr}},
    {0x51F5, {18, nullptr}},
    {0x51F6, {24, nullptr}},
    {0x51F8, {15, [](Bytes r) { return 15U + 2U * r[14]; }}},
    {0x51FB, {34, nullptr}},
    {0x51FD, {35, nullptr}},
    {0x51FF, {15, [](Bytes r) { return 15U + 4U * r[14]; }}},
    {0x7130, {16, nullptr}},
    {0x7131, {16, nullptr}},
    {0x7132, {16, nullptr}},
    {0x7135, {32, nullptr}},
    {0x7150, {17, [](Bytes r) { return r[16] > 0 ? 17U + 3U * r[16] + 3U : std::size_t{17}; }}},
    {0xFF0000, {14, nullptr}},
    {0xFF0001, {14, nullptr}},
    {0xFF0002, {14, nullptr}},
};

/// The requirements' codes.
const std::set<std::uint32_t> codes = codesOf(requirements);

/// Calls `look` with every record of that code that is as its table says.
void eachRecord(std::uint32_t code, const std::function<void(Bytes)>& look) {
    eachRecord(tenMinutes(), code, meets(requirements), look);
}

TEST(GSMScenarioTest, gsmValuesArePlausible) {
    const auto plausibleARFCN = [](unsigned arfcn) {
        return (arfcn >= 1 && arfcn <= 124) || (arfcn >= 512 && arfcn <= 885);
    };
    eachRecord(0x5134, [&](Bytes r) {
        EXPECT_TRUE(plausibleARFCN(u16(r, 13)));
        EXPECT_LE(u16(r, 15), 63U);
    });
    std::set<int> levels;
    eachRecord(0x5137, [&](Bytes r) {
        levels.insert(r[15]);
        EXPECT_GE(r[15], 47);
        EXPECT_LE(r[15], 110);
        for (std::size_t i = 0; i < r[28]; ++i) {
            EXPECT_TRUE(plausibleARFCN(u16(r, 29 + 14 * i)));
            EXPECT_GE(r[31 + 14 * i], 47);
            EXPECT_LE(r[31 + 14 * i], 110);
        }
    });
    EXPECT_GE(levels.size(), 20U) << "levels rise and fall";
    eachRecord(0x512C, [](Bytes r) { EXPECT_LT(r[13], 22); });
    eachRecord(0x51F8, [&](Bytes r) {
        EXPECT_LE(r[13], 63);
        EXPECT_TRUE(plausibleARFCN(u16(r, 15)));
    });
}

TEST(GSMScenarioTest, umtsValuesArePlausible) {
    eachRecord(0x4005, [](Bytes r) {
        for (std::size_t i = 0; i < r[13]; ++i) {
            const std::size_t entry = 15 + 10 * i;
            EXPECT_GE(u16(r, entry), 10562U);
            EXPECT_LE(u16(r, entry), 10838U);
            EXPECT_LE(u16(r, entry + 2), 511U);
            EXPECT_GE(s8(r, entry + 4) - 21, -120);
            EXPECT_LE(s8(r, entry + 4) - 21, -40);
            EXPECT_GE(s8(r, entry + 7), -48);
            EXPECT_LE(s8(r, entry + 7), 0);
        }
    });
    std::set<int> rrcStates;
    eachRecord(0x4125, [&](Bytes r) { rrcStates.insert(r[13]); });
    EXPECT_EQ(rrcStates, (std::set<int>{0, 1, 2, 3, 4, 5})) << "every state comes";
    eachRecord(0x417A, [](Bytes r) {
        const int power_dBm = (static_cast<std::int16_t>(u16(r, 13)) + 512) / 10 - 106;
        EXPECT_GE(power_dBm, -110);
        EXPECT_LE(power_dBm, -25);
    });
    eachRecord(0x4031, [](Bytes r) {
        for (std::size_t i = 0; i < r[14]; ++i) {
            const int power_dBm = (static_cast<std::int16_t>(u16(r, 20 + 14 * i)) + 512) / 10 - 70;
            EXPECT_GE(power_dBm, -50);
            EXPECT_LE(power_dBm, 24);
        }
    });
    eachRecord(0x4221, [](Bytes r) {
        EXPECT_EQ(r[16], 6);
        for (std::size_t i = 0; i < r[16]; ++i)
            EXPECT_LE(u16(r, 25 + 9 * i), u16(r, 23 + 9 * i)) << "no more block errors than blocks";
    });
}

TEST(GSMScenarioTest, eitherRankedListComesToBeTheLatest) {
    // Looked at every two seconds, as the screens do; both lists travel in code 0x4005.
    int gsm = 0;
    int umts = 0;
    bool latestIsUMTS = false;
    std::chrono::nanoseconds tick = std::chrono::seconds(2);
    for (const ScenarioEvent& event : tenMinutes()) {
        for (; event.offset >= tick; tick += std::chrono::seconds(2))
            ++(latestIsUMTS ? umts : gsm);
        const auto header = LogMessage::parse(event.message.bytes());
        if (header && header->type == 1 && header->logCode() == 0x4005)
            latestIsUMTS = header->record[13] > 0;
    }
    EXPECT_GE(gsm, 60) << "of 300";
    EXPECT_GE(umts, 60);
}

TEST(GSMScenarioTest, networksAreTestNetworks) {
    std::set<unsigned> areas;
    eachRecord(0x7135, [&](Bytes r) {
        EXPECT_EQ(r[15], 0x00);
        EXPECT_EQ(r[16], 0xF1) << "001, two-digit MNC";
        EXPECT_THAT(r[17], ::testing::AnyOf(0x10, 0x20)) << "01 or 02";
        areas.insert(static_cast<unsigned>(r[18]) << 8 | r[19]);
    });
    EXPECT_GE(areas.size(), 2U) << "the area changes on the way";
    eachRecord(0x7150, [](Bytes r) {
        // The first entry's digits, MCC and MNC in turn.
        const int mcc = r[17] * 100 + r[19] * 10 + r[21];
        const int mnc = r[18] * 100 + r[20] * 10 + r[22];
        EXPECT_EQ(mcc, 1);
        EXPECT_THAT(mnc, ::testing::AnyOf(1, 2));
    });
}

TEST(GSMScenarioTest, aLocationUpdateRunsInProtocolOrder) {
    // The registration after power-on: the states as they change, up to the first idle in normal service.
    std::vector<std::pair<int, int>> states;
    for (const ScenarioEvent& event : tenMinutes()) {
        const auto header = LogMessage::parse(event.message.bytes());
        if (!header || header->type != 1 || header->logCode() != 0x7131 || header->record.size() < 16)
            continue;
        const std::pair<int, int> state(header->record[13], header->record[14]);
        if (states.empty() || states.back() != state)
            states.push_back(state);
        if (state == std::pair(19, 8))
            break;
    }
    const std::vector<std::pair<int, int>> wanted = {
        {0, 0},  // null
        {19, 2}, // idle, PLMN search
        {19, 5}, // idle, location update needed
        {13, 4}, // wait for RR connection (location update), attempting to update
        {3, 4},  // location update initiated
        {9, 8},  // wait for network command, normal service
        {19, 8}, // idle, normal service
    };
    EXPECT_EQ(states, wanted);
}

TEST(GSMScenarioTest, theDriveRepeats) {
    // Each round begins with a network search (registration state 5 after 0).
    int searches = 0;
    int last = -1;
    for (const ScenarioEvent& event : driveOf<GSMScenario>(1, 30min)) {
        const auto header = LogMessage::parse(event.message.bytes());
        if (!header || header->type != 1 || header->logCode() != 0x7132)
            continue;
        searches += header->record[13] == 5 && last != 5;
        last = header->record[13];
    }
    EXPECT_GE(searches, 4);
    EXPECT_LE(searches, 6);
}

} // namespace

ExpectedDrive expectedGSMDrive() {
    const auto trait = [](const LogMessage& header) -> std::optional<unsigned> {
        if (header.logCode() != 0x5134)
            return std::nullopt;
        return u16(header.record, 13) << 8 | header.record[15];
    };
    // One unusual message every ten seconds, a sixth of them of each kind.
    const auto aSixth = testing::AllOf(testing::Ge(3U), testing::Le(20U));
    return {.name = "gsm",
            .length = 10min,
            .round = 6min,
            .leastRate = 15,
            .mostRate = 25,
            .codes = codes,
            .good = meets(requirements),
            .trait = trait,
            .requirements = &requirements,
            .odd = {.length = 10min, .shortCount = aSixth, .overrunCount = aSixth}};
}

} // namespace velmora
