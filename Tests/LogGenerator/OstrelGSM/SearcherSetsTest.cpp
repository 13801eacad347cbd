// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/UMTS/ActiveSet.h"
#include "LogGenerator/OstrelGSM/UMTS/DetectedSet.h"
#include "LogGenerator/OstrelGSM/UMTS/MonitoredSet.h"
#include "LogGenerator/OstrelGSM/UMTS/VirtualActiveSet.h"
#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

namespace velmora {

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

/// Two cells: one of the active set, one of set type 1.
constexpr std::string_view twoCells = R"(
    18 FC                                           # power: -1000
    02                                              # two cells
    EE EE EE EE EE EE EE    2C 01   EE EE EE EE EE EE # 0x12C: 300, set type 0
    EE EE EE EE EE EE EE    FF 3F   EE EE EE EE EE EE # 0x1FFF, set type 1
    EE EE EE EE EE EE EE EE EE EE EE EE EE EE EE EE # measurement of the first
    EE EE EE EE EE EE EE EE EE EE EE EE EE EE EE EE
    6F 5F 06 00   EE EE EE EE   EE EE EE EE         # 417647: -2 dB
    EE EE EE EE EE EE EE EE EE EE EE EE EE EE EE EE # measurement of the second
    EE EE EE EE EE EE EE EE EE EE EE EE EE EE EE EE
    00 00 08 00   EE EE EE EE   EE EE EE EE         # 524288: 0 dB
)";
// trunc(-488 / 10) - 106 = -154, and -2.
constexpr std::string_view firstRow = "{Scrambling Code '300', RSCP '-156 dB', Energy Per Chip '-2 dB'}";

std::string list(std::string_view rows) {
    return "[" + std::string(rows) + "]";
}

struct Cell {
    unsigned scramblingCode;
    unsigned setType;
    std::uint32_t energies[3];
};

/// A searcher record whose unused bytes are 0xEE.
Data searcher(int power, std::initializer_list<Cell> cells) {
    std::vector<std::uint8_t> payload(3 + 15 * cells.size() + 44 * cells.size(), 0xEE);
    payload[0] = static_cast<std::uint8_t>(power);
    payload[1] = static_cast<std::uint8_t>(power >> 8);
    payload[2] = static_cast<std::uint8_t>(cells.size());
    std::size_t cellAt = 3;
    std::size_t energyAt = 3 + 15 * cells.size() + 32;
    for (const Cell& c : cells) {
        payload[cellAt + 7] = static_cast<std::uint8_t>(c.scramblingCode);
        payload[cellAt + 8] = static_cast<std::uint8_t>(c.scramblingCode >> 8 | c.setType << 5);
        for (std::size_t i = 0; i < 12; ++i)
            payload[energyAt + i] = static_cast<std::uint8_t>(c.energies[i / 4] >> (i % 4 * 8));
        cellAt += 15;
        energyAt += 44;
    }
    return recordOf(0x417A, payload);
}

TEST(ActiveSet, ShowsTheCellsOfSetTypeZero) {
    SectionHarness section = inArray<ActiveSet>();
    const Array* array = section.value().asArray();
    section.update(record(0x417A, twoCells));
    EXPECT_EQ(section.node(), list(firstRow));
    EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, "ActiveSet"}}));
    EXPECT_EQ(section.value().asArray(), array);
}

TEST(ActiveSet, TakesEachCellsOwnMeasurement) {
    SectionHarness section = inArray<ActiveSet>();
    section.update(searcher(
        0,
        {{1, 0, {524288, 0, 0}}, {2, 7, {524287, 0, 0}}, {8191, 0, {0, 417647, 0}}, {0, 0, {0, 0, 331808}}}));
    // trunc(512 / 10) - 106 = -55.
    EXPECT_EQ(section.node(), "[{Scrambling Code '1', RSCP '-55 dB', Energy Per Chip '0 dB'}, "
                              "{Scrambling Code '8191', RSCP '-57 dB', Energy Per Chip '-2 dB'}, "
                              "{Scrambling Code '0', RSCP '-58 dB', Energy Per Chip '-3 dB'}]");
}

TEST(ActiveSet, TheFirstEnergyThatIsNotZeroCounts) {
    struct Case {
        const char* name;
        std::uint32_t energies[3];
        const char* shown;
    };
    const Case cases[] = {
        {"the first", {757, 524288, 524288}, "-31 dB"},
        {"the second", {0, 757, 524288}, "-31 dB"},
        {"the third", {0, 0, 757}, "-31 dB"},
        {"none", {0, 0, 0}, "0 dB"},
        {"one below the table is 0 dB again", {705, 524288, 524288}, "0 dB"},
        {"all 32 bits are unsigned", {0xFFFFFFFF, 757, 757}, "0 dB"},
        {"the high half alone", {0x00010000, 0, 0}, "-10 dB"}, // 65536
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(c.name);
        SectionHarness section = inArray<ActiveSet>();
        section.update(searcher(0, {{1, 0, {c.energies[0], c.energies[1], c.energies[2]}}}));
        EXPECT_THAT(section.node(), testing::HasSubstr("Energy Per Chip '" + std::string(c.shown) + "'"));
    }
}

