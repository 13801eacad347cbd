// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/GSM/GSMSet.h"
#include "LogGenerator/OstrelGSM/UMTS/UMTSSet.h"
#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

namespace velmora {

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

const auto makeGSM = inArray<GSMSet>;
const auto makeUMTS = inArray<UMTSSet>;

constexpr std::string_view gsmCells = R"(
    00 02           # no UMTS cells, two GSM cells
    00 02           # ARFCN: 512
    2A 80           # BSIC: 32810, 16 bits
    A1              # RSSI: -95, signed
    FE FF           # ranking: -2
    FF FF           # ARFCN: 65535, unsigned
    00 00
    7F              # RSSI: 127
    FF 7F           # ranking: 32767
)";
constexpr const char* gsmFirst = "{ARFCN '512', BSIC '32810', RSSI '-95 dBm', Ranking Value '-2'}";
constexpr const char* gsmSecond = "{ARFCN '65535', BSIC '0', RSSI '127 dBm', Ranking Value '32767'}";

constexpr std::string_view umtsCells = R"(
    02 00           # two UMTS cells, no GSM cells
    70 29           # frequency: 10608
    2C 01           # scrambling code: 300
    B0              # RSCP: -80, and -21
    9C FF           # rank cell RSCP: -100
    F1              # Ec/Io: -15 halves
    FD FF           # ranking: -3
    FF FF           # frequency: -1, signed
    FF FF           # scrambling code: 65535, unsigned
    7F              # RSCP: 127
    E8 03           # rank cell RSCP: 1000
    02              # Ec/Io: 2 halves
    E8 03           # ranking: 1000
)";
constexpr const char* umtsFirst = "{Scrambling Code '300', RSCP '-101 dB', Energy Per Chip '-7.500000 dB', "
                                  "Downlink Frequency '10608', Ranking Value '-3', Rank Cell RSCP '-100 dB'}";
constexpr const char* umtsSecond = "{Scrambling Code '65535', RSCP '106 dB', Energy Per Chip '1.000000 dB', "
                                   "Downlink Frequency '-1', Ranking Value '1000', Rank Cell RSCP '1000 dB'}";

std::string list(std::initializer_list<const char*> rows) {
    std::string result;
    for (const char* row : rows)
        result += (result.empty() ? "" : ", ") + std::string(row);
    return "[" + result + "]";
}

TEST(GSMSet, ShowsTheRankedCells) {
    const Data two = record(0x4005, gsmCells);
    ASSERT_EQ(two.size(), 29u);
    SectionHarness section = makeGSM();
    const Array* array = section.value().asArray();
    section.update(two);
    EXPECT_EQ(section.node(), list({gsmFirst, gsmSecond}));
    EXPECT_EQ(section.value().asArray(), array);
    EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, "GSMSet"}}));

    expectPrefixes(makeGSM, two, 15, "GSMSet", [](std::size_t length) {
        return length < 22 ? "[]" : length < 29 ? list({gsmFirst}) : list({gsmFirst, gsmSecond});
    });
    section.update(prefixOf(two, 28));
    EXPECT_THAT(section.errors(), ElementsAre("Record 0x4005: 1 of 2 entries"));
}

TEST(GSMSet, NoGSMCellsEmptyTheList) {
    SectionHarness section = makeGSM();
    section.update(record(0x4005, umtsCells));
    EXPECT_EQ(section.node(), "[]");
    EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, "GSMSet"}}));
}

TEST(UMTSSet, ShowsTheRankedCells) {
    const Data two = record(0x4005, umtsCells);
    ASSERT_EQ(two.size(), 35u);
    SectionHarness section = makeUMTS();
    const Array* array = section.value().asArray();
    section.update(two);
    EXPECT_EQ(section.node(), list({umtsFirst, umtsSecond}));
    EXPECT_EQ(section.value().asArray(), array);
    EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, "UMTSSet"}}));

    expectPrefixes(makeUMTS, two, 15, "UMTSSet", [](std::size_t length) {
        return length < 25 ? "[]" : length < 35 ? list({umtsFirst}) : list({umtsFirst, umtsSecond});
    });
    section.update(prefixOf(two, 34));
    EXPECT_THAT(section.errors(), ElementsAre("Record 0x4005: 1 of 2 entries"));
}

TEST(UMTSSet, NoUMTSCellsEmptyTheList) {
    SectionHarness section = makeUMTS();
    section.update(record(0x4005, gsmCells));
    EXPECT_EQ(section.node(), "[]");
    EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, "UMTSSet"}}));
}

TEST(UMTSSet, ShowsTheExtremesOfSignedBytes) {
    SectionHarness section = makeUMTS();
    section.update(record(0x4005, "01 00   00 80 00 00 80 00 80 80 00 80"));
    EXPECT_EQ(section.node(), "[{Scrambling Code '0', RSCP '-149 dB', Energy Per Chip '-64.000000 dB', "
                              "Downlink Frequency '-32768', Ranking Value '-32768', "
                              "Rank Cell RSCP '-32768 dB'}]");
}

