// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/GSM/NeighboringCells.h"

#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

namespace velmora {

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

const auto make = inArray<NeighboringCells>;

/// The part of 0x5137 before the neighbours, with their count.
Data measured(std::string_view count, std::string_view entries) {
    return record(0x5137, "00 00 55 01 00 00 00 02 00 00 00 00 00 00 00 " + std::string(count) + " " +
                              std::string(entries));
}

constexpr std::string_view twoCells = R"(
    00 02       # ARFCN: 512
    AB          # RSSI: 171, unsigned and without a unit
    F6 FF FF FF # C1: -10
    11 22 33 44 55 66 77
    FF FF       # ARFCN: 65535
    1E          # RSSI: 30
    70 11 01 00 # C1: 70000, all 32 bits
    11 22 33 44 55 66 77
)";
constexpr std::string_view firstRow = "{ARFCN '512', RSSI '171', C1 Value '-10'}";
constexpr std::string_view secondRow = "{ARFCN '65535', RSSI '30', C1 Value '70000'}";

std::string list(std::initializer_list<std::string_view> rows) {
    std::string result;
    for (const std::string_view row : rows)
        result += (result.empty() ? "" : ", ") + std::string(row);
    return "[" + result + "]";
}

TEST(NeighboringCells, ShowsWhatTheBasebandMeasures) {
    SectionHarness section = make();
    const Array* array = section.value().asArray();
    section.update(measured("02", twoCells));
    EXPECT_EQ(section.node(), list({firstRow, secondRow}));
    EXPECT_EQ(section.value().asArray(), array);
    EXPECT_THAT(section.errors(), IsEmpty());
    // The count decides, not the bytes that follow.
    section.update(measured("01", twoCells));
    EXPECT_EQ(section.node(), list({firstRow}));
    section.update(measured("00", twoCells));
    EXPECT_EQ(section.node(), "[]");
    EXPECT_THAT(section.errors(), IsEmpty());
}

TEST(NeighboringCells, EndsWithTheLastCompleteNeighbour) {
    expectPrefixes(make, measured("02", twoCells), 29, "NeighboringCells", [](std::size_t length) {
        return length < 43 ? "[]" : length < 57 ? list({firstRow}) : list({firstRow, secondRow});
    });
    SectionHarness section = make();
    section.update(measured("FF", twoCells));
    EXPECT_EQ(section.node(), list({firstRow, secondRow}));
    EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, "NeighboringCells"},
                                         {LogPriority::Error, "Record 0x5137: 2 of 255 entries"}}));
    section.update(prefixOf(measured("02", twoCells), 56));
    EXPECT_THAT(section.errors(), ElementsAre("Record 0x5137: 1 of 2 entries"));
}

TEST(NeighboringCells, ShowsTheBSICOfAKnownChannel) {
    SectionHarness section = make();
    section.update(measured("02", twoCells));
    section.update(record(0x51FF, "00 02   00 02 2A 00   01 02 2B 00"));
    // The rows that are shown stay as they are.
    EXPECT_EQ(section.node(), list({firstRow, secondRow}));
    EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, "NeighboringCells"}}));
    section.update(measured("02", twoCells));
    EXPECT_EQ(section.node(), list({"{ARFCN '512', RSSI '171', C1 Value '-10', BSIC '42'}", secondRow}));
}

TEST(NeighboringCells, TheLastBSICOfAChannelIsUsed) {
    SectionHarness section = make();
    section.update(record(0x51FF, "00 03   00 02 01 00   FF FF FF 00   00 02 02 00"));
    section.update(measured("02", twoCells));
    EXPECT_EQ(section.node(), list({"{ARFCN '512', RSSI '171', C1 Value '-10', BSIC '2'}",
                                    "{ARFCN '65535', RSSI '30', C1 Value '70000', BSIC '255'}"}));
}

TEST(NeighboringCells, EveryListOfBSICsReplacesTheEarlierOne) {
    SectionHarness section = make();
    section.update(record(0x51FF, "00 01   00 02 2A 00"));
    section.update(record(0x51FF, "00 01   FF FF 2B 00"));
    section.update(measured("02", twoCells));
    EXPECT_EQ(section.node(), list({firstRow, "{ARFCN '65535', RSSI '30', C1 Value '70000', BSIC '43'}"}));
    section.update(record(0x51FF, "00 00")); // an empty one too
    section.update(measured("02", twoCells));
    EXPECT_EQ(section.node(), list({firstRow, secondRow}));
}

TEST(NeighboringCells, ListOfBSICsEndsWithTheLastCompleteEntry) {
    const Data full = record(0x51FF, "00 02   FF FF 2B 00   00 02 2A 00");
    ASSERT_EQ(full.size(), 23u);
    for (std::size_t length = 0; length <= full.size(); ++length) {
        SCOPED_TRACE(length);
        SectionHarness section = make();
        section.update(record(0x51FF, "00 01   00 02 01 00"));
        section.update(prefixOf(full, length), 0x51FF);
        const auto errors = section.errors();
        EXPECT_EQ(section.node(), "['earlier']");
        section.update(measured("01", twoCells));
        if (length < 15) { // too short, so that the earlier list is kept
            EXPECT_THAT(errors, IsEmpty());
            EXPECT_EQ(section.node(), list({"{ARFCN '512', RSSI '171', C1 Value '-10', BSIC '1'}"}));
        } else if (length < 23) {
            EXPECT_THAT(errors, ElementsAre(length < 19 ? "Record 0x51FF: 0 of 2 entries"
                                                        : "Record 0x51FF: 1 of 2 entries"));
            EXPECT_EQ(section.node(), list({firstRow}));
        } else {
            EXPECT_THAT(errors, IsEmpty());
            EXPECT_EQ(section.node(), list({"{ARFCN '512', RSSI '171', C1 Value '-10', BSIC '42'}"}));
        }
    }
}

