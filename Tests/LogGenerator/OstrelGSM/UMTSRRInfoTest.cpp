// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/UMTS/UMTSRRInfo.h"

#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

namespace velmora {

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

const auto make = inDictionary<UMTSRRInfo>;

/// 0x4031 with the transmit-power terms given; all other bytes are 0xEE.
Data powers(const std::vector<int>& terms) {
    std::vector<std::uint8_t> payload(3 + 14 * terms.size(), 0xEE);
    payload[1] = static_cast<std::uint8_t>(terms.size());
    for (std::size_t i = 0; i < terms.size(); ++i) {
        payload[3 + 14 * i + 4] = static_cast<std::uint8_t>(terms[i]);
        payload[3 + 14 * i + 5] = static_cast<std::uint8_t>(terms[i] >> 8);
    }
    return recordOf(0x4031, payload);
}

TEST(UMTSRRInfo, ShowsTheState) {
    expectEnumeration(make, recordWith(0x4125, 14), 13, "RRC State",
                      {{0, "Disconnected"},
                       {1, "Connecting"},
                       {2, "CELL_FACH"},
                       {3, "CELL_DCH"},
                       {4, "CELL_PCH"},
                       {5, "URA_PCH"}},
                      "Unknown");
    expectPrefixes(make, record(0x4125, "03 99"), 14, "UMTSRRInfo", "{RRC State 'CELL_DCH'}");
}

TEST(UMTSRRInfo, ShowsCiphering) {
    expectFlag(make, recordWith(0x4157, 19), 13, "Ciphering", "Enabled", "Disabled");
    expectPrefixes(make, recordWith(0x4157, 20, {{13, 1}}), 19, "UMTSRRInfo", "{Ciphering 'Enabled'}");
}

TEST(UMTSRRInfo, ShowsTheMeanTransmitPower) {
    struct Case {
        const char* name;
        std::vector<int> terms;
        const char* shown;
    };
    std::vector<int> barelyNegative(255, 188);
    barelyNegative[100] = 178; // -1 among 254 zeros
    const Case cases[] = {
        {"zero terms do not count", {0, 188}, "0.00 dBm"},             // 700 / 10 - 70 = 0
        {"not even in the divisor", {0, 0, 298, 0, 308}, "11.50 dBm"}, // 11 and 12
        {"each term is rounded toward zero", {197, 189}, "0.00 dBm"},  // 709 and 701
        {"so is one below zero", {-521}, "-70.00 dBm"},                // -9 / 10 = 0
        {"and the next", {-522}, "-71.00 dBm"},
        {"two decimals", {188, 198, 198}, "0.67 dBm"}, // 2 / 3
        {"terms are signed", {-1000}, "-118.00 dBm"},  // -48 - 70
        {"the greatest term", {32767}, "3257.00 dBm"}, // 3327 - 70
        {"the least term", {-32768}, "-3295.00 dBm"},  // -3225 - 70
        {"a mean that rounds to zero keeps its sign", barelyNegative, "-0.00 dBm"},
        // Filled to four characters like every power, and without a sign.
        {"terms of zero alone have no mean", {0, 0}, " nan dBm"},
        {"nor have no terms", {}, " nan dBm"},
    };
    for (const Case& c : cases) {
        SCOPED_TRACE(c.name);
        SectionHarness section = make();
        section.update(powers(c.terms));
        EXPECT_EQ(section.node(), "{Transmit Power '" + std::string(c.shown) + "'}");
        EXPECT_THAT(section.errors(), IsEmpty());
    }
}

TEST(UMTSRRInfo, TakesOnlyCompleteTransmitPowers) {
    const Data two = powers({288, 388}); // 10 and 20
    ASSERT_EQ(two.size(), 44u);
    expectPrefixes(make, two, 16, "UMTSRRInfo", [](std::size_t length) {
        return length < 30   ? "{Transmit Power ' nan dBm'}"
               : length < 44 ? "{Transmit Power '10.00 dBm'}"
                             : "{Transmit Power '15.00 dBm'}";
    });
    SectionHarness section = make();
    section.update(prefixOf(two, 43));
    EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, "UMTSRRInfo"},
                                         {LogPriority::Error, "Record 0x4031: 1 of 2 entries"}}));
}

constexpr std::string_view cellBytes = R"(
    01 00 00 80             # uplink: -2147483647
    FF FF FF FF             # downlink: -1
    78 56 34 12             # cell identity: 305419896
    FF FF                   # URA: 65535, unsigned
    EE EE
    99
)";