TEST(ReselectionSets, BothReadTheSameBytesWhereBothCountsAreSet) {
    const Data both = record(0x4005, "01 01   01 00 02 00 03 04 00 05 06 00");
    SectionHarness gsm = makeGSM();
    gsm.update(both);
    EXPECT_EQ(gsm.node(), "[{ARFCN '1', BSIC '2', RSSI '3 dBm', Ranking Value '4'}]");
    SectionHarness umts = makeUMTS();
    umts.update(both);
    EXPECT_EQ(umts.node(), "[{Scrambling Code '2', RSCP '-18 dB', Energy Per Chip '2.500000 dB', "
                           "Downlink Frequency '1', Ranking Value '6', Rank Cell RSCP '4 dB'}]");
}

TEST(UMTSSet, ShowsTheServicesCells) {
    struct Case {
        const char* name;
        Value cell;
        const char* row;
    };
    const Case cases[] = {
        {"plain values",
         cell("UMTS", "Neighbor", {{"ECN0", -7}, {"RSCP", -95}, {"SCN", 300}, {"UARFCN", 10608}}),
         "{UARFCN '10608', Scrambling Code '300', RSCP '-95 dBm', Energy Per Chip '-7 dB'}"},
        {"levels not measured",
         cell("UMTS", "Neighbor", {{"UARFCN", 1}, {"SCN", 2}, {"RSCP", 32767}, {"ECN0", 32767}}),
         "{UARFCN '1', Scrambling Code '2', RSCP '', Energy Per Chip ''}"},
        {"low halves: unsigned channel and code, signed levels",
         cell("UMTS", "Neighbor", {{"UARFCN", -1}, {"SCN", 0x10005}, {"RSCP", 0xFFFF}, {"ECN0", 0x18000}}),
         "{UARFCN '65535', Scrambling Code '5', RSCP '-1 dBm', Energy Per Chip '-32768 dB'}"},
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(c.name);
        SectionHarness section = makeUMTS();
        section.update(cellInfo({c.cell}));
        EXPECT_EQ(section.node(), list({c.row}));
        EXPECT_THAT(section.errors(), IsEmpty());
    }
}

TEST(UMTSSet, ShowsTheUMTSNeighboursAloneInTheirOrder) {
    SectionHarness section = makeUMTS();
    section.update(
        cellInfo({cell("UMTS", "Serving", {{"UARFCN", 1}}), cell("GSM", "Neighbor", {{"UARFCN", 2}}),
                  cell("", "Neighbor"), cell("UMTS", ""), 7,
                  cell("UMTS", "Neighbor", {{"UARFCN", 3}, {"SCN", 3}, {"RSCP", 3}, {"ECN0", 3}}),
                  cell("UMTS", "Neighbor", {{"UARFCN", 4}, {"SCN", 4}, {"RSCP", 4}, {"ECN0", 4}})}));
    EXPECT_EQ(section.node(), "[{UARFCN '3', Scrambling Code '3', RSCP '3 dBm', Energy Per Chip '3 dB'}, "
                              "{UARFCN '4', Scrambling Code '4', RSCP '4 dBm', Energy Per Chip '4 dB'}]");
    EXPECT_THAT(section.errors(), IsEmpty());
    section.update(cellInfo({}));
    EXPECT_EQ(section.node(), "[]");
    EXPECT_THAT(section.errors(), IsEmpty());
}

TEST(UMTSSet, EveryNeighbourGivesARow) {
    SectionHarness section = makeUMTS();
    section.update(
        cellInfo({cell("UMTS", "Neighbor"), cell("UMTS", "Neighbor", {{"SCN", 3}, {"ECN0", "x"}})}));
    EXPECT_EQ(section.node(), "[{}, {Scrambling Code '3'}]");
    EXPECT_THAT(
        section.errors(),
        ElementsAre("UMTSSet: Failed to retrieve UARFCN\n", "UMTSSet: Failed to retrieve Scrambling Code\n",
                    "UMTSSet: Failed to retrieve RSCP\n", "UMTSSet: Failed to retrieve Energy Per Chip\n",
                    "UMTSSet: Failed to retrieve UARFCN\n", "UMTSSet: Failed to retrieve RSCP\n",
                    "UMTSSet: Failed to retrieve Energy Per Chip\n"));
}

TEST(UMTSSet, CellsThatCannotBeHadEmptyTheList) {
    SectionHarness section = makeUMTS();
    section.update(unreadableCellInfo());
    EXPECT_EQ(section.node(), "[]");
    EXPECT_EQ(section.lines(),
              (LogLines{{LogPriority::Warning, "UMTSSet"},
                        {LogPriority::Error, "Cell Info Array data could not be constructed"},
                        {LogPriority::Error, "Failed to get Cell Array\n"}}));
}

} // namespace

} // namespace velmora
