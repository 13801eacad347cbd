// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/UTRAN/UTRANServingCellInfo.h"

#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

namespace velmora {

namespace {

using testing::ElementsAre;

const auto make = inDictionary<UTRANServingCellInfo>;

const Data binary = record(0xD0E2, R"(
    99
    80              # access restrictions: 128
    FE              # URA: 254
    99
    46 27           # uplink: 10054
    89 A7           # downlink: 42889, unsigned
    FE FF FF FF     # cell: -2, signed
    FD              # all calls: bit 0 alone counts
    99              # longer than needed
)");

constexpr const char* binaryShown =
    "{Cell Access Restrictions '128', Cell ID '-2', Downlink UARFCN '42889', Uplink UARFCN '10054', "
    "URA ID '254', Allowed Access 'Emergency Calls Only'}";

TEST(UTRANServingCellInfo, ShowsTheBasebandsCell) {
    ASSERT_EQ(binary.size(), 27u);
    expectPrefixes(make, binary, 26, "Serving Cell Info", binaryShown);
    SectionHarness section = make();
    section.update(binary);
    EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, "Serving Cell Info"}}));
    for (unsigned byte = 0; byte < 256; ++byte) {
        section.update(withByte(binary, 25, static_cast<std::uint8_t>(byte)));
        EXPECT_EQ(section.text("Allowed Access"), byte % 2 == 1 ? "Emergency Calls Only" : "All Calls")
            << byte;
    }
}

TEST(UTRANServingCellInfo, AShortRecordLeavesTheValues) {
    SectionHarness section = make();
    section.update(binary);
    section.update(prefixOf(withByte(binary, 15, 1), 25));
    EXPECT_EQ(section.node(), binaryShown);
}

TEST(UTRANServingCellInfo, ShowsTheServicesCellWithTheOneChannelUnderBothLabels) {
    SectionHarness section = make();
    section.update(cellInfo({cell(
        "UTRAN", "Serving",
        {{"UARFCN", 10054}, {"SCN", 127}, {"BandInfo", 34}, {"CellId", -2147483648LL}, {"LAC", 65534}})}));
    EXPECT_EQ(section.node(), "{Local Area Code '65534', Cell ID '-2147483648', Freq Band Indicator '34', "
                              "Cell Scrambling Code '127', Uplink UARFCN '10054', Downlink UARFCN '10054'}");
    EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, "Serving Cell Info"}}));
}

TEST(UTRANServingCellInfo, BothSourcesWriteIntoOneNode) {
    SectionHarness section = make();
    section.update(binary);
    section.update(cellInfo(
        {cell("UTRAN", "Serving", {{"LAC", 1}, {"CellId", 2}, {"BandInfo", 3}, {"SCN", 4}, {"UARFCN", 5}})}));
    EXPECT_EQ(
        section.node(),
        "{Cell Access Restrictions '128', Cell ID '2', Downlink UARFCN '5', Uplink UARFCN '5', URA ID '254', "
        "Allowed Access 'Emergency Calls Only', Local Area Code '1', Freq Band Indicator '3', "
        "Cell Scrambling Code '4'}");
}

TEST(UTRANServingCellInfo, EveryServingCellIsReadInTurn) {
    SectionHarness section = make();
    section.update(cellInfo({
        cell("UTRAN", "Serving", {{"LAC", 1}, {"CellId", 2}, {"BandInfo", 3}, {"SCN", 4}, {"UARFCN", 5}}),
        cell("UTRAN", "Neighbor", {{"LAC", 91}, {"CellId", 92}}),
        cell("UTRAN", "Serving", {{"LAC", 11}, {"BandInfo", 13}}),
    }));
    EXPECT_EQ(section.node(), "{Local Area Code '11', Cell ID '2', Freq Band Indicator '13', "
                              "Cell Scrambling Code '4', Uplink UARFCN '5', Downlink UARFCN '5'}");
    EXPECT_THAT(section.errors(), ElementsAre("Serving Cell Info: Failed to retrieve Cell ID\n",
                                              "Serving Cell Info: Failed to retrieve Cell Scrambling Code\n",
                                              "Serving Cell Info: Failed to retrieve UARFCN\n"));
}