TEST(UMTSRRInfo, ShowsTheCellOfTheBaseband) {
    const Data full = record(0x4127, cellBytes);
    ASSERT_EQ(full.size(), 30u);
    expectPrefixes(make, full, 29, "UMTSRRInfo",
                   "{Cell ID '305419896', Downlink Frequency '-1', Uplink Frequency '-2147483647', "
                   "URA ID '65535'}");
}

TEST(UMTSRRInfo, TheBasebandsCellRemovesTheServicesChannel) {
    SectionHarness section = make();
    section.update(cellInfo({cell("UMTS", "Serving", {{"CellId", 1}, {"UARFCN", 10608}, {"SCN", 300}})}));
    EXPECT_EQ(section.node(), "{Cell ID '1', UARFCN '10608', Scrambling Code '300'}");
    section.update(record(0x4127, cellBytes));
    EXPECT_EQ(section.node(), "{Cell ID '305419896', Scrambling Code '300', Downlink Frequency '-1', "
                              "Uplink Frequency '-2147483647', URA ID '65535'}");
    // One that is too short removes nothing.
    section.update(cellInfo({cell("UMTS", "Serving", {{"CellId", 1}, {"UARFCN", 10608}, {"SCN", 300}})}));
    section.update(prefixOf(record(0x4127, cellBytes), 28));
    EXPECT_EQ(section.text("UARFCN"), "10608");
}

TEST(UMTSRRInfo, ShowsTheFirstServingUMTSCell) {
    struct Case {
        const char* name;
        Data record;
        const char* expected;
    };
    const Case cases[] = {
        {"whole signed numbers",
         cellInfo({cell("UMTS", "Serving", {{"SCN", 70000}, {"UARFCN", -1}, {"CellId", 2147483647}})}),
         "{Cell ID '2147483647', UARFCN '-1', Scrambling Code '70000'}"},
        {"others are passed over",
         cellInfo({cell("GSM", "Serving", {{"CellId", 1}}), cell("UMTS", "Neighbor", {{"CellId", 2}}),
                   cell("", "Serving", {{"CellId", 3}}), cell("UMTS", "", {{"CellId", 4}}), "text",
                   cell("UMTS", "Serving", {{"CellId", 5}, {"UARFCN", 6}, {"SCN", 7}}),
                   cell("UMTS", "Serving", {{"CellId", 8}, {"UARFCN", 9}, {"SCN", 10}})}),
         "{Cell ID '5', UARFCN '6', Scrambling Code '7'}"},
        {"no serving UMTS cell", cellInfo({cell("GSM", "Serving", {{"CellId", 1}})}), "{}"},
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

TEST(UMTSRRInfo, ReportsEachNumberThatTheCellLacks) {
    SectionHarness section = make();
    section.update(cellInfo({cell("UMTS", "Serving", {{"CellId", 5}, {"UARFCN", 6}, {"SCN", 7}})}));

    section.update(cellInfo({cell("UMTS", "Serving")}));
    EXPECT_THAT(section.errors(), ElementsAre("UMTSRRInfo: Failed to retrieve Cell ID\n",
                                              "UMTSRRInfo: Failed to retrieve UARFCN\n",
                                              "UMTSRRInfo: Failed to retrieve Scrambling Code\n"));
    EXPECT_EQ(section.node(), "{Cell ID '5', UARFCN '6', Scrambling Code '7'}");

    section.update(cellInfo({cell("UMTS", "Serving", {{"CellId", 8}, {"SCN", 9}})}));
    EXPECT_THAT(section.errors(), ElementsAre("UMTSRRInfo: Failed to retrieve UARFCN\n"));
    EXPECT_EQ(section.node(), "{Cell ID '8', UARFCN '6', Scrambling Code '9'}");
}

TEST(UMTSRRInfo, KeepsItsValuesWhereTheCellsCannotBeHad) {
    SectionHarness section = make();
    section.update(record(0x4125, "02"));
    section.update(unreadableCellInfo());
    EXPECT_EQ(section.lines(),
              (LogLines{{LogPriority::Warning, "UMTSRRInfo"},
                        {LogPriority::Error, "Cell Info Array data could not be constructed"},
                        {LogPriority::Error, "Failed to get Cell Array\n"}}));
    EXPECT_EQ(section.node(), "{RRC State 'CELL_FACH'}");
}

} // namespace

} // namespace velmora
