#include "Telephony/GSMScenario.h"

#include "Platform/PropertyList.h"
#include "Platform/TelephonyService.h"
#include "Recording/RecordHeader.h"
#include "Recording/RecordTime.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <functional>
#include <map>
#include <set>
#include <vector>

namespace velmora {
namespace {

using namespace std::chrono_literals;

/// All messages of the first `duration`.
std::vector<ScenarioEvent> drive(std::uint64_t seed, std::chrono::nanoseconds duration) {
    GSMScenario scenario(seed);
    std::vector<ScenarioEvent> events;
    for (ScenarioEvent event = scenario.next(); event.offset < duration; event = scenario.next())
        events.push_back(std::move(event));
    return events;
}

/// Ten minutes of seed 1: a whole round and most of the next.
const std::vector<ScenarioEvent>& tenMinutes() {
    static const std::vector<ScenarioEvent> events = drive(1, 10min);
    return events;
}

unsigned u16(Bytes record, std::size_t offset) {
    return record[offset] | static_cast<unsigned>(record[offset + 1]) << 8;
}

int s8(Bytes record, std::size_t offset) {
    return static_cast<std::int8_t>(record[offset]);
}

/// Calls `look` with every record of that code that is as its table says.
void eachRecord(std::uint32_t code, std::size_t minimum, const std::function<void(Bytes)>& look) {
    int seen = 0;
    for (const ScenarioEvent& event : tenMinutes()) {
        const auto header = recordHeader(event.message.bytes());
        if (!header || header->type == 2 || header->logCode() != code || header->record.size() < minimum)
            continue;
        ++seen;
        look(header->record);
    }
    EXPECT_GT(seen, 0) << std::hex << code;
}

/// What a record of each code needs: its least length, and the bytes that its counts ask for.
struct Requirement {
    std::size_t minimum;
    std::function<std::size_t(Bytes record)> needed;
};

const std::map<std::uint32_t, Requirement> requirements = {
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

TEST(GSMScenarioTest, speaksOstrelGSM) {
    EXPECT_EQ(GSMScenario(1).technology(), kVoxLogChannelTechnology_Ostrel_GSM);
}

TEST(GSMScenarioTest, theSameSeedGivesTheSameBytes) {
    const auto again = drive(1, 10min);
    ASSERT_EQ(again.size(), tenMinutes().size());
    for (std::size_t i = 0; i < again.size(); ++i) {
        ASSERT_EQ(again[i].offset, tenMinutes()[i].offset) << i;
        ASSERT_EQ(again[i].message, tenMinutes()[i].message) << i;
    }
}

TEST(GSMScenarioTest, anotherSeedGivesAnotherDrive) {
    std::set<std::vector<unsigned>> drives;
    for (std::uint64_t seed = 1; seed <= 5; ++seed) {
        std::vector<unsigned> cells;
        for (const ScenarioEvent& event : drive(seed, 2min)) {
            const auto header = recordHeader(event.message.bytes());
            if (header && header->logCode() == 0x5134)
                cells.push_back(u16(header->record, 13) << 8 | header->record[15]);
        }
        drives.insert(cells);
    }
    EXPECT_EQ(drives.size(), 5U);
}

TEST(GSMScenarioTest, everyCodeComesWithinARound) {
    for (const std::uint64_t seed : {1U, 2U, 3U, 99U}) {
        std::set<std::uint32_t> missing;
        for (const auto& [code, requirement] : requirements)
            missing.insert(code);
        for (const ScenarioEvent& event : drive(seed, 6min))
            if (const auto header = recordHeader(event.message.bytes()))
                missing.erase(header->logCode());
        EXPECT_THAT(missing, ::testing::IsEmpty()) << "seed " << seed;
    }
}

TEST(GSMScenarioTest, aboutTwentyMessagesComeASecond) {
    const double rate = static_cast<double>(tenMinutes().size()) / 600;
    EXPECT_GE(rate, 15);
    EXPECT_LE(rate, 25);
}

TEST(GSMScenarioTest, recordsAreAsTheirTablesSayButForTheOddOnes) {
    std::map<std::uint32_t, int> good;
    int belowMinimum = 0;
    int overrun = 0;
    for (const ScenarioEvent& event : tenMinutes()) {
        const auto header = recordHeader(event.message.bytes());
        if (!header || header->type == 2)
            continue;
        EXPECT_EQ(header->length, header->record.size() - 1);
        const auto found = requirements.find(header->logCode());
        if (found == requirements.end())
            continue;
        if (header->record.size() < found->second.minimum)
            ++belowMinimum;
        else if (found->second.needed && header->record.size() < found->second.needed(header->record))
            ++overrun;
        else
            ++good[found->first];
    }
    EXPECT_EQ(good.size(), requirements.size());
    // One odd message every ten seconds, a sixth of them of each kind.
    EXPECT_GE(belowMinimum, 3);
    EXPECT_LE(belowMinimum, 20);
    EXPECT_GE(overrun, 3);
    EXPECT_LE(overrun, 20);
}

TEST(GSMScenarioTest, everyKindOfOddMessageComes) {
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
            EXPECT_TRUE(requirements.contains(header->logCode()));
            EXPECT_GE(header->record.size(), requirements.at(header->logCode()).minimum);
            ++prefixed;
        } else if (header->type == 2) {
            ++wrongType;
        } else {
            EXPECT_THAT(header->type, ::testing::AnyOf(1, 0xFF));
            unknownCode += !requirements.contains(header->logCode());
        }
    }
    for (const int count : {tooShort, wrongType, prefixed, unknownCode})
        EXPECT_GE(count, 3);
}

TEST(GSMScenarioTest, timeAscendsAndStampsFollowIt) {
    std::chrono::nanoseconds last{0};
    for (const ScenarioEvent& event : tenMinutes()) {
        EXPECT_GE(event.offset, last);
        last = event.offset;
        const auto header = recordHeader(event.message.bytes());
        if (header) {
            EXPECT_EQ(header->timestamp, recordTimestamp(GSMScenario::beginning() + event.offset));
        }
    }
}

TEST(GSMScenarioTest, extraPayloadsAreReadablePropertyListsOfBothForms) {
    std::map<std::uint32_t, std::set<bool>> forms;
    for (const ScenarioEvent& event : drive(4, 15min)) {
        const auto header = recordHeader(event.message.bytes());
        if (!header || header->type != 0xFF)
            continue;
        const Bytes payload = header->record.subspan(13);
        const auto list = readPropertyList(payload);
        ASSERT_TRUE(list) << list.reason();
        forms[header->logCode()].insert(payload[0] == 'b');
        if (header->code == 0) {
            ASSERT_TRUE(list->asDictionary());
            for (const auto& [key, value] : *list->asDictionary()) {
                EXPECT_TRUE(key.starts_with("kSimFile_")) << key;
                EXPECT_TRUE(value.asString()) << key;
            }
        } else {
            ASSERT_TRUE(list->asArray());
            for (const Value& each : *list->asArray())
                EXPECT_TRUE(each.asDictionary());
        }
    }
    const std::set<bool> both = {false, true};
    EXPECT_EQ(forms, (std::map<std::uint32_t, std::set<bool>>{
                         {0xFF0000, both}, {0xFF0001, both}, {0xFF0002, both}}));
}

TEST(GSMScenarioTest, gsmValuesArePlausible) {
    const auto plausibleARFCN = [](unsigned arfcn) {
        return (arfcn >= 1 && arfcn <= 124) || (arfcn >= 512 && arfcn <= 885);
    };
    eachRecord(0x5134, 26, [&](Bytes r) {
        EXPECT_TRUE(plausibleARFCN(u16(r, 13)));
        EXPECT_LE(u16(r, 15), 63U);
    });
    std::set<int> levels;
    eachRecord(0x5137, 29, [&](Bytes r) {
        levels.insert(r[15]);
        EXPECT_GE(r[15], 47);
        EXPECT_LE(r[15], 110);
        const std::size_t whole = (r.size() - 29) / 14;
        for (std::size_t i = 0; i < std::min<std::size_t>(r[28], whole); ++i) {
            EXPECT_TRUE(plausibleARFCN(u16(r, 29 + 14 * i)));
            EXPECT_GE(r[31 + 14 * i], 47);
            EXPECT_LE(r[31 + 14 * i], 110);
        }
    });
    EXPECT_GE(levels.size(), 20U) << "levels rise and fall";
    eachRecord(0x512C, 17, [](Bytes r) { EXPECT_LT(r[13], 22); });
    eachRecord(0x51F8, 15, [&](Bytes r) {
        EXPECT_LE(r[13], 63);
        EXPECT_TRUE(plausibleARFCN(u16(r, 15)));
    });
}

TEST(GSMScenarioTest, umtsValuesArePlausible) {
    eachRecord(0x4005, 15, [](Bytes r) {
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
    eachRecord(0x4125, 14, [&](Bytes r) { rrcStates.insert(r[13]); });
    EXPECT_EQ(rrcStates, (std::set<int>{0, 1, 2, 3, 4, 5})) << "every state comes";
    eachRecord(0x417A, 16, [](Bytes r) {
        const int power_dBm = (static_cast<std::int16_t>(u16(r, 13)) + 512) / 10 - 106;
        EXPECT_GE(power_dBm, -110);
        EXPECT_LE(power_dBm, -25);
    });
    eachRecord(0x4031, 16, [](Bytes r) {
        for (std::size_t i = 0; i < r[14]; ++i) {
            const int power_dBm = (static_cast<std::int16_t>(u16(r, 20 + 14 * i)) + 512) / 10 - 70;
            EXPECT_GE(power_dBm, -50);
            EXPECT_LE(power_dBm, 24);
        }
    });
    eachRecord(0x4221, 18, [](Bytes r) {
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
    std::chrono::nanoseconds tick = 2s;
    for (const ScenarioEvent& event : tenMinutes()) {
        for (; event.offset >= tick; tick += 2s)
            ++(latestIsUMTS ? umts : gsm);
        const auto header = recordHeader(event.message.bytes());
        if (header && header->type == 1 && header->logCode() == 0x4005)
            latestIsUMTS = header->record[13] > 0;
    }
    EXPECT_GE(gsm, 60) << "of 300";
    EXPECT_GE(umts, 60);
}

TEST(GSMScenarioTest, networksAreTestNetworks) {
    std::set<unsigned> areas;
    eachRecord(0x7135, 32, [&](Bytes r) {
        EXPECT_EQ(r[15], 0x00);
        EXPECT_EQ(r[16], 0xF1) << "001, two-digit MNC";
        EXPECT_THAT(r[17], ::testing::AnyOf(0x10, 0x20)) << "01 or 02";
        areas.insert(static_cast<unsigned>(r[18]) << 8 | r[19]);
    });
    EXPECT_GE(areas.size(), 2U) << "the area changes on the way";
    eachRecord(0x7150, 17, [](Bytes r) {
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
        const auto header = recordHeader(event.message.bytes());
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

TEST(GSMScenarioTest, theDriveGoesRound) {
    // Each round begins with a network search (registration state 5 after 0).
    int searches = 0;
    int last = -1;
    for (const ScenarioEvent& event : drive(1, 30min)) {
        const auto header = recordHeader(event.message.bytes());
        if (!header || header->type != 1 || header->logCode() != 0x7132)
            continue;
        searches += header->record[13] == 5 && last != 5;
        last = header->record[13];
    }
    EXPECT_GE(searches, 4);
    EXPECT_LE(searches, 6);
}

} // namespace
} // namespace velmora
