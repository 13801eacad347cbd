#include "Telephony/LTEScenario.h"

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
std::vector<ScenarioEvent> driveLTE(std::uint64_t seed, std::chrono::nanoseconds duration) {
    LTEScenario scenario(seed);
    std::vector<ScenarioEvent> events;
    for (ScenarioEvent event = scenario.next(); event.offset < duration; event = scenario.next())
        events.push_back(std::move(event));
    return events;
}

/// Twenty minutes of seed 1: several rounds.
const std::vector<ScenarioEvent>& twentyMinutes() {
    static const std::vector<ScenarioEvent> events = driveLTE(1, 20min);
    return events;
}

unsigned word(Bytes record, std::size_t offset) {
    return record[offset] | static_cast<unsigned>(record[offset + 1]) << 8;
}

/// The end of the candidate whose bytes reach furthest.
std::size_t candidatesEnd(Bytes record) {
    std::size_t end = 21;
    for (std::size_t i = 0; i < record[19]; ++i) {
        const std::size_t start = 21 + 4 * i;
        if (start + 4 > record.size())
            return start + 4;
        const unsigned type = word(record, start + 2);
        end = std::max(end, start + (type < 3 ? 8 : type < 5 ? 12 : 4));
    }
    return end;
}

/// What a record of each code needs: its least length, and the bytes that its counts ask for.
struct LTERequirement {
    std::size_t minimum;
    std::size_t (*needed)(Bytes record);
};

const std::map<std::uint32_t, LTERequirement> requirements = {
    {0xB0C1, {22, nullptr}},
    {0xB0C2, {38, nullptr}},
    {0xB179, {29, [](Bytes r) { return std::size_t{29} + 6U * r[27] + 2U * r[28]; }}},
    {0xB17F, {33, nullptr}},
    {0xB180, {21, [](Bytes r) { return std::size_t{21} + 20U * ((word(r, 19) >> 6 & 0x1F) + 1); }}},
    {0xB186, {21, candidatesEnd}},
    {0xFF0000, {14, nullptr}},
    {0xFF0001, {14, nullptr}},
    {0xFF0002, {14, nullptr}},
};

/// Whether the record is as its table says.
bool isGood(const RecordHeader& header) {
    const auto found = requirements.find(header.logCode());
    if (header.type == 2 || found == requirements.end() || header.record.size() < found->second.minimum)
        return false;
    return !found->second.needed || header.record.size() >= found->second.needed(header.record);
}

/// Calls `look` with every good record of that code.
void eachGood(std::uint32_t code, const std::function<void(Bytes)>& look) {
    int seen = 0;
    for (const ScenarioEvent& event : twentyMinutes()) {
        const auto header = recordHeader(event.message.bytes());
        if (!header || header->logCode() != code || !isGood(*header))
            continue;
        ++seen;
        look(header->record);
    }
    EXPECT_GT(seen, 0) << std::hex << code;
}

const std::map<unsigned, unsigned> uplinks = {{1300, 19300}, {3175, 21175}, {6300, 24300},
                                              {9310, 27310}, {3625, 21625}, {2410, 20410}};

TEST(LTEScenarioTest, speaksOstrelLTE) {
    EXPECT_EQ(LTEScenario(1).technology(), kVoxLogChannelTechnology_Ostrel_LTE);
}

TEST(LTEScenarioTest, theSameSeedGivesTheSameBytes) {
    const auto again = driveLTE(1, 20min);
    ASSERT_EQ(again.size(), twentyMinutes().size());
    for (std::size_t i = 0; i < again.size(); ++i) {
        ASSERT_EQ(again[i].offset, twentyMinutes()[i].offset) << i;
        ASSERT_EQ(again[i].message, twentyMinutes()[i].message) << i;
    }
}

TEST(LTEScenarioTest, anotherSeedGivesAnotherDrive) {
    std::set<std::vector<unsigned>> drives;
    for (std::uint64_t seed = 1; seed <= 5; ++seed) {
        std::vector<unsigned> cells;
        for (const ScenarioEvent& event : driveLTE(seed, 2min)) {
            const auto header = recordHeader(event.message.bytes());
            if (header && header->logCode() == 0xB0C2)
                cells.push_back(word(header->record, 14));
        }
        drives.insert(cells);
    }
    EXPECT_EQ(drives.size(), 5U);
}