TEST(NeighboringCells, ShowsTheServicesCells) {
    struct Case {
        const char* name;
        Value cell;
        const char* row;
    };
    const Case cases[] = {
        {"twice the level", cell("GSM", "Neighbor", {{"ARFCN", 512}, {"RSSI", -40}}),
         "{ARFCN '512', RSSI '-80 dBm'}"},
        {"a level not measured", cell("GSM", "Neighbor", {{"ARFCN", 1}, {"RSSI", 32767}}),
         "{ARFCN '1', RSSI ''}"},
        {"the greatest level below it", cell("GSM", "Neighbor", {{"ARFCN", 1}, {"RSSI", 32766}}),
         "{ARFCN '1', RSSI '65532 dBm'}"},
        {"the lowest level", cell("GSM", "Neighbor", {{"ARFCN", 1}, {"RSSI", 32768}}),
         "{ARFCN '1', RSSI '-65536 dBm'}"},
        {"the low half of the level, not measured",
         cell("GSM", "Neighbor", {{"ARFCN", 1}, {"RSSI", 0x17FFF}}), "{ARFCN '1', RSSI ''}"},
        {"the low half of the level, signed", cell("GSM", "Neighbor", {{"ARFCN", 1}, {"RSSI", 0x1FFFF}}),
         "{ARFCN '1', RSSI '-2 dBm'}"},
        {"the low half of the channel, unsigned", cell("GSM", "Neighbor", {{"ARFCN", -1}, {"RSSI", 0}}),
         "{ARFCN '65535', RSSI '0 dBm'}"},
        {"a channel above 16 bits", cell("GSM", "Neighbor", {{"ARFCN", 65536 + 7}, {"RSSI", 0}}),
         "{ARFCN '7', RSSI '0 dBm'}"},
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(c.name);
        SectionHarness section = make();
        section.update(cellInfo({c.cell}));
        EXPECT_EQ(section.node(), list({c.row}));
        EXPECT_THAT(section.errors(), IsEmpty());
    }
}

TEST(NeighboringCells, ShowsTheGSMNeighboursAloneInTheirOrder) {
    SectionHarness section = make();
    section.update(record(0x51FF, "00 01   02 00 2A 00")); // a BSIC is shown with measured cells only
    section.update(cellInfo({cell("GSM", "Serving", {{"ARFCN", 1}, {"RSSI", 1}}),
                             cell("GSM", "Neighbor", {{"ARFCN", 2}, {"RSSI", 2}}),
                             cell("UMTS", "Neighbor", {{"ARFCN", 3}, {"RSSI", 3}}),
                             cell("", "Neighbor", {{"ARFCN", 4}}), cell("GSM", "", {{"ARFCN", 5}}), "text",
                             cell("GSM", "Neighbor", {{"RSSI", -6}, {"ARFCN", 6}})}));
    EXPECT_EQ(section.node(), "[{ARFCN '2', RSSI '4 dBm'}, {ARFCN '6', RSSI '-12 dBm'}]");
    section.update(cellInfo({cell("GSM", "Serving")}));
    EXPECT_EQ(section.node(), "[]");
    EXPECT_THAT(section.errors(), IsEmpty());
}

TEST(NeighboringCells, EveryNeighbourGivesARow) {
    SectionHarness section = make();
    section.update(cellInfo({cell("GSM", "Neighbor"), cell("GSM", "Neighbor", {{"ARFCN", 2}}),
                             cell("GSM", "Neighbor", {{"ARFCN", "3"}, {"RSSI", 3}})}));
    EXPECT_EQ(section.node(), "[{}, {ARFCN '2'}, {RSSI '6 dBm'}]");
    EXPECT_THAT(section.errors(), ElementsAre("NeighboringCells: Failed to retrieve ARFCN\n",
                                              "NeighboringCells: Failed to retrieve RSSI\n",
                                              "NeighboringCells: Failed to retrieve RSSI\n",
                                              "NeighboringCells: Failed to retrieve ARFCN\n"));
}

TEST(NeighboringCells, CellsThatCannotBeHadEmptyTheList) {
    SectionHarness section = make();
    section.update(unreadableCellInfo());
    EXPECT_EQ(section.node(), "[]");
    EXPECT_EQ(section.lines(),
              (LogLines{{LogPriority::Warning, "NeighboringCells"},
                        {LogPriority::Error, "Cell Info Array data could not be constructed"},
                        {LogPriority::Error, "Failed to get Cell Array\n"}}));
    section.update(measured("01", twoCells));
    section.update(extraRecord(1, makeDictionary()));
    EXPECT_EQ(section.node(), "[]");
    EXPECT_THAT(section.errors(), ElementsAre("Failed to get Cell Array\n"));
}

} // namespace

} // namespace velmora
