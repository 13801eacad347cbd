// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LTE/LTEServingCellInfo.h"

#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

namespace velmora {

namespace {

using testing::ElementsAre;

const auto make = inDictionary<LTEServingCellInfo>;
constexpr std::string_view trace = "LTE Serving Cell Info";

constexpr std::string_view cellBytes = R"(
    EE
    F7 01                               # cell 503
    14 05                               # downlink 1300
    64 4B                               # uplink 19300
    64                                  # 100 resource blocks
    32                                  # 50 resource blocks
    01 02 03 04                         # identity: 0x04030201
    FE FF                               # tracking area: 65534
    03 00 00 00                         # band 3
    EE EE EE EE EE EE
    99                                  # longer than needed
)";

TEST(LTEServingCellInfo, ShowsTheBasebandsCell) {
    const Data full = record(0xB0C2, cellBytes);
    ASSERT_EQ(full.size(), 39u);
    expectPrefixes(make, full, 38, trace,
                   "{Physical Cell ID '503', Download Frequency '1300', Upload Frequency '19300', "
                   "Download Bandwidth '20 MHz', Upload Bandwidth '10 MHz', Cell Identity '67305985', "
                   "Tracking Area Code '65534', Freq Band Indicator '3'}");
    SectionHarness section = make();
    section.update(full);
    EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, std::string(trace)}}));
}

TEST(LTEServingCellInfo, NumbersShowAllTheirBits) {
    SectionHarness section = make();
    section.update(recordWith(0xB0C2, 38,
                              {{14, 0xFF},
                               {15, 0xFF},
                               {18, 0xFF},
                               {19, 0xFF},
                               {22, 0xFE},
                               {23, 0xFF},
                               {24, 0xFF},
                               {25, 0xFF},
                               {28, 0xFF},
                               {29, 0xFF},
                               {30, 0xFF},
                               {31, 0x7F}}));
    // 32 bits go through "%d": what is above its range shows as negative.
    EXPECT_EQ(section.node(), "{Physical Cell ID '65535', Download Frequency '0', Upload Frequency '65535', "
                              "Download Bandwidth 'Unknown', Upload Bandwidth 'Unknown', Cell Identity '-2', "
                              "Tracking Area Code '0', Freq Band Indicator '2147483647'}");
    section.update(recordWith(0xB0C2, 38, {{16, 0xFF}, {17, 0xFF}, {26, 0xFF}, {27, 0xFF}}));
    EXPECT_EQ(section.node(), "{Physical Cell ID '0', Download Frequency '65535', Upload Frequency '0', "
                              "Download Bandwidth 'Unknown', Upload Bandwidth 'Unknown', Cell Identity '0', "
                              "Tracking Area Code '65535', Freq Band Indicator '0'}");
}

TEST(LTEServingCellInfo, ShowsEveryBandwidth) {
    const Data cell = recordWith(0xB0C2, 38);
    for (const auto& [offset, label] : {std::pair(20u, "Download Bandwidth"), {21u, "Upload Bandwidth"}})
        expectEnumeration(
            make, cell, offset, label,
            {{6, "1.4 MHz"}, {15, "3 MHz"}, {25, "5 MHz"}, {50, "10 MHz"}, {75, "15 MHz"}, {100, "20 MHz"}},
            "Unknown");
}

TEST(LTEServingCellInfo, AntennasAreShownAndTheRecordReportedAsUnknown) {
    expectPrefixes(make, recordWith(0xB0C1, 23, {{19, 1}, {20, 4}, {21, 2}}), 22, trace,
                   "{Num Tx Antennas '4'}");
    SectionHarness section = make();
    section.update(recordWith(0xB0C1, 22, {{20, 200}}));
    EXPECT_EQ(section.node(), "{Num Tx Antennas '200'}");
    EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, std::string(trace)},
                                         {LogPriority::Error, "Received an unknown log message: 45249"}}));
    // One that is too short is not even that.
    section.update(recordWith(0xB0C1, 21, {{20, 2}}));
    EXPECT_EQ(section.node(), "{Num Tx Antennas '200'}");
    EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, std::string(trace)}}));
}

/// A serving LTE cell with all five numbers.
Value fullCell() {
    return cell("LTE", "Serving",
                {{"UARFCN", 1300}, {"BandInfo", 3}, {"PID", 1}, {"CellId", 513}, {"TAC", 7001}});
}
constexpr std::string_view fullText =
    "{Tracking Area Code '7001', Cell Identity '513', Physical Cell ID '1', Freq Band Indicator '3', "
    "UARFCN '1300'}";

