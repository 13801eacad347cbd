// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/Registration/ServingPLMN.h"

#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

namespace velmora {

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

const auto make = inDictionary<ServingPLMN>;

/// 0x7135 with the three PLMN bytes given.
Data identity(std::uint8_t first, std::uint8_t second, std::uint8_t third) {
    return recordWith(0x7135, 32, {{15, first}, {16, second}, {17, third}});
}

TEST(ServingPLMN, ShowsTheSelectionMode) {
    expectEnumeration(make, recordWith(0x7132, 16), 14, "PLMN Sel Mod",
                      {{0, "Automatic"},
                       {1, "Manual"},
                       {2, "Limited"},
                       {3, "LIMITED_ROUTINE_ACQ"},
                       {4, "LIMITED_MANUAL_ACQ"}},
                      "Unknown");
    expectPrefixes(make, recordWith(0x7132, 20, {{14, 1}}), 16, "Serving PLMN", "{PLMN Sel Mod 'Manual'}");
}

TEST(ServingPLMN, ShowsTheServiceType) {
    expectEnumeration(
        make, recordWith(0x7135, 32), 14, "Service Type",
        {{0, "NO_SERVICE"}, {1, "CS_ONLY"}, {2, "PS_ONLY"}, {3, "CS_PS_SERVICE"}, {4, "LIMITED_SERVICE"}},
        "Unknown");
}

TEST(ServingPLMN, ShowsIdentityAreasAndServiceInThisOrder) {
    const Data full = record(0x7135, R"(
        02                              # network operating mode, shown elsewhere
        03                              # service type
        62 F0 01                        # PLMN 260 10
        12 34                           # location area, big-endian: 4660
        FE                              # routing area: 254
        00 00 00 00 00 00 00 00 00 00 00
        99                              # a record may be longer than needed
    )");
    ASSERT_EQ(full.size(), 33u);
    expectPrefixes(make, full, 32, "Serving PLMN",
                   "{Mobile Country Code '260', Mobile Network Code '10 ', Location Area Code '4660', "
                   "Routing Area Code '254', Service Type 'CS_PS_SERVICE'}");
}

TEST(ServingPLMN, ReadsTheNetworkAsBCD) {
    struct Case {
        const char* name;
        Data record;
        const char* mcc;
        const char* mnc;
    };
    const Case cases[] = {
        {"two digits of MNC end in a blank", identity(0x62, 0xF0, 0x01), "260", "10 "},
        {"three digits of MNC, the third in the middle byte", identity(0x13, 0x40, 0x26), "310", "624"},
        {"odd digits all through", identity(0x35, 0x17, 0x19), "537", "911"},
        {"fillers in the MCC are blanks", identity(0xFF, 0xF0, 0x01), "  0", "10 "},
        {"ten is the first filler", identity(0xA9, 0x9A, 0xA9), "9  ", "9 9"},
        {"nothing but fillers", identity(0xFF, 0xFF, 0xFF), "   ", "   "},
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(c.name);
        SectionHarness section = make();
        section.update(c.record);
        EXPECT_EQ(section.text("Mobile Country Code"), c.mcc);
        EXPECT_EQ(section.text("Mobile Network Code"), c.mnc);
    }
}

TEST(ServingPLMN, ShowsTheFirstServingCellOfGSMOrUMTS) {
    struct Case {
        const char* name;
        Data record;
        const char* expected;
    };
    const Case cases[] = {
        {"GSM", cellInfo({cell("GSM", "Serving", {{"MCC", 262}, {"MNC", 1}, {"LAC", 4711}})}),
         "{Mobile Country Code '262', Mobile Network Code '1', Location Area Code '4711'}"},
        {"UMTS", cellInfo({cell("UMTS", "Serving", {{"MCC", 262}, {"MNC", 2}, {"LAC", -1}})}),
         "{Mobile Country Code '262', Mobile Network Code '2', Location Area Code '-1'}"},
        {"LTE is passed over",
         cellInfo({cell("LTE", "Serving", {{"MCC", 1}, {"MNC", 1}, {"LAC", 1}}),
                   cell("GSM", "Serving", {{"MCC", 2}, {"MNC", 2}, {"LAC", 2}})}),
         "{Mobile Country Code '2', Mobile Network Code '2', Location Area Code '2'}"},
        {"only the first counts",
         cellInfo({cell("UMTS", "Serving", {{"MCC", 3}, {"MNC", 3}, {"LAC", 3}}),
                   cell("GSM", "Serving", {{"MCC", 4}, {"MNC", 4}, {"LAC", 4}})}),
         "{Mobile Country Code '3', Mobile Network Code '3', Location Area Code '3'}"},
        {"neighbours are passed over", cellInfo({cell("GSM", "Neighbor", {{"MCC", 3}})}), "{}"},
        {"so are cells that lack a key",
         cellInfo({cell("", "Serving", {{"MCC", 3}}), cell("GSM", "", {{"MCC", 3}})}), "{}"},
        {"and what is no cell", cellInfo({"text", 7}), "{}"},
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

TEST(ServingPLMN, ReportsEachNumberThatACellLacks) {
    SectionHarness section = make();
    section.update(cellInfo({cell("GSM", "Serving", {{"MCC", 1}, {"MNC", 2}, {"LAC", 3}})}));

    section.update(cellInfo({cell("GSM", "Serving"), cell("GSM", "Serving", {{"MCC", 9}})}));
    EXPECT_THAT(section.errors(),
                ElementsAre("ServingPLMN: Failed to retrieve MCC\n", "ServingPLMN: Failed to retrieve MNC\n",
                            "ServingPLMN: Failed to retrieve LAC\n"));
    EXPECT_EQ(section.node(), "{Mobile Country Code '1', Mobile Network Code '2', Location Area Code '3'}");

    section.update(cellInfo({cell("GSM", "Serving", {{"MCC", 4}, {"MNC", "5"}, {"LAC", 6}})}));
    EXPECT_THAT(section.errors(), ElementsAre("ServingPLMN: Failed to retrieve MNC\n"));
    EXPECT_EQ(section.node(), "{Mobile Country Code '4', Mobile Network Code '2', Location Area Code '6'}");
}

TEST(ServingPLMN, KeepsItsValuesWhereTheCellsCannotBeHad) {
    SectionHarness section = make();
    section.update(identity(0x62, 0xF0, 0x01));
    const std::string before = section.node();
    section.update(unreadableCellInfo());
    EXPECT_THAT(section.errors(),
                ElementsAre("Cell Info Array data could not be constructed", "Failed to get Cell Array\n"));
    EXPECT_EQ(section.node(), before);
    section.update(extraRecord(1, makeDictionary()));
    EXPECT_THAT(section.errors(), ElementsAre("Failed to get Cell Array\n"));
    EXPECT_EQ(section.node(), before);
}

TEST(ServingPLMN, TheLastWriterOfALabelWins) {
    SectionHarness section = make();
    section.update(identity(0x62, 0xF0, 0x10));
    EXPECT_EQ(section.text("Mobile Network Code"), "01 ");
    section.update(cellInfo({cell("GSM", "Serving", {{"MCC", 260}, {"MNC", 1}, {"LAC", 3}})}));
    EXPECT_EQ(section.text("Mobile Network Code"), "1");
    section.update(identity(0x62, 0xF0, 0x10));
    EXPECT_EQ(section.text("Mobile Network Code"), "01 ");
}

} // namespace

} // namespace velmora
