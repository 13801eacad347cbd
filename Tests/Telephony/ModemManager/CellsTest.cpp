// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/ModemManager/CellsFixture.h"

#include <limits>

/// Cells as ModemManager reports them, from the bus to what a decoder shows.

namespace velmora {
namespace {

using namespace std::chrono_literals;
using ::testing::IsEmpty;

using CellsTest = CellsFixture;

TEST_F(CellsTest, gsm) {
    putModem(gsmAccess);
    setCells({
        {{"cell-type", 2U},
         {"serving", true},
         {"operator-id", "21034"},
         {"lac", "84CD"},
         {"ci", "2BAF"},
         {"arfcn", 62U},
         {"base-station-id", "3F"},
         {"timing-advance", 3U},
         {"rx-level", 40U}}, // -111 + 40 = -71 dBm: between the steps -70 and -72
        {{"cell-type", 2U}, {"serving", false}, {"arfcn", 512U}, {"rx-level", 33U}}, // -78 dBm
        {{"cell-type", 2U}, {"serving", false}, {"arfcn", 513U}, {"rx-level", 32U}}, // -79 dBm
        {{"cell-type", 2U}, {"serving", false}, {"arfcn", 514U}, {"rx-level", 0U}},  // -111 dBm
        {{"cell-type", 2U}, {"serving", false}, {"arfcn", 515U}, {"rx-level", 63U}}, // -48 dBm
    });
    follow();
    EXPECT_EQ(source->technology(), kVoxLogChannelTechnology_Ostrel_GSM);
    listen();
    constexpr auto kind = kVoxCellMonitorRadioAccessTechnologyGSM;
    constexpr auto neighbour = kVoxCellMonitorCellTypeNeighbor;
    EXPECT_EQ(cells(),
              array({
                  cell(kind, kVoxCellMonitorCellTypeServing,
                       {{"kVoxCellMonitorMCC", 210},
                        {"kVoxCellMonitorMNC", 34},
                        {"kVoxCellMonitorLAC", 33997},
                        {"kVoxCellMonitorCellId", 11183},
                        {"kVoxCellMonitorARFCN", 62},
                        {"kVoxCellMonitorRSSI", -36}}),
                  cell(kind, neighbour, {{"kVoxCellMonitorARFCN", 512}, {"kVoxCellMonitorRSSI", -39}}),
                  cell(kind, neighbour, {{"kVoxCellMonitorARFCN", 513}, {"kVoxCellMonitorRSSI", -40}}),
                  cell(kind, neighbour, {{"kVoxCellMonitorARFCN", 514}, {"kVoxCellMonitorRSSI", -56}}),
                  cell(kind, neighbour, {{"kVoxCellMonitorARFCN", 515}, {"kVoxCellMonitorRSSI", -24}}),
              }));

    const Value shown = display("Ostrel_GSM");
    EXPECT_EQ(at(shown, {"GSM", "GSM Serving Cell", "Cell ID"}), Value("11183"));
    EXPECT_EQ(at(shown, {"GSM", "GSM Serving Cell", "ARFCN"}), Value("62"));
    EXPECT_EQ(at(shown, {"GSM", "Neighboring Cells", "0", "ARFCN"}), Value("512"));
    EXPECT_EQ(at(shown, {"GSM", "Neighboring Cells", "0", "RSSI"}), Value("-78 dBm"));
    EXPECT_EQ(at(shown, {"GSM", "Neighboring Cells", "1", "RSSI"}), Value("-80 dBm"));
    EXPECT_EQ(at(shown, {"GSM", "Neighboring Cells", "2", "RSSI"}), Value("-112 dBm"));
    EXPECT_EQ(at(shown, {"GSM", "Neighboring Cells", "3", "RSSI"}), Value("-48 dBm"));
    EXPECT_THAT(warnings(), IsEmpty());
}

TEST_F(CellsTest, umts) {
    putModem(umtsAccess);
    setCells({
        {{"cell-type", 3U},
         {"serving", true},
         {"operator-id", "310260"},
         {"lac", "1005"},
         {"ci", "D30156"},
         {"uarfcn", 10700U},
         {"psc", 256U},
         {"rscp", -80.4},
         {"ecio", -6.5},
         {"path-loss", 110U}},
        {{"cell-type", 3U},
         {"serving", false},
         {"uarfcn", 10725U},
         {"psc", 33U},
         {"rscp", -95.5},
         {"ecio", -7.4}},
    });
    follow();
    EXPECT_EQ(source->technology(), kVoxLogChannelTechnology_Ostrel_GSM);
    listen();
    constexpr auto kind = kVoxCellMonitorRadioAccessTechnologyUMTS;
    EXPECT_EQ(cells(), array({
                           cell(kind, kVoxCellMonitorCellTypeServing,
                                {{"kVoxCellMonitorMCC", 310},
                                 {"kVoxCellMonitorMNC", 260},
                                 {"kVoxCellMonitorLAC", 4101},
                                 {"kVoxCellMonitorCellId", 13828438},
                                 {"kVoxCellMonitorUARFCN", 10700},
                                 {"kVoxCellMonitorSCN", 256},
                                 {"kVoxCellMonitorRSCP", -80},
                                 {"kVoxCellMonitorECN0", -7}}),
                           cell(kind, kVoxCellMonitorCellTypeNeighbor,
                                {{"kVoxCellMonitorUARFCN", 10725},
                                 {"kVoxCellMonitorSCN", 33},
                                 {"kVoxCellMonitorRSCP", -96},
                                 {"kVoxCellMonitorECN0", -7}}),
                       }));

    const Value shown = display("Ostrel_GSM");
    EXPECT_EQ(at(shown, {"UMTS", "UMTS RR Info", "Cell ID"}), Value("13828438"));
    EXPECT_EQ(at(shown, {"UMTS", "UMTS RR Info", "UARFCN"}), Value("10700"));
    EXPECT_EQ(at(shown, {"UMTS", "UMTS RR Info", "Scrambling Code"}), Value("256"));
    EXPECT_EQ(at(shown, {"Reselection", "UMTS Set", "0", "UARFCN"}), Value("10725"));
    EXPECT_EQ(at(shown, {"Reselection", "UMTS Set", "0", "Scrambling Code"}), Value("33"));
    EXPECT_EQ(at(shown, {"Reselection", "UMTS Set", "0", "RSCP"}), Value("-96 dBm"));
    EXPECT_EQ(at(shown, {"Reselection", "UMTS Set", "0", "Energy Per Chip"}), Value("-7 dB"));
}

TEST_F(CellsTest, lte) {
    putModem(lteAccess);
    setCells({
        // Another technology's cell does not hide the serving one.
        {{"cell-type", 6U}, {"serving", true}, {"tac", "7"}, {"ci", "123456789"}, {"nrarfcn", 431000U}},
        {{"cell-type", 5U},
         {"serving", true},
         {"operator-id", "00101"},
         {"tac", "1005"},
         {"ci", "1A2D003"},
         {"physical-ci", "1A0"},
         {"earfcn", 1300U}, // band 3: 1200 to 1949
         {"rsrp", -101.0},
         {"rsrq", -9.5},
         {"timing-advance", 5U}},
        {{"cell-type", 5U}, {"serving", false}, {"physical-ci", "7"}, {"earfcn", 6300U}}, // 20: 6150 to 6449
    });
    follow();
    EXPECT_EQ(source->technology(), kVoxLogChannelTechnology_Ostrel_LTE);
    listen();
    constexpr auto kind = kVoxCellMonitorRadioAccessTechnologyLTE;
    EXPECT_EQ(cells(), array({
                           cell(kind, kVoxCellMonitorCellTypeServing,
                                {{"kVoxCellMonitorMCC", 1},
                                 {"kVoxCellMonitorMNC", 1},
                                 {"kVoxCellMonitorTAC", 4101},
                                 {"kVoxCellMonitorCellId", 27447299},
                                 {"kVoxCellMonitorPID", 416},
                                 {"kVoxCellMonitorUARFCN", 1300},
                                 {"kVoxCellMonitorBandInfo", 3}}),
                           cell(kind, kVoxCellMonitorCellTypeNeighbor,
                                {{"kVoxCellMonitorPID", 7},
                                 {"kVoxCellMonitorUARFCN", 6300},
                                 {"kVoxCellMonitorBandInfo", 20}}),
                       }));

    const Value shown = at(display("LTE"), {"Serving Cell", "Serving Cell Info"});
    EXPECT_EQ(shown, Value(std::make_shared<Dictionary>(Dictionary{{"Tracking Area Code", "4101"},
                                                                   {"Cell Identity", "27447299"},
                                                                   {"Physical Cell ID", "416"},
                                                                   {"Freq Band Indicator", "3"},
                                                                   {"UARFCN", "1300"}})));
}

TEST_F(CellsTest, absurdAndMissingMembersAreLeftOut) {
    putModem(umtsAccess);
    const double notANumber = std::numeric_limits<double>::quiet_NaN();
    setCells({
        {{"cell-type", 3U}, {"serving", false}}, // nothing but what is always there
        {{"cell-type", 3U},
         {"serving", false},
         {"operator-id", "12"}, // too short
         {"lac", "10005"},      // 17 bits
         {"ci", "10000000"},    // 29 bits
         {"uarfcn", 16384U},    // one more than there are
         {"psc", 512U},         // one more than there are
         {"rscp", notANumber},
         {"ecio", 0.6}}, // rounded or not, it is above 0
        {{"cell-type", 3U},
         {"serving", false},
         {"operator-id", "00a01"}, // no digits
         {"lac", "0x12"},          // no hexadecimal
         {"ci", "-5"},             //
         {"uarfcn", -1},           // signed, and below 0
         {"psc", "33"},            // text, wanted a number
         {"rscp", -std::numeric_limits<double>::infinity()},
         {"ecio", -7}}, // whole, wanted a real
        {{"cell-type", 3U},
         {"serving", false},
         {"lac", QString(5000, 'A')}, // a huge text
         {"ci", 11183U},              // a number, wanted text
         {"uarfcn", QVariant::fromValue(std::numeric_limits<qulonglong>::max())},
         {"psc", true},
         {"rscp", "-80"},
         {"ecio", QStringList("-7")}},                        // a list
        {{"cell-type", 3U}, {"serving", "yes"}, {"psc", 1U}}, // serving is no boolean
        {{"cell-type", 3U}, {"psc", 2U}},                     // not said to serve or not
        {{"cell-type", "3"}, {"serving", false}, {"psc", 3U}},
        {{"cell-type", 99U}, {"serving", false}, {"psc", 4U}}, // a type of the future
        {{"serving", false}, {"psc", 5U}},
        {},
        {{"cell-type", 3U},
         {"serving", false},
         {"lac", ""},
         {"ci", " 1"},
         {"psc", 511U},
         {"rscp", -150.0},
         {"ecio", 0.0}},
    });
    follow();
    listen();
    constexpr auto kind = kVoxCellMonitorRadioAccessTechnologyUMTS;
    constexpr auto neighbour = kVoxCellMonitorCellTypeNeighbor;
    EXPECT_EQ(cells(), array({cell(kind, neighbour, {}), cell(kind, neighbour, {}), cell(kind, neighbour, {}),
                              cell(kind, neighbour, {}),
                              cell(kind, neighbour,
                                   {{"kVoxCellMonitorSCN", 511},
                                    {"kVoxCellMonitorRSCP", -150},
                                    {"kVoxCellMonitorECN0", 0}})}));
    // Left out of the cells, they stay in the list that the display shows.
    EXPECT_EQ(at(display("Ostrel_GSM"), {"Reselection", "UMTS Set", "4", "RSCP"}), Value("-150 dBm"));
}

TEST_F(CellsTest, anAnswerOfAnotherTypeIsNoCell) {
    putModem(lteAccess);
    follow();
    listen();
    const QVariantList absurd[] = {
        {},
        {QString("cells")},
        {QVariant::fromValue(QStringList{"a", "b"})},
        {QVariantMap{{"cell-type", 5U}}},
        {5U},
    };
    for (const QVariantList& each : absurd) {
        mock.answers["GetCellInfo"] = {each, {}, {}};
        const std::size_t before = mock.count("GetCellInfo");
        ASSERT_TRUE(passes([&] { return mock.count("GetCellInfo") >= before + 2; }));
    }
    EXPECT_EQ(count(cellCode), 0U);
    setCells({{{"cell-type", 5U}, {"serving", true}, {"tac", "7"}}});
    ASSERT_TRUE(passes([&] { return count(cellCode) > 0; }));
    EXPECT_EQ(at(latest(cellCode), {"0", "kVoxCellMonitorTAC"}), Value(7));
}

TEST_F(CellsTest, manyCellsAreCut) {
    putModem(lteAccess);
    CellList many;
    for (uint i = 0; i < 5000; ++i)
        many.push_back({{"cell-type", 5U}, {"serving", i == 0}, {"earfcn", i}});
    setCells(many);
    follow();
    listen();
    EXPECT_EQ(cells().asArray()->size(), 64U);
}

TEST_F(CellsTest, theServingCellsLevelsComeFromTheSignalWhereItHasNone) {
    InterfaceMap modem = testModem(umtsAccess);
    modem[Mock::signal] = {{"Rate", 5U}, {"Umts", QVariantMap{{"rscp", -88.6}, {"ecio", -9.0}}}};
    mock.put(Mock::modemPath(0), modem);
    setCells({{{"cell-type", 3U}, {"serving", true}, {"psc", 7U}, {"ecio", -3.0}},
              {{"cell-type", 3U}, {"serving", false}, {"psc", 8U}}});
    follow();
    listen();
    constexpr auto kind = kVoxCellMonitorRadioAccessTechnologyUMTS;
    EXPECT_EQ(
        cells(),
        array({cell(kind, kVoxCellMonitorCellTypeServing,
                    {{"kVoxCellMonitorSCN", 7}, {"kVoxCellMonitorECN0", -3}, {"kVoxCellMonitorRSCP", -89}}),
               cell(kind, kVoxCellMonitorCellTypeNeighbor, {{"kVoxCellMonitorSCN", 8}})}));
}

} // namespace
} // namespace velmora