TEST(LTEServingCellInfo, ShowsTheFirstServingLTECell) {
    struct Case {
        const char* name;
        Data record;
        std::string_view expected;
    };
    const Case cases[] = {
        {"in the order of the labels", cellInfo({fullCell()}), fullText},
        {"others are passed over, and those behind it",
         cellInfo({cell("GSM", "Serving", {{"TAC", 1}}), cell("UMTS", "Serving", {{"TAC", 2}}),
                   cell("LTE", "Neighbor", {{"TAC", 3}}), cell("", "Serving", {{"TAC", 4}}),
                   cell("LTE", "", {{"TAC", 5}}), "text", fullCell(), cell("LTE", "Serving", {{"TAC", 6}})}),
         fullText},
        {"numbers are signed",
         cellInfo({cell("LTE", "Serving",
                        {{"TAC", -1},
                         {"CellId", -2147483648LL},
                         {"PID", 2147483647},
                         {"BandInfo", 65536},
                         {"UARFCN", 65537}})}),
         "{Tracking Area Code '-1', Cell Identity '-2147483648', Physical Cell ID '2147483647', "
         "Freq Band Indicator '65536', UARFCN '65537'}"},
        {"a neighbour alone", cellInfo({cell("LTE", "Neighbor", {{"TAC", 3}})}), "{}"},
        {"no cells", cellInfo({}), "{}"},
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(c.name);
        SectionHarness section = make();
        section.update(c.record);
        EXPECT_EQ(section.node(), c.expected);
        EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, std::string(trace)}}));
    }
}

TEST(LTEServingCellInfo, ReportsEachNumberThatTheCellLacks) {
    SectionHarness section = make();
    section.update(cellInfo({fullCell()}));
    section.update(cellInfo({cell("LTE", "Serving")}));
    EXPECT_EQ(section.lines(),
              (LogLines{{LogPriority::Warning, std::string(trace)},
                        {LogPriority::Error, "Serving Cell Info: Failed to retrieve TAC\n"},
                        {LogPriority::Error, "Serving Cell Info: Failed to retrieve Cell ID\n"},
                        {LogPriority::Error, "Serving Cell Info: Failed to retrieve Physical Cell ID\n"},
                        {LogPriority::Error, "Serving Cell Info: Failed to retrieve Freq Band Indicator\n"},
                        {LogPriority::Error, "Serving Cell Info: Failed to retrieve UARFCN\n"}}));
    EXPECT_EQ(section.node(), fullText);

    section = make();
    section.update(
        cellInfo({cell("LTE", "Serving", {{"CellId", 1}, {"PID", 2}, {"BandInfo", 3}, {"UARFCN", 4}})}));
    EXPECT_THAT(section.errors(), ElementsAre("Serving Cell Info: Failed to retrieve TAC\n"));
    EXPECT_EQ(section.node(),
              "{Cell Identity '1', Physical Cell ID '2', Freq Band Indicator '3', UARFCN '4'}");

    // Text is no number; the last field is tried all the same.
    section.update(cellInfo({cell(
        "LTE", "Serving",
        {{"TAC", 9}, {"CellId", "1"}, {"PID", makeArray()}, {"BandInfo", 2147483648LL}, {"UARFCN", 5}})}));
    EXPECT_THAT(section.errors(), ElementsAre("Serving Cell Info: Failed to retrieve Cell ID\n",
                                              "Serving Cell Info: Failed to retrieve Physical Cell ID\n",
                                              "Serving Cell Info: Failed to retrieve Freq Band Indicator\n"));
    EXPECT_EQ(section.node(), "{Cell Identity '1', Physical Cell ID '2', Freq Band Indicator '3', "
                              "UARFCN '5', Tracking Area Code '9'}");
}

TEST(LTEServingCellInfo, KeepsItsValuesWhereTheCellsCannotBeHad) {
    SectionHarness section = make();
    section.update(cellInfo({fullCell()}));
    section.update(unreadableCellInfo());
    EXPECT_EQ(section.lines(),
              (LogLines{{LogPriority::Warning, std::string(trace)},
                        {LogPriority::Error, "Cell Info Array data could not be constructed"},
                        {LogPriority::Error, "Failed to get Cell Array\n"}}));
    EXPECT_EQ(section.node(), fullText);
    // A readable payload of another kind is no array either.
    section.update(extraRecord(1, makeDictionary()));
    EXPECT_THAT(section.errors(), ElementsAre("Failed to get Cell Array\n"));
    EXPECT_EQ(section.node(), fullText);
}

TEST(LTEServingCellInfo, WhatCameLastIsShown) {
    SectionHarness section = make();
    section.update(cellInfo({fullCell()}));
    // A record that is too short leaves even "UARFCN".
    section.update(prefixOf(record(0xB0C2, cellBytes), 37));
    EXPECT_EQ(section.node(), fullText);

    section.update(record(0xB0C2, cellBytes));
    EXPECT_EQ(section.node(),
              "{Tracking Area Code '65534', Cell Identity '67305985', Physical Cell ID '503', "
              "Freq Band Indicator '3', Download Frequency '1300', Upload Frequency '19300', "
              "Download Bandwidth '20 MHz', Upload Bandwidth '10 MHz'}");

    section.update(recordWith(0xB0C1, 22, {{20, 2}}));
    section.update(cellInfo({fullCell()}));
    EXPECT_EQ(section.node(), "{Tracking Area Code '7001', Cell Identity '513', Physical Cell ID '1', "
                              "Freq Band Indicator '3', Download Frequency '1300', "
                              "Upload Frequency '19300', Download Bandwidth '20 MHz', "
                              "Upload Bandwidth '10 MHz', Num Tx Antennas '2', UARFCN '1300'}");
}

} // namespace

} // namespace velmora