TEST(LTEScenarioTest, everyCodeComesWithinTwoMinutes) {
    for (const std::uint64_t seed : {1U, 2U, 3U, 99U}) {
        std::set<std::uint32_t> missing;
        for (const auto& [code, requirement] : requirements)
            missing.insert(code);
        for (const ScenarioEvent& event : driveLTE(seed, 2min))
            if (const auto header = recordHeader(event.message.bytes()); header && isGood(*header))
                missing.erase(header->logCode());
        EXPECT_THAT(missing, ::testing::IsEmpty()) << "seed " << seed;
    }
}

TEST(LTEScenarioTest, aRoundBringsEveryBandwidthAndTechnology) {
    for (const std::uint64_t seed : {1U, 2U, 3U, 99U}) {
        std::set<unsigned> bandwidths;
        std::set<unsigned> types;
        for (const ScenarioEvent& event : driveLTE(seed, 3min)) {
            const auto header = recordHeader(event.message.bytes());
            if (!header || !isGood(*header))
                continue;
            if (header->logCode() == 0xB0C2)
                bandwidths.insert(header->record[20]);
            if (header->logCode() == 0xB186)
                for (std::size_t i = 0; i < header->record[19]; ++i)
                    types.insert(word(header->record, 23 + 4 * i));
        }
        EXPECT_EQ(bandwidths, (std::set<unsigned>{6, 15, 25, 50, 75, 100})) << seed;
        EXPECT_EQ(types, (std::set<unsigned>{0, 1, 2, 3, 4, 9})) << seed;
    }
}

TEST(LTEScenarioTest, sixToEightMessagesComeASecond) {
    const double rate = static_cast<double>(twentyMinutes().size()) / 1200;
    EXPECT_GE(rate, 5);
    EXPECT_LE(rate, 9);
}

TEST(LTEScenarioTest, recordsAreAsTheirTablesSayButForTheOddOnes) {
    std::map<std::uint32_t, int> good;
    std::map<std::uint32_t, int> belowMinimum;
    std::map<std::uint32_t, int> overrun;
    for (const ScenarioEvent& event : twentyMinutes()) {
        const auto header = recordHeader(event.message.bytes());
        if (!header || header->type == 2)
            continue;
        EXPECT_EQ(header->length, header->record.size() - 1);
        const auto found = requirements.find(header->logCode());
        if (found == requirements.end())
            continue;
        if (header->record.size() < found->second.minimum)
            ++belowMinimum[found->first];
        else
            ++(isGood(*header) ? good : overrun)[found->first];
    }
    EXPECT_EQ(good.size(), requirements.size());
    // One odd message every ten seconds, a sixth of them of each kind, by turns of these codes.
    int belowMinimumTotal = 0;
    for (const std::uint32_t code : {0xB0C2U, 0xB179U, 0xB17FU, 0xB180U, 0xB186U}) {
        EXPECT_GE(belowMinimum[code], 1) << std::hex << code;
        belowMinimumTotal += belowMinimum[code];
    }
    EXPECT_EQ(belowMinimum.size(), 5U);
    EXPECT_LE(belowMinimumTotal, 40);
    int overrunTotal = 0;
    for (const std::uint32_t code : {0xB179U, 0xB180U, 0xB186U}) {
        EXPECT_GE(overrun[code], 2) << std::hex << code;
        overrunTotal += overrun[code];
    }
    EXPECT_EQ(overrun.size(), 3U);
    EXPECT_LE(overrunTotal, 40);
}

TEST(LTEScenarioTest, everyKindOfOddMessageComes) {
    int tooShort = 0;
    int wrongType = 0;
    int prefixed = 0;
    int unknownCode = 0;
    for (const ScenarioEvent& event : twentyMinutes()) {
        const auto header = recordHeader(event.message.bytes());
        if (!header) {
            EXPECT_EQ(event.message.size(), 5U);
            ++tooShort;
        } else if (header->prefixed) {
            EXPECT_TRUE(isGood(*header));
            ++prefixed;
        } else if (header->type == 2) {
            ++wrongType;
        } else {
            unknownCode += !requirements.contains(header->logCode());
        }
    }
    for (const int count : {tooShort, wrongType, prefixed, unknownCode})
        EXPECT_GE(count, 3);
}

TEST(LTEScenarioTest, timeAscendsAndStampsFollowIt) {
    std::chrono::nanoseconds last{0};
    for (const ScenarioEvent& event : twentyMinutes()) {
        EXPECT_GE(event.offset, last);
        last = event.offset;
        const auto header = recordHeader(event.message.bytes());
        if (header) {
            EXPECT_EQ(header->timestamp, recordTimestamp(LTEScenario::beginning() + event.offset));
        }
    }
}

