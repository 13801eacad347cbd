// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/Modem/ModemFixture.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

class ModemNeighborCellsTest : public ModemFixture {};

TEST_F(ModemNeighborCellsTest, OfAnyTechnologyByFallingLevel) {
    EXPECT_EQ(
        after("Neighbor Cells",
              {cellMessage({
                  cell("CDMA", "Neighbor", {{"PN", 7}, {"PilotStrength", -9}}),
                  cell("LTE", "Neighbor", {{"EARFCN", 1300}, {"PID", 1}, {"RSRP", -110}, {"RSRQ", -14}}),
                  cell("LTE", "Serving", {{"PID", 99}}),
                  cell("GSM", "Neighbor", {{"ARFCN", 975}, {"BSIC", 8}, {"RSSI", -85}}),
                  cell("NR", "Neighbor", {{"PID", 3}, {"RSRP", -110}, {"SINR", 1}}),
                  cell("UMTS", "Neighbor", {{"SCN", 4}, {"RSCP", -90}, {"ECN0", -12}}),
              })}),
        "{State '5 cells', Cells ["
        "{Radio Technology 'GSM', BSIC '8', NCC-BCC '1-0', ARFCN '975', Bands 'E-GSM 900', "
        "Downlink '925.200 MHz', Uplink '880.200 MHz', RXLEV '-85.0 dBm'}, "
        "{Radio Technology 'UMTS', PSC '4', RSCP '-90.0 dBm', Ec-No '-12.0 dB'}, "
        "{Radio Technology 'LTE', PCI '1', EARFCN '1300', Bands '3', Downlink '1815.000 MHz', "
        "Uplink '1720.000 MHz', RSRP '-110.0 dBm', RSRQ '-14.0 dB'}, "
        "{Radio Technology 'NR', PCI '3', RSRP '-110.0 dBm', SINR '1.0 dB'}, "
        "{Radio Technology 'CDMA2000', PN Offset '7', Pilot Strength '-9.0 dB'}]}");
}

TEST_F(ModemNeighborCellsTest, ReportedAndNone) {
    EXPECT_EQ(after("Neighbor Cells", {cellMessage({})}), "{State 'None', Cells []}");
}

TEST_F(ModemNeighborCellsTest, NotReportedByThisModem) {
    EXPECT_EQ(after("Neighbor Cells", {modemMessage(LiveModemCode::cells, {{"kVoxModemState", 8},
                                                                           {"kVoxModemCellReport", 0},
                                                                           {"kVoxModemNeighborReport", 1}})}),
              "{State 'Not reported by this modem', Cells []}");
}

TEST_F(ModemNeighborCellsTest, WhatWasLeftOutIsSaid) {
    EXPECT_EQ(
        after("Neighbor Cells",
              {modemMessage(LiveModemCode::cells,
                            {{"kVoxModemCellsLeftOut", 12},
                             {"kVoxCellMonitorCells", list({cell("GSM", "Neighbor", {{"BSIC", 1}})})}})}),
        "{State '1 cell', Cells Left Out '12', Cells [{Radio Technology 'GSM', BSIC '1', NCC-BCC '0-1'}]}");
}

} // namespace
} // namespace velmora
