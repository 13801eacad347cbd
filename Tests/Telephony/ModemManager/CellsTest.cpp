// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/ModemManager/CellsFixture.h"

#include <limits>

/// Cells of every type, from the bus to the message.

namespace velmora {
namespace {

using CellsTest = CellsFixture;

TEST_F(CellsTest, gsm) {
    putModem(gsmAccess);
    setCells({
        {{"cell-type", 2U}, {"serving", false}, {"arfcn", 512U}, {"rx-level", 0U}},  // -111 dBm
        {{"cell-type", 2U}, {"serving", false}, {"arfcn", 515U}, {"rx-level", 63U}}, // -48 dBm
        {{"cell-type", 2U},
         {"serving", true},
         {"operator-id", "21034"},
         {"lac", "84CD"},
         {"ci", "2BAF"},
         {"arfcn", 62U},
         {"base-station-id", "3F"},
         {"timing-advance", 3U},
         {"rx-level", 40U}}, // -111 + 40 = -71 dBm
    });
    follow();
    listen();
    constexpr auto kind = kVoxCellMonitorRadioAccessTechnologyGSM;
    EXPECT_EQ(cells(), array({
                           serving(kind, {{"kVoxCellMonitorMCC", 210},
                                          {"kVoxCellMonitorMNC", 34},
                                          {"kVoxCellMonitorMNCDigits", 2},
                                          {"kVoxCellMonitorLAC", 33997},
                                          {"kVoxCellMonitorCellId", 11183},
                                          {"kVoxCellMonitorARFCN", 62},
                                          {"kVoxCellMonitorBSIC", 63},
                                          {"kVoxCellMonitorTimingAdvance", 3},
                                          {"kVoxCellMonitorRSSI", -71.0}}),
                           neighbor(kind, {{"kVoxCellMonitorARFCN", 515}, {"kVoxCellMonitorRSSI", -48.0}}),
                           neighbor(kind, {{"kVoxCellMonitorARFCN", 512}, {"kVoxCellMonitorRSSI", -111.0}}),
                       }));
    EXPECT_EQ(inCells("kVoxModemNeighborReport"), number(ModemCellReport::Reported));
    EXPECT_THAT(warnings(), ::testing::IsEmpty());
}

TEST_F(CellsTest, umts) {
    putModem(umtsAccess);
    setCells({
        {{"cell-type", 3U},
         {"serving", true},
         {"operator-id", "310026"},
         {"lac", "1005"},
         {"ci", "D30156"},
         {"uarfcn", 10700U},
         {"frequency-fdd-dl", 2140000U}, // what the channel number says: 10700 / 5 MHz
         {"psc", 256U},
         {"rscp", -80.4},
         {"ecio", -6.5},
         {"path-loss", 110U}},
        {{"cell-type", 3U}, {"serving", false}, {"psc", 33U}, {"frequency-fdd-dl", 10725U}},
        {{"cell-type", 3U}, {"serving", false}, {"psc", 34U}, {"frequency-tdd", 1900000U}},
        {{"cell-type", 3U},
         {"serving", false},
         {"psc", 35U},
         {"frequency-fdd-dl", 2112400U},
         {"frequency-fdd-ul", 1922400U},
         {"rscp", -95.5}},
    });
    follow();
    listen();
    constexpr auto kind = kVoxCellMonitorRadioAccessTechnologyUMTS;
    EXPECT_EQ(cells(),
              array({
                  serving(kind, {{"kVoxCellMonitorMCC", 310},
                                 {"kVoxCellMonitorMNC", 26},
                                 {"kVoxCellMonitorMNCDigits", 3},
                                 {"kVoxCellMonitorLAC", 4101},
                                 {"kVoxCellMonitorCellId", 13828438},
                                 {"kVoxCellMonitorUARFCN", 10700},
                                 {"kVoxCellMonitorSCN", 256},
                                 {"kVoxCellMonitorRSCP", -80.4},
                                 {"kVoxCellMonitorECN0", -6.5},
                                 {"kVoxCellMonitorPathLoss", 110.0}}),
                  neighbor(kind, {{"kVoxCellMonitorSCN", 35},
                                  {"kVoxCellMonitorDownlinkFrequency", 2112400},
                                  {"kVoxCellMonitorUplinkFrequency", 1922400},
                                  {"kVoxCellMonitorRSCP", -95.5}}),
                  neighbor(kind, {{"kVoxCellMonitorSCN", 33}, {"kVoxCellMonitorUARFCN", 10725}}),
                  neighbor(kind, {{"kVoxCellMonitorSCN", 34}, {"kVoxCellMonitorDownlinkFrequency", 1900000}}),
              }));
}

TEST_F(CellsTest, tdscdma) {
    putModem(0);
    setCells({{{"cell-type", 4U},
               {"serving", true},
               {"operator-id", "46000"},
               {"lac", "1005"},
               {"ci", "D30156"},
               {"uarfcn", 10055U},
               {"cell-parameter-id", 127U},
               {"timing-advance", 4U},
               {"rscp", -80.0},
               {"path-loss", 99U}},
              {{"cell-type", 4U}, {"serving", false}, {"uarfcn", 10063U}, {"cell-parameter-id", 128U}}});
    follow();
    listen();
    constexpr auto kind = kVoxCellMonitorRadioAccessTechnologyUTRAN;
    EXPECT_EQ(cells(), array({
                           serving(kind, {{"kVoxCellMonitorMCC", 460},
                                          {"kVoxCellMonitorMNC", 0},
                                          {"kVoxCellMonitorMNCDigits", 2},
                                          {"kVoxCellMonitorLAC", 4101},
                                          {"kVoxCellMonitorCellId", 13828438},
                                          {"kVoxCellMonitorUARFCN", 10055},
                                          {"kVoxCellMonitorSCN", 127},
                                          {"kVoxCellMonitorRSCP", -80.0},
                                          {"kVoxCellMonitorPathLoss", 99.0}}),
                           neighbor(kind, {{"kVoxCellMonitorUARFCN", 10063}}),
                       }));
}

TEST_F(CellsTest, lte) {
    putModem(lteAccess);
    setCells({
        {{"cell-type", 5U},
         {"serving", true},
         {"operator-id", "00101"},
         {"tac", "1005"},
         {"ci", "1A2D003"},
         {"physical-ci", "1A0"},
         {"earfcn", 1300U},
         {"rsrp", -101.0},
         {"rsrq", -9.5},
         {"timing-advance", 5U}},
        {{"cell-type", 5U}, {"serving", false}, {"physical-ci", "8"}, {"earfcn", 6300U}, {"rsrp", -110.5}},
        {{"cell-type", 5U},
         {"serving", false},
         {"physical-ci", "7"},
         {"earfcn", 66000U},
         {"rsrp", -90.0},
         {"rsrq", -12.0}},
    });
    follow();
    listen();
    constexpr auto kind = kVoxCellMonitorRadioAccessTechnologyLTE;
    EXPECT_EQ(cells(), array({
                           serving(kind, {{"kVoxCellMonitorMCC", 1},
                                          {"kVoxCellMonitorMNC", 1},
                                          {"kVoxCellMonitorMNCDigits", 2},
                                          {"kVoxCellMonitorTAC", 4101},
                                          {"kVoxCellMonitorCellId", 27447299},
                                          {"kVoxCellMonitorPID", 416},
                                          {"kVoxCellMonitorEARFCN", 1300},
                                          {"kVoxCellMonitorRSRP", -101.0},
                                          {"kVoxCellMonitorRSRQ", -9.5},
                                          {"kVoxCellMonitorTimingAdvance", 5}}),
                           neighbor(kind, {{"kVoxCellMonitorPID", 7},
                                           {"kVoxCellMonitorEARFCN", 66000},
                                           {"kVoxCellMonitorRSRP", -90.0},
                                           {"kVoxCellMonitorRSRQ", -12.0}}),
                           neighbor(kind, {{"kVoxCellMonitorPID", 8},
                                           {"kVoxCellMonitorEARFCN", 6300},
                                           {"kVoxCellMonitorRSRP", -110.5}}),
                       }));
}

TEST_F(CellsTest, nr) {
    putModem(nrAccess);
    setCells({{{"cell-type", 6U},
               {"serving", true},
               {"operator-id", "310260"},
               {"tac", "10005"},       // 65541
               {"ci", "FFFFFFFFE"},    // 2^36 - 2
               {"physical-ci", "3EF"}, // 1007, the last
               {"nrarfcn", 3279165U},  // the last
               {"rsrp", -88.5},
               {"rsrq", -10.5},
               {"sinr", 21.5},
               {"timing-advance", 3846U}},
              {{"cell-type", 6U},
               {"serving", false},
               {"physical-ci", "3F0"},
               {"nrarfcn", 431000U},
               {"rsrp", -100.0}}});
    follow();
    listen();
    constexpr auto kind = kVoxCellMonitorRadioAccessTechnologyNR;
    EXPECT_EQ(cells(),
              array({
                  serving(kind, {{"kVoxCellMonitorMCC", 310},
                                 {"kVoxCellMonitorMNC", 260},
                                 {"kVoxCellMonitorMNCDigits", 3},
                                 {"kVoxCellMonitorTAC", 65541},
                                 {"kVoxCellMonitorCellId", 68719476734},
                                 {"kVoxCellMonitorPID", 1007},
                                 {"kVoxCellMonitorNRARFCN", 3279165},
                                 {"kVoxCellMonitorRSRP", -88.5},
                                 {"kVoxCellMonitorRSRQ", -10.5},
                                 {"kVoxCellMonitorSINR", 21.5},
                                 {"kVoxCellMonitorTimingAdvance", 3846}}),
                  neighbor(kind, {{"kVoxCellMonitorNRARFCN", 431000}, {"kVoxCellMonitorRSRP", -100.0}}),
              }));
}

TEST_F(CellsTest, cdma) {
    putModem(1U << 10, {{"Rate", 5U}, {"Cdma", QVariantMap{{"rssi", -80.0}, {"ecio", -5.5}}}});
    setCells({{{"cell-type", 1U},
               {"serving", true},
               {"sid", "7FFF"},
               {"nid", "FFFE"},
               {"base-station-id", "3F"},
               {"ref-pn", "1FF"},
               {"pilot-strength", 20U}},
              {{"cell-type", 1U}, {"serving", false}, {"ref-pn", "200"}, {"nid", "FFFF"}}});
    follow();
    listen();
    constexpr auto kind = kVoxCellMonitorRadioAccessTechnologyCDMA;
    EXPECT_EQ(cells(), array({
                           serving(kind, {{"kVoxCellMonitorSID", 32767},
                                          {"kVoxCellMonitorNID", 65534},
                                          {"kVoxCellMonitorBaseStation", 63},
                                          {"kVoxCellMonitorPN", 511},
                                          {"kVoxCellMonitorRSSI", -80.0},
                                          {"kVoxCellMonitorPilotStrength", -5.5}}),
                           neighbor(kind, {}),
                       }));
}

TEST_F(CellsTest, unknownNumbersAreLeftOut) {
    putModem(lteAccess);
    const double notANumber = std::numeric_limits<double>::quiet_NaN();
    setCells({
        {{"cell-type", 5U},
         {"serving", true},
         {"operator-id", ""},
         {"tac", "FFFE"},
         {"ci", "FFFFFFF"},
         {"physical-ci", "FFFF"},
         {"earfcn", unknownNumber},
         {"rsrp", notANumber},
         {"rsrq", 32767.0},
         {"timing-advance", 0xFFFFFFFFU}},
        {{"cell-type", 6U},
         {"serving", true},
         {"tac", "0"},
         {"ci", "FFFFFFFFF"},
         {"physical-ci", "FFFF"},
         {"nrarfcn", 0U},
         {"rsrp", -9999.0},
         {"rsrq", -9999.0},
         {"sinr", 3276.7}},
        {{"cell-type", 2U},
         {"serving", false},
         {"lac", "0"},
         {"arfcn", unknownNumber},
         {"base-station-id", "FF"},
         {"rx-level", 99U}},
        {{"cell-type", 3U},
         {"serving", false},
         {"lac", "FFFF"},
         {"uarfcn", 0U},
         {"psc", unknownNumber},
         {"rscp", -std::numeric_limits<double>::infinity()},
         {"path-loss", 0U}},
    });
    follow();
    listen();
    EXPECT_EQ(cells(), array({serving(kVoxCellMonitorRadioAccessTechnologyLTE, {}),
                              serving(kVoxCellMonitorRadioAccessTechnologyNR, {}),
                              neighbor(kVoxCellMonitorRadioAccessTechnologyGSM, {}),
                              neighbor(kVoxCellMonitorRadioAccessTechnologyUMTS, {})}));
}

TEST_F(CellsTest, membersOfOtherTypesAreLeftOut) {
    putModem(umtsAccess);
    setCells({
        {{"cell-type", 3U},
         {"serving", false},
         {"operator-id", "12"}, // too short
         {"lac", "10005"},      // 17 bits
         {"ci", "10000000"},    // 29 bits
         {"uarfcn", 16384U},    // one more than there are
         {"psc", 512U},         // one more than there are
         {"ecio", 0.6}},
        {{"cell-type", 3U},
         {"serving", false},
         {"operator-id", "00a01"}, // no digits
         {"lac", "0x12"},          // no hexadecimal
         {"ci", "-5"},             //
         {"uarfcn", -1},           // signed, and below 0
         {"psc", "33"},            // text, wanted a number
         {"ecio", -7}},            // whole, wanted a real
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
        {{"cell-type", 0U}, {"serving", false}, {"psc", 4U}},  // an unknown one
        {{"serving", false}, {"psc", 5U}},
        {},
    });
    follow();
    listen();
    constexpr auto kind = kVoxCellMonitorRadioAccessTechnologyUMTS;
    EXPECT_EQ(cells(), array({neighbor(kind, {}), neighbor(kind, {}), neighbor(kind, {})}));
}

TEST_F(CellsTest, anAnswerOfAnotherTypeHasNoCells) {
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
    EXPECT_EQ(cells(), array({}));
    setCells({{{"cell-type", 5U}, {"serving", true}, {"tac", "7"}}});
    EXPECT_TRUE(becomes(LiveModemCode::cells, {"kVoxCellMonitorCells", "0", "kVoxCellMonitorTAC"}, 7));
}

} // namespace
} // namespace velmora
