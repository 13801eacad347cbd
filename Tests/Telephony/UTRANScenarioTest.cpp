#include "Telephony/UTRANScenario.h"

#include "Platform/PropertyList.h"
#include "Platform/TelephonyService.h"
#include "Recording/RecordHeader.h"
#include "Recording/RecordTime.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <functional>
#include <map>
#include <set>
#include <vector>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using ::testing::IsEmpty;

/// All messages of the first `duration`.
std::vector<ScenarioEvent> drive(std::uint64_t seed, std::chrono::nanoseconds duration) {
    UTRANScenario scenario(seed);
    std::vector<ScenarioEvent> events;
    for (ScenarioEvent event = scenario.next(); event.offset < duration; event = scenario.next())
        events.push_back(std::move(event));
    return events;
}

/// Ten minutes of seed 1: nearly three rounds.
const std::vector<ScenarioEvent>& tenMinutes() {
    static const std::vector<ScenarioEvent> events = drive(1, 10min);
    return events;
}

unsigned u16(Bytes record, std::size_t offset) {
    return record[offset] | static_cast<unsigned>(record[offset + 1]) << 8;
}

unsigned transportChannels(Bytes record) {
    return u16(record, 14) >> 6 & 0x3F;
}

/// What a record of each code needs: its least length, and the bytes that its counts ask for.
struct Requirement {
    std::size_t minimum;
    std::function<std::size_t(Bytes record)> needed;
};

const std::map<std::uint32_t, Requirement> requirements = {
    {0xD00A, {21, [](Bytes r) { return 168U + 16U * (r[16] / 2U); }}},
    {0xD00C,
     {17,
      [](Bytes r) {
          return 289U + 34U * transportChannels(r) + 8U * (r[15] / 16U); // behind the transport channels
      }}},
    {0xD00E, {17, [](Bytes r) { return 17U + 8U * r[16]; }}},
    {0xD0E0, {15, nullptr}},
    {0xD0E2, {26, nullptr}},
    {0xFF0000, {14, nullptr}},
    {0xFF0001, {14, nullptr}},
    {0xFF0002, {14, nullptr}},
};

/// Calls `look` with every whole record of that code.
void eachRecord(std::uint32_t code, const std::function<void(Bytes)>& look) {
    const Requirement& requirement = requirements.at(code);
    int seen = 0;
    for (const ScenarioEvent& event : tenMinutes()) {
        const auto header = recordHeader(event.message.bytes());
        if (!header || header->type == 2 || header->logCode() != code ||
            header->record.size() < requirement.minimum ||
            (requirement.needed && header->record.size() < requirement.needed(header->record)))
            continue;
        ++seen;
        look(header->record);
    }
    EXPECT_GT(seen, 0) << std::hex << code;
}

TEST(UTRANScenarioTest, speaksOstrelUTRAN2) {
    EXPECT_EQ(UTRANScenario(1).technology(), kVoxLogChannelTechnology_Ostrel_UTRAN2);
}

TEST(UTRANScenarioTest, theSameSeedGivesTheSameBytes) {
    const auto again = drive(1, 10min);
    ASSERT_EQ(again.size(), tenMinutes().size());
    for (std::size_t i = 0; i < again.size(); ++i) {
        ASSERT_EQ(again[i].offset, tenMinutes()[i].offset) << i;
        ASSERT_EQ(again[i].message, tenMinutes()[i].message) << i;
    }
}

TEST(UTRANScenarioTest, anotherSeedGivesAnotherDrive) {
    std::set<std::vector<unsigned>> drives;
    for (std::uint64_t seed = 1; seed <= 5; ++seed) {
        std::vector<unsigned> cells;
        for (const ScenarioEvent& event : drive(seed, 2min)) {
            const auto header = recordHeader(event.message.bytes());
            if (header && header->logCode() == 0xD0E2 && header->record.size() >= 26)
                cells.push_back(u16(header->record, 19) << 16 | u16(header->record, 21));
        }
        drives.insert(cells);
    }
    EXPECT_EQ(drives.size(), 5U);
}

TEST(UTRANScenarioTest, everyCodeComesWithinARound) {
    for (const std::uint64_t seed : {1U, 2U, 3U, 99U}) {
        std::set<std::uint32_t> missing;
        for (const auto& [code, requirement] : requirements)
            missing.insert(code);
        for (const ScenarioEvent& event : drive(seed, 2min))
            if (const auto header = recordHeader(event.message.bytes()))
                missing.erase(header->logCode());
        EXPECT_THAT(missing, IsEmpty()) << "seed " << seed;
    }
}