TEST(ActiveSet, RoundsThePowerTowardZero) {
    struct Case {
        int power;
        const char* shown;
    };
    // Energy 524288 adds nothing.
    const Case cases[] = {
        {-1000, "-154 dB"},   // -488 / 10 = -48
        {-512, "-106 dB"},    // 0
        {-521, "-106 dB"},    // -9 / 10 = 0, not -1
        {-522, "-107 dB"},    // -10 / 10 = -1
        {-503, "-106 dB"},    // 9 / 10 = 0
        {188, "-36 dB"},      // 700 / 10 = 70
        {197, "-36 dB"},      // 709 / 10 = 70
        {32767, "3221 dB"},   // 33279 / 10 = 3327
        {-32768, "-3331 dB"}, // -32256 / 10 = -3225
    };
    for (const Case& c : cases) {
        SectionHarness section = inArray<ActiveSet>();
        section.update(searcher(c.power, {{1, 0, {524288, 0, 0}}}));
        EXPECT_EQ(section.node(),
                  "[{Scrambling Code '1', RSCP '" + std::string(c.shown) + "', Energy Per Chip '0 dB'}]")
            << c.power;
    }
}

TEST(ActiveSet, OnlySetTypeZeroIsActive) {
    for (unsigned type = 0; type < 8; ++type) {
        SectionHarness section = inArray<ActiveSet>();
        section.update(searcher(-1000, {{300, type, {417647, 0, 0}}}));
        EXPECT_EQ(section.node(), type == 0 ? list(firstRow) : "[]") << type;
        EXPECT_THAT(section.errors(), IsEmpty()) << type;
    }
}

TEST(ActiveSet, EndsWithTheLastCellWithACompleteMeasurement) {
    const Cell active{300, 0, {417647, 0, 0}};
    const Data two = searcher(-1000, {active, active});
    ASSERT_EQ(two.size(), 16u + 30 + 88);
    // The first measurement ends at 16 + 30 + 44.
    expectPrefixes(inArray<ActiveSet>, two, 16, "ActiveSet", [](std::size_t length) {
        return length < 90    ? "[]"
               : length < 134 ? list(firstRow)
                              : list(std::string(firstRow) + ", " + std::string(firstRow));
    });
    SectionHarness section = inArray<ActiveSet>();
    section.update(prefixOf(two, 133));
    EXPECT_THAT(section.errors(), ElementsAre("Record 0x417A: 1 of 2 entries"));
    section.update(prefixOf(two, 20)); // not even the cells
    EXPECT_THAT(section.errors(), ElementsAre("Record 0x417A: 0 of 2 entries"));
    // A greater count moves the measurements back, here past the record's end.
    section.update(withByte(two, 15, 255));
    EXPECT_EQ(section.node(), "[]");
    EXPECT_THAT(section.errors(), ElementsAre("Record 0x417A: 0 of 255 entries"));
}

TEST(ActiveSet, NoCellsEmptyTheList) {
    SectionHarness section = inArray<ActiveSet>();
    section.update(withByte(record(0x417A, twoCells), 15, 0));
    EXPECT_EQ(section.node(), "[]");
    EXPECT_THAT(section.errors(), IsEmpty());
}

template <class Set>
void expectEmpty(std::string_view trace) {
    SCOPED_TRACE(trace);
    const Data two = record(0x417A, twoCells);
    // Whatever the record holds, the list is emptied.
    expectPrefixes(inArray<Set>, two, 16, trace, "[]");
    for (unsigned type = 0; type < 8; ++type) {
        SectionHarness section = inArray<Set>();
        const Array* array = section.value().asArray();
        section.update(searcher(0, {{300, type, {417647, 0, 0}}}));
        EXPECT_EQ(section.node(), "[]");
        EXPECT_EQ(section.value().asArray(), array);
        EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, std::string(trace)}}));
    }
    SectionHarness section = inArray<Set>();
    section.update(withByte(two, 15, 0));
    EXPECT_EQ(section.node(), "[]");
    EXPECT_THAT(section.errors(), IsEmpty());
    // Of the record only the cells are walked: a measurement that is cut off is not missed.
    section.update(prefixOf(two, 46));
    EXPECT_THAT(section.errors(), IsEmpty());
    section.update(prefixOf(two, 45));
    EXPECT_THAT(section.errors(), ElementsAre("Record 0x417A: 1 of 2 entries"));
}

TEST(SearcherSets, AllButTheActiveSetStayEmpty) {
    expectEmpty<DetectedSet>("DetectedSet");
    expectEmpty<MonitoredSet>("MonitoredSet");
    expectEmpty<VirtualActiveSet>("VirtualActiveSet");
}

} // namespace

} // namespace velmora