TEST(LTEScenarioTest, extraPayloadsAreReadablePropertyListsOfBothForms) {
    std::map<std::uint32_t, std::set<bool>> forms;
    bool servingFirst = false;
    for (const ScenarioEvent& event : twentyMinutes()) {
        const auto header = recordHeader(event.message.bytes());
        if (!header || header->type != 0xFF)
            continue;
        const Bytes payload = header->record.subspan(13);
        const auto list = readPropertyList(payload);
        ASSERT_TRUE(list) << list.reason();
        forms[header->logCode()].insert(payload[0] == 'b');
        if (header->code == 0) {
            ASSERT_TRUE(list->asDictionary());
            continue;
        }
        ASSERT_TRUE(list->asArray());
        if (header->code == 1 && list->asArray()->size() >= 4) {
            const Dictionary& first = *(*list->asArray())[0].asDictionary();
            servingFirst =
                servingFirst || first["kVoxCellMonitorCellType"] == Value("kVoxCellMonitorCellTypeServing");
        }
    }
    const std::set<bool> both = {false, true};
    EXPECT_EQ(forms, (std::map<std::uint32_t, std::set<bool>>{
                         {0xFF0000, both}, {0xFF0001, both}, {0xFF0002, both}}));
    EXPECT_TRUE(servingFirst);
}

TEST(LTEScenarioTest, servingCellsArePlausible) {
    std::set<unsigned> areas;
    std::set<unsigned> carriers;
    std::set<unsigned> cells;
    eachGood(0xB0C2, [&](Bytes r) {
        EXPECT_LE(word(r, 14), 503U);
        const auto uplink = uplinks.find(word(r, 16));
        ASSERT_NE(uplink, uplinks.end());
        EXPECT_EQ(word(r, 18), uplink->second);
        EXPECT_EQ(r[20], r[21]);
        EXPECT_LT(word(r, 24), 1U << 12) << "28 bits";
        EXPECT_THAT(word(r, 28), ::testing::AnyOf(3, 5, 7, 8, 20, 28));
        carriers.insert(word(r, 16));
        cells.insert(word(r, 22) | word(r, 24) << 16);
        areas.insert(word(r, 26));
    });
    EXPECT_EQ(carriers.size(), 6U);
    EXPECT_GE(cells.size(), 12U) << "the cell changes on the way";
    areas.erase(0); // of a spoilt record's
    EXPECT_EQ(areas, (std::set<unsigned>{7101, 7102, 8201}));
    std::set<unsigned> antennas;
    eachGood(0xB0C1, [&](Bytes r) { antennas.insert(r[20]); });
    EXPECT_EQ(antennas, (std::set<unsigned>{1, 2, 4}));
}

TEST(LTEScenarioTest, connectedMeasurementsArePlausible) {
    const auto inRange = [](Bytes r, std::size_t level) {
        EXPECT_LE(word(r, level), (140U - 44) * 4);
        EXPECT_GE(word(r, level + 2), 4U); // -19.5 dB
        EXPECT_LE(word(r, level + 2), (20U - 3) * 8);
    };
    std::set<unsigned> levels;
    std::size_t mostNeighbours = 0;
    std::size_t mostDetected = 0;
    eachGood(0xB179, [&](Bytes r) {
        EXPECT_TRUE(uplinks.contains(word(r, 17)));
        EXPECT_LE(word(r, 19), 503U);
        EXPECT_LT(word(r, 21), 10240U);
        inRange(r, 23);
        levels.insert(word(r, 23));
        mostNeighbours = std::max<std::size_t>(mostNeighbours, r[27]);
        mostDetected = std::max<std::size_t>(mostDetected, r[28]);
        std::set<unsigned> cells = {word(r, 19)};
        for (std::size_t i = 0; i < r[27]; ++i) {
            inRange(r, 31 + 6 * i);
            EXPECT_TRUE(cells.insert(word(r, 29 + 6 * i)).second) << "each cell once";
        }
        for (std::size_t i = 0; i < r[28]; ++i)
            EXPECT_TRUE(cells.insert(word(r, 29U + 6U * r[27] + 2 * i)).second);
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
        const auto header = recordHeader(event.message.bytes());
        if (!header || !isGood(*header))
            continue;
        const long second = event.offset / 1s;
        if (header->logCode() == 0xB179)
            connected.insert(second);
        if (header->logCode() == 0xB17F)
            idle.insert(second);
    }
    EXPECT_GE(connected.size(), 300U);
    EXPECT_GE(idle.size(), 500U);
}

} // namespace
} // namespace velmora
