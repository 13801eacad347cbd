// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/UTRAN/UTRANScenario.h"

#include "Tests/Telephony/Drives/ExpectedDrives.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <map>
#include <set>
#include <vector>

namespace velmora {
namespace {

using namespace std::chrono_literals;

/// Ten minutes of seed 1: nearly three rounds.
const Drive& tenMinutes() {
    static const Drive drive = driveOf<UTRANScenario>(1, 10min);
    return drive;
}

unsigned transportChannels(Bytes record) {
    return u16(record, 14) >> 6 & 0x3F;
}

const Requirements requirements = {
    {0xD00A, {21, [](Bytes r) { return 168U + 16U * (r[16] / 2U); }}},
    {0xD00C,
     {17,
      [](Bytes r) {
          return 289U + 34U * transportChannels(r) + 8U * (r[15] / 16U); // after the transport channels
      }}},
    {0xD00E, {17, [](Bytes r) { return 17U + 8U * r[16]; }}},
    {0xD0E0, {15, nullptr}},
    {0xD0E2, {26, nullptr}},
    {0xFF0000, {14, nullptr}},
    {0xFF0001, {14, nullptr}},
    {0xFF0002, {14, nullptr}},
};

/// The requirements' codes.
const std::set<std::uint32_t> codes = codesOf(requirements);

/// Calls `look` with every complete record of that code.
void eachRecord(std::uint32_t code, const std::function<void(Bytes)>& look) {
    eachRecord(tenMinutes(), code, meets(requirements), look);
}

TEST(UTRANScenarioTest, valuesArePlausible) {
    std::set<unsigned> channels;
    std::set<unsigned> access;
    eachRecord(0xD0E2, [&](Bytes r) {
        EXPECT_EQ(u16(r, 17), u16(r, 19)) << "one channel for both directions";
        channels.insert(u16(r, 19));
        access.insert(r[25]);
    });
    EXPECT_GE(*channels.begin(), 10054U);
    EXPECT_LE(*channels.rbegin(), 10121U);
    EXPECT_GE(channels.size(), 3U) << "the phone changes its cell";
    EXPECT_EQ(access, (std::set<unsigned>{0, 1}));

    std::set<unsigned> states;
    eachRecord(0xD0E0, [&](Bytes r) {
        EXPECT_EQ(r[13], 1);
        states.insert(r[14]);
    });
    EXPECT_EQ(states, (std::set<unsigned>{0, 1, 2, 3, 4, 5}));

    std::set<unsigned> levels;
    std::set<unsigned> sets;
    eachRecord(0xD00A, [&](Bytes r) {
        int active = 0;
        for (std::size_t i = 0; i < r[16] / 2U; ++i) {
            const std::size_t entry = 168 + 16 * i;
            const unsigned channel = u16(r, entry) & 0x3FFF;
            EXPECT_GE(channel, 10054U);
            EXPECT_LE(channel, 10121U);
            const unsigned level = (u16(r, entry + 2) >> 5) & 0xFF;
            EXPECT_LE(level, 91U);
            levels.insert(level);
            const unsigned set = r[entry + 3] >> 5 & 3;
            sets.insert(set);
            active += set == 0;
        }
        EXPECT_LE(active, 1) << "no soft handover";
    });
    EXPECT_GE(levels.size(), 20U) << "levels rise and fall";
    EXPECT_EQ(sets, (std::set<unsigned>{0, 1, 2, 3}));

    eachRecord(0xD00E, [](Bytes r) {
        for (std::size_t i = 0; i < r[16]; ++i) {
            const std::size_t entry = 17 + 8 * i;
            const unsigned arfcn = u16(r, entry + 4);
            EXPECT_TRUE((arfcn >= 1 && arfcn <= 124) || (arfcn >= 512 && arfcn <= 885)) << arfcn;
            EXPECT_LE(r[entry + 2], 7);
            EXPECT_LE(r[entry + 3], 7);
            const int level = static_cast<std::int16_t>(u16(r, entry + 6));
            EXPECT_GE(level, -110);
            EXPECT_LE(level, -47);
        }
    });

    std::set<std::pair<unsigned, unsigned>> counts;
    eachRecord(0xD00C, [&](Bytes r) {
        const unsigned transport = transportChannels(r);
        const unsigned composite = r[15] / 16U;
        counts.insert({transport, composite});
        for (std::size_t i = 0; i < transport; ++i)
            EXPECT_LE(r[18 + 2 * i], 63);
        for (std::size_t i = 0; i < composite; ++i) {
            const std::size_t entry = 289 + 34 * transport + 8 * i;
            EXPECT_GE(r[entry + 1], 1);
            EXPECT_LE(r[entry + 1], 6);
            for (std::size_t slot = 0; slot < 6; ++slot)
                EXPECT_LE(r[entry + 2 + slot], slot < r[entry + 1] ? 63 : 0);
        }
    });
    EXPECT_EQ(counts, (std::set<std::pair<unsigned, unsigned>>{{0, 0}, {1, 1}, {2, 2}, {4, 1}}));
}

TEST(UTRANScenarioTest, aSessionRunsInProtocolOrder) {
    // The states as they change, from the first Cell FACH to the second Disconnected after it.
    std::vector<unsigned> states;
    eachRecord(0xD0E0, [&](Bytes r) {
        if (states.empty() ? r[14] == 2 : states.back() != r[14])
            states.push_back(r[14]);
    });
    ASSERT_GE(states.size(), 8U);
    states.resize(8);
    EXPECT_EQ(states, (std::vector<unsigned>{2, 3, 2, 4, 5, 0, 1, 3})) << "and a call follows";
}

TEST(UTRANScenarioTest, anIdlePhoneRegistersWhereTheAreaChanges) {
    unsigned state = 0;
    unsigned area = 0;
    int changes = 0;
    auto due = std::chrono::nanoseconds::max(); // the registration, where the network does not know yet
    for (const ScenarioEvent& event : driveOf<UTRANScenario>(1, 30min)) {
        const auto header = LogMessage::parse(event.message.bytes());
        if (!header || header->type != 1)
            continue;
        const Bytes r = header->record;
        if (header->code == 0xD0E0 && r.size() >= 15) {
            state = r[14];
            if (state != 0)
                due = std::chrono::nanoseconds::max();
        }
        if (header->code == 0xD0E2 && r.size() >= 26) {
            const bool allCalls = r[25] == 0;
            if (allCalls && state == 0 && area != 0 && r[15] != area) {
                due = event.offset + std::chrono::seconds(5);
                ++changes;
            }
            area = r[15];
        }
        EXPECT_LE(event.offset, due);
    }
    EXPECT_GE(changes, 2);
}

} // namespace

ExpectedDrive expectedUTRANDrive() {
    const auto trait = [](const LogMessage& header) -> std::optional<unsigned> {
        if (header.logCode() != 0xD0E2 || header.record.size() < 26)
            return std::nullopt;
        return u16(header.record, 19) << 16 | u16(header.record, 21);
    };
    return {.name = "utran",
            .length = 10min,
            .round = 2min,
            .leastRate = 7,
            .mostRate = 16,
            .codes = codes,
            .good = meets(requirements),
            .trait = trait,
            .requirements = &requirements,
            // One unusual message every ten seconds, a third of them of these two kinds.
            .odd = {.length = 30min,
                    .shortCodes = std::set<std::uint32_t>{0xD0E0, 0xD0E2},
                    .missing = 1,
                    .overrunCodes = std::set<std::uint32_t>{0xD00A, 0xD00C, 0xD00E},
                    .count = testing::AllOf(testing::Ge(40U), testing::Le(90U))}};
}

} // namespace velmora
