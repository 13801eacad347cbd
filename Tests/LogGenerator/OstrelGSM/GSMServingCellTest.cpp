// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/GSM/GSMServingCell.h"

#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

namespace velmora {

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

const auto make = inDictionary<GSMServingCell>;

TEST(GSMServingCell, ShowsTheIdentity) {
    const Data identity = record(0x5134, R"(
        FF 03                           # ARFCN: 1023
        3F 80                           # BSIC: 32831, all 16 bits
        FE FF                           # cell identity: 65534, unsigned
        00 00 00 00 00 00 00
        99                              # longer than needed
    )");
    ASSERT_EQ(identity.size(), 27u);
    expectPrefixes(make, identity, 26, "GSMServingCell", "{Cell ID '65534', ARFCN '1023', BSIC '32831'}");
}

TEST(GSMServingCell, ShowsLevelAndReselectionValuesUnsigned) {
    const Data levels = record(0x5137, R"(
        00 00
        AB                              # level: 171, neither signed nor offset
        FE FF 01 00                     # C1: the low half alone, 65534
        10 27 FF FF                     # C2: 10000
        00 00 00 00
        00                              # no neighbours
        99
    )");
    ASSERT_EQ(levels.size(), 30u);
    expectPrefixes(make, levels, 29, "GSMServingCell",
                   "{RSSI '171 dBm', C1 Value '65534', C2 Value '10000'}");

    SectionHarness section = make();
    section.update(recordWith(0x5137, 29, {{15, 85}}));
    EXPECT_EQ(section.text("RSSI"), "85 dBm");
}

TEST(GSMServingCell, ShowsTheDedicatedChannelModulo256) {
    expectPrefixes(make, record(0x5076, "00 02 00 00 99"), 17, "GSMServingCell",
                   "{MA Dedicated ARFCN '0'}"); // 512
    SectionHarness section = make();
    section.update(record(0x5076, "FF 03 00 00"));
    EXPECT_EQ(section.text("MA Dedicated ARFCN"), "255"); // 1023
    section.update(record(0x5076, "7C 00 00 00"));
    EXPECT_EQ(section.text("MA Dedicated ARFCN"), "124");
}

TEST(GSMServingCell, ShowsTheFirstServingGSMCell) {
    struct Case {
        const char* name;
        Data record;
        const char* expected;
    };
    const Case cases[] = {
        {"numbers are whole and signed",
         cellInfo({cell("GSM", "Serving", {{"CellId", -2147483648LL}, {"ARFCN", 100000}})}),
         "{Cell ID '-2147483648', ARFCN '100000'}"},
        {"other technologies, neighbours and cells without a key are passed over",
         cellInfo({cell("UMTS", "Serving", {{"CellId", 1}, {"ARFCN", 1}}),
                   cell("GSM", "Neighbor", {{"CellId", 2}, {"ARFCN", 2}}),
                   cell("", "Serving", {{"CellId", 3}, {"ARFCN", 3}}),
                   cell("GSM", "", {{"CellId", 4}, {"ARFCN", 4}}), "text",
                   cell("GSM", "Serving", {{"CellId", 5}, {"ARFCN", 6}}),
                   cell("GSM", "Serving", {{"CellId", 7}, {"ARFCN", 8}})}),
         "{Cell ID '5', ARFCN '6'}"},
        {"no serving cell", cellInfo({cell("GSM", "Neighbor", {{"CellId", 1}})}), "{}"},
        {"no cells", cellInfo({}), "{}"},
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(c.name);
        SectionHarness section = make();
        section.update(c.record);
        EXPECT_EQ(section.node(), c.expected);
        EXPECT_THAT(section.errors(), IsEmpty());
    }
}

TEST(GSMServingCell, ReportsEachNumberThatTheCellLacks) {
    SectionHarness section = make();
    section.update(cellInfo({cell("GSM", "Serving", {{"CellId", 5}, {"ARFCN", 6}})}));

    section.update(cellInfo({cell("GSM", "Serving")}));
    EXPECT_THAT(section.errors(), ElementsAre("GSMServingCell: Failed to retrieve Cell ID\n",
                                              "GSMServingCell: Failed to retrieve ARFCN\n"));
    EXPECT_EQ(section.node(), "{Cell ID '5', ARFCN '6'}");

    section.update(cellInfo({cell("GSM", "Serving", {{"CellId", "9"}, {"ARFCN", 10}})}));
    EXPECT_THAT(section.errors(), ElementsAre("GSMServingCell: Failed to retrieve Cell ID\n"));
    EXPECT_EQ(section.node(), "{Cell ID '5', ARFCN '10'}");
}

TEST(GSMServingCell, KeepsItsValuesWhereTheCellsCannotBeHad) {
    SectionHarness section = make();
    section.update(cellInfo({cell("GSM", "Serving", {{"CellId", 5}, {"ARFCN", 6}})}));
    section.update(unreadableCellInfo());
    EXPECT_EQ(section.lines(),
              (LogLines{{LogPriority::Warning, "GSMServingCell"},
                        {LogPriority::Error, "Cell Info Array data could not be constructed"},
                        {LogPriority::Error, "Failed to get Cell Array\n"}}));
    EXPECT_EQ(section.node(), "{Cell ID '5', ARFCN '6'}");
}

} // namespace

} // namespace velmora
