// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/C2K/C2KScenario.h"

#include "Tests/Telephony/Drives/C2KLayouts.h"
#include "Tests/Telephony/Drives/ExpectedDrives.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <map>
#include <set>
#include <vector>

namespace velmora {
namespace {

using namespace c2k;
using namespace std::chrono_literals;
using ::testing::AnyOf;
using ::testing::IsSubsetOf;

/// Calls `look` with every well-formed record of that code.
void eachRecord(std::uint32_t code, const std::function<void(Bytes)>& look) {
    eachRecord(twentyMinutes(), code, isWellFormed, look);
}

TEST(C2KScenarioTest, headersGiveTheirLengthAndOneStream) {
    for (const ScenarioEvent& event : twentyMinutes())
        if (const auto header = LogMessage::parse(event.message.bytes())) {
            EXPECT_EQ(header->length(), header->record.size() - 1);
            EXPECT_THAT(header->type, AnyOf(1, 2)) << "there is no extra stream";
        }
}

TEST(C2KScenarioTest, everyKindOfUnusualMessageOccurs) {
    int tooShort = 0;
    int prefixed = 0;
    int wrongType = 0;
    std::map<std::uint32_t, int> malformed;
    std::map<std::uint32_t, int> foreign;
    for (const ScenarioEvent& event : twentyMinutes()) {
        const auto header = LogMessage::parse(event.message.bytes());
        if (!header) {
            EXPECT_EQ(event.message.size(), 5U);
            ++tooShort;
            continue;
        }
        prefixed += header->prefixed;
        wrongType += header->type == 2;
        if (!layouts.contains(header->logCode()))
            ++foreign[header->logCode()];
        else if (!isWellFormed(*header))
            ++malformed[header->logCode()];
    }
    for (const int count : {tooShort, prefixed, wrongType})
        EXPECT_GE(count, 10);
    std::set<std::uint32_t> codes;
    for (const auto& [code, count] : malformed) {
        EXPECT_LE(count, 20) << "of some 120 odd ones";
        codes.insert(code);
    }
    EXPECT_EQ(codes, (std::set<std::uint32_t>{0x1183, 0x12B6, 0x108A, 0x119C, 0x134F, 0x1192, 0x127E}));
    EXPECT_EQ(foreign.size(), 2U);
}

TEST(C2KScenarioTest, bothRadiosGoThroughTheirStates) {
    // In the order of their first coming; sleep comes and goes with paging.
    std::vector<int> oneX;
    eachRecord(0x119C, [&](Bytes r) {
        const int state = r[subPackets(r).at(1) + 4];
        if (state != 7 && (oneX.empty() || oneX.back() != state) && oneX.size() < 10)
            oneX.push_back(state);
    });
    oneX.erase(oneX.begin(), std::find(oneX.begin(), oneX.end(), 11));
    oneX.resize(8);
    // Powerup, initial, acquisition, sync, paging, traffic, paging, inactive
    EXPECT_EQ(oneX, (std::vector<int>{11, 2, 3, 4, 6, 8, 6, 0}));

    std::vector<int> evdo;
    std::vector<int> session;
    eachRecord(0x1183, [&](Bytes r) {
        if ((evdo.empty() || evdo.back() != r[36]) && evdo.size() < 16)
            evdo.push_back(r[36]);
        if ((session.empty() || session.back() != r[37]) && session.size() < 6)
            session.push_back(r[37]);
    });
    // Inactive, acquisition, sync, idle; access, connected, idle; the call; all that again; off
    EXPECT_EQ(evdo, (std::vector<int>{0, 1, 2, 3, 4, 5, 3, 0, 1, 2, 3, 4, 5, 3, 0, 1}));
    EXPECT_EQ(session, (std::vector<int>{0, 1, 2, 3, 4, 0}));
}

TEST(C2KScenarioTest, systemsArePlausible) {
    std::set<unsigned> systems;
    std::set<unsigned> networks;
    std::set<unsigned> baseStations;
    eachRecord(0x134F, [&](Bytes r) {
        const std::int64_t type = u32(r, 46);
        EXPECT_THAT(type, AnyOf(0, 2)) << "0 before one is found";
        if (type != 2)
            return;
        systems.insert(u16(r, 50));
        networks.insert(u16(r, 52));
        baseStations.insert(u16(r, 184));
        EXPECT_EQ(u32(r, 42), u16(r, 50) == C2KNetwork::homeSID ? 0 : 2);
        EXPECT_EQ(r[133], 6);
    });
    EXPECT_THAT(systems, IsSubsetOf({32001U, 32002U}));
    EXPECT_THAT(networks, IsSubsetOf({11U, 12U, 21U}));
    EXPECT_GE(networks.size(), 2U) << "the network changes on the way";
    EXPECT_GE(baseStations.size(), 10U);
    for (const unsigned each : baseStations)
        EXPECT_GT(each, 0U);
}

TEST(C2KScenarioTest, radioValuesArePlausible) {
    std::set<int> levels;
    eachRecord(0x1183, [&](Bytes r) {
        levels.insert(s8(r, 15));
        EXPECT_GE(s8(r, 15), -110);
        EXPECT_LE(s8(r, 15), -30);
        EXPECT_GE(s8(r, 17), -50);
        EXPECT_LE(s8(r, 17), 23);
        EXPECT_TRUE(u16(r, 18) <= 511 || u16(r, 18) == 0xFFFF);
        EXPECT_LE(r[14] >> 3, 1) << "band classes 0 and 1";
    });
    EXPECT_GE(levels.size(), 20U) << "levels rise and fall";
    std::set<int> pilots;
    eachRecord(0x12B6, [&](Bytes r) {
        pilots.insert(r[15]);
        for (std::size_t i = 0; i < r[15]; ++i) {
            EXPECT_LE(u16(r, 25 + 12 * i), 511U);
            EXPECT_GE(u16(r, 27 + 12 * i), 1U);
            EXPECT_LE(u16(r, 27 + 12 * i), 512U) << "no more than all that is received";
        }
    });
    EXPECT_EQ(pilots, (std::set<int>{1, 2, 3}));
    eachRecord(0x108A, [](Bytes r) {
        for (std::size_t i = 0; i < r[22]; ++i)
            EXPECT_TRUE(u16(r, 23 + 14 * i) <= 511 || u16(r, 23 + 14 * i) == 0xFFFF);
    });
}

TEST(C2KScenarioTest, countersOnlyGrowAndSoDoTheirSequences) {
    std::int64_t sequence = -1;
    std::int64_t packets = 0;
    eachRecord(0x1192, [&](Bytes r) {
        EXPECT_GT(u32(r, 13), sequence);
        EXPECT_GE(u32(r, 17 + 4 * 45), packets);
        sequence = u32(r, 13);
        packets = u32(r, 17 + 4 * 45);
    });
    EXPECT_GT(packets, 1000);
    sequence = -1;
    eachRecord(0x127E, [&](Bytes r) {
        EXPECT_GT(u32(r, 14), sequence);
        sequence = u32(r, 14);
    });
}

} // namespace

ExpectedDrive expectedC2KDrive() {
    const auto trait = [](const LogMessage& header) -> std::optional<unsigned> {
        if (header.logCode() != 0x134F || !isWellFormed(header))
            return std::nullopt;
        return u16(header.record, 184);
    };
    return {.name = "c2k",
            .length = 20min,
            .round = 4min,
            .leastRate = 7,
            .mostRate = 13,
            .codes = codesOf(layouts),
            .good = isWellFormed,
            .trait = trait};
}

} // namespace velmora
