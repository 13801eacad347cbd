// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/ModemManager/CellsFixture.h"

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

} // namespace
} // namespace velmora