TEST(UTRANScenarioTest, aboutTenMessagesComeASecond) {
    const double rate = static_cast<double>(tenMinutes().size()) / 600;
    EXPECT_GE(rate, 7);
    EXPECT_LE(rate, 16);
}

TEST(UTRANScenarioTest, recordsAreAsTheirTablesSayButForTheOddOnes) {
    std::map<std::uint32_t, int> good;
    std::set<std::uint32_t> belowMinimum;
    std::set<std::uint32_t> overrun;
    int odd = 0;
    for (const ScenarioEvent& event : drive(1, 30min)) {
        const auto header = recordHeader(event.message.bytes());
        if (!header || header->type == 2)
            continue;
        EXPECT_EQ(header->length, header->record.size() - 1);
        const auto found = requirements.find(header->logCode());
        if (found == requirements.end())
            continue;
        if (header->record.size() < found->second.minimum) {
            // Just one byte short.
            EXPECT_EQ(header->record.size(), found->second.minimum - 1);
            belowMinimum.insert(found->first);
            ++odd;
        } else if (found->second.needed && header->record.size() < found->second.needed(header->record)) {
            overrun.insert(found->first);
            ++odd;
        } else {
            ++good[found->first];
        }
    }
    EXPECT_EQ(good.size(), requirements.size());
    EXPECT_EQ(belowMinimum, (std::set<std::uint32_t>{0xD0E0, 0xD0E2}));
    EXPECT_EQ(overrun, (std::set<std::uint32_t>{0xD00A, 0xD00C, 0xD00E}));
    // One odd message every ten seconds, a third of them of these two kinds.
    EXPECT_GE(odd, 40);
    EXPECT_LE(odd, 90);
}

TEST(UTRANScenarioTest, everyKindOfOddMessageComes) {
    int tooShort = 0;
    int wrongType = 0;
    int prefixed = 0;
    int unknownCode = 0;
    for (const ScenarioEvent& event : tenMinutes()) {
        const auto header = recordHeader(event.message.bytes());
        if (!header) {
            EXPECT_EQ(event.message.size(), 5U);
            EXPECT_EQ(event.message.bytes()[0], 1);
            ++tooShort;
        } else if (header->prefixed) {
            EXPECT_EQ(header->type, 1);
            EXPECT_EQ(header->logCode(), 0xD0E0U);
            EXPECT_EQ(header->record.size(), 15U);
            ++prefixed;
        } else if (header->type == 2) {
            ++wrongType;
        } else {
            EXPECT_THAT(header->type, ::testing::AnyOf(1, 0xFF));
            unknownCode += header->logCode() == 0x1375;
        }
    }
    for (const int count : {tooShort, wrongType, prefixed, unknownCode})
        EXPECT_GE(count, 3);
}

TEST(UTRANScenarioTest, timeAscendsAndStampsFollowIt) {
    std::chrono::nanoseconds last{0};
    for (const ScenarioEvent& event : tenMinutes()) {
        EXPECT_GE(event.offset, last);
        last = event.offset;
        if (const auto header = recordHeader(event.message.bytes())) {
            EXPECT_EQ(header->timestamp, recordTimestamp(UTRANScenario::beginning() + event.offset));
        }
    }
}

TEST(UTRANScenarioTest, extraPayloadsAreReadablePropertyListsOfBothForms) {
    std::map<std::uint32_t, std::set<bool>> forms;
    for (const ScenarioEvent& event : drive(4, 15min)) {
        const auto header = recordHeader(event.message.bytes());
        if (!header || header->type != 0xFF)
            continue;
        const Bytes payload = header->record.subspan(13);
        const auto list = readPropertyList(payload);
        ASSERT_TRUE(list) << list.reason();
        forms[header->logCode()].insert(payload[0] == 'b');
        EXPECT_EQ(list->asDictionary() != nullptr, header->code == 0);
        EXPECT_EQ(list->asArray() != nullptr, header->code != 0);
    }
    const std::set<bool> both = {false, true};
    EXPECT_EQ(forms, (std::map<std::uint32_t, std::set<bool>>{
                         {0xFF0000, both}, {0xFF0001, both}, {0xFF0002, both}}));
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
    for (const ScenarioEvent& event : drive(1, 30min)) {
        const auto header = recordHeader(event.message.bytes());
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
                due = event.offset + 5s;
                ++changes;
            }
            area = r[15];
        }
        EXPECT_LE(event.offset, due);
    }
    EXPECT_GE(changes, 2);
}

} // namespace
} // namespace velmora