TEST(UTRANServingCellInfo, OtherElementsAreSkippedSilently) {
    struct Case {
        const char* name;
        Value element;
    };
    const Case cases[] = {
        {"another technology", cell("UMTS", "Serving", {{"LAC", 1}})},
        {"GSM", cell("GSM", "Serving", {{"LAC", 1}})},
        {"a neighbour", cell("UTRAN", "Neighbor", {{"LAC", 1}})},
        {"no technology", cell("", "Serving", {{"LAC", 1}})},
        {"no type", cell("UTRAN", "", {{"LAC", 1}})},
        {"no dictionary", "UTRAN"},
        {"an array", makeArray()},
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(c.name);
        SectionHarness section = make();
        section.update(binary);
        section.update(cellInfo({c.element}));
        EXPECT_EQ(section.node(), binaryShown);
        EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, "Serving Cell Info"}}));
    }
}

TEST(UTRANServingCellInfo, ReportsEachNumberThatTheCellLacks) {
    struct Case {
        const char* missing;
        const char* line;
    };
    const Case cases[] = {
        {"LAC", "Serving Cell Info: Failed to retrieve LAC\n"},
        {"CellId", "Serving Cell Info: Failed to retrieve Cell ID\n"},
        {"BandInfo", "Serving Cell Info: Failed to retrieve Freq Band Indicator\n"},
        {"SCN", "Serving Cell Info: Failed to retrieve Cell Scrambling Code\n"},
        {"UARFCN", "Serving Cell Info: Failed to retrieve UARFCN\n"},
    };
    const auto whole =
        cell("UTRAN", "Serving", {{"LAC", 1}, {"CellId", 2}, {"BandInfo", 3}, {"SCN", 4}, {"UARFCN", 5}});
    for (const Case& c : cases) {
        SCOPED_TRACE(c.missing);
        const DictionaryRef lacking = std::make_shared<Dictionary>(*whole.asDictionary());
        lacking->set(std::string("kVoxCellMonitor") + c.missing, "6"); // text is no number
        SectionHarness section = make();
        section.update(cellInfo({lacking}));
        EXPECT_EQ(section.lines(),
                  (LogLines{{LogPriority::Warning, "Serving Cell Info"}, {LogPriority::Error, c.line}}));
        EXPECT_EQ(section.value().asDictionary()->size(), c.missing == std::string("UARFCN") ? 4u : 5u);
        EXPECT_EQ(section.node().find("'6'"), std::string::npos);
    }
}

TEST(UTRANServingCellInfo, WhatIsNoArrayOfCellsDoesNothing) {
    struct Case {
        const char* name;
        Data record;
        std::vector<std::string> errors;
    };
    const Case cases[] = {
        {"empty", cellInfo({}), {}},
        {"a dictionary", extraRecord(1, cell("UTRAN", "Serving", {{"LAC", 1}})), {}},
        {"text", extraRecord(1, "UTRAN"), {}},
        // The line is the payload reader's; the section has none of its own.
        {"unreadable", unreadableCellInfo(), {"Cell Info Array data could not be constructed"}},
        {"no payload", record(1, "", 0xFF), {"Cell Info Array data could not be constructed"}},
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(c.name);
        SectionHarness section = make();
        section.update(binary);
        section.update(c.record);
        EXPECT_EQ(section.node(), binaryShown);
        EXPECT_EQ(section.errors(), c.errors);
        EXPECT_EQ(section.lines().size(), 1 + c.errors.size());
    }
}

TEST(UTRANServingCellInfo, ARecordOfTheServiceThatIsCutOffDoesNothing) {
    const Data whole = cellInfo({cell("UTRAN", "Serving", {{"LAC", 1}})});
    ASSERT_EQ(whole.bytes().back(), '\n'); // without this one byte it is still complete
    for (std::size_t length = 0; length < whole.size() - 1; ++length) {
        SectionHarness section = make();
        section.update(prefixOf(whole, length), 0xFF0001);
        EXPECT_EQ(section.node(), "{}") << length;
        EXPECT_THAT(section.errors(), ElementsAre("Cell Info Array data could not be constructed")) << length;
    }
}

} // namespace

} // namespace velmora
