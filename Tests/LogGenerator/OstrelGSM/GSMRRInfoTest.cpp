// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/GSM/GSMRRInfo.h"

#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

namespace velmora {

namespace {

const auto make = inDictionary<GSMRRInfo>;

TEST(GSMRRInfo, ShowsEveryState) {
    const Data states = recordWith(0x512C, 17);
    expectEnumeration(make, states, 13, "RR State",
                      {{0, "RR_INACTIVE"},
                       {1, "RR_GOING_ACTIVE"},
                       {2, "RR_GOING_INACTIVE"},
                       {3, "RR_CELL_SELECTION"},
                       {4, "RR_PLMN_LIST_CONSTRUCTION"},
                       {5, "RR_IDLE"},
                       {6, "RR_CELL_RESELECTION"},
                       {7, "RR_CONNECTION_PENDING"},
                       {8, "RR_CHOOSE_CELL"},
                       {9, "RR_DATA_TRANSFER"},
                       {10, "RR_NO_CHANNELS"},
                       {11, "RR_CONNECTION_RELEASE"},
                       {12, "RR_EARLY_CAMPED_WAIT_FOR_SI"},
                       {13, "RR_W2G_INTERRAT_HANDOVER_ PROGRESS"}, // with its blank, as in 19 and 21
                       {14, "RR_W2G_INTERRAT_RESELECTION_PROGRESS"},
                       {15, "RR_WAIT_FOR_EARLY_PSCAN"},
                       {16, "GRR51"},
                       {17, "GRR52"},
                       {18, "RR_G2W_INTERRAT_RESELECTION_PROGRESS"},
                       {19, "RR_G2W_INTERRAT_HANDOVER_ PROGRESS"},
                       {20, "RR_CELL_REEST"},
                       {21, "RR_W2G_INTERRAT_CC_ORDER_ PROGRESS"}},
                      "Unknown");
    expectFlag(make, states, 16, "RR Mode", "Data", "Voice");
}

TEST(GSMRRInfo, WritesTheStateInOrder) {
    expectPrefixes(make, record(0x512C, "05 C8 FF 00 99"), 17, "GSMRRInfo",
                   "{RR State 'RR_IDLE', RR Sub State '200', RR Status '255', RR Mode 'Voice'}");
}

TEST(GSMRRInfo, ShowsTheServingCellsMeasurements) {
    const Data full = record(0x5137, R"(
        00 00
        AB                              # level: 171
        FE FF 01 00                     # quality, full: 131070, all 32 bits
        10 27 FF FF                     # quality, sub: -55536, signed
        00 00 00 00
        00 99
    )");
    ASSERT_EQ(full.size(), 30u);
    expectPrefixes(make, full, 29, "GSMRRInfo",
                   "{Serving Rx Level '171', Rx Quality Full '131070', Rx Quality Sub '-55536'}");
}

TEST(GSMRRInfo, ShowsDTX) {
    expectFlag(make, recordWith(0x5072, 20), 19, "DTX Used", "ON", "OFF");
    expectPrefixes(make, recordWith(0x5072, 21, {{19, 1}}), 20, "GSMRRInfo", "{DTX Used 'ON'}");
}

TEST(GSMRRInfo, ShowsDRX) {
    expectPrefixes(make, recordWith(0x51F6, 25, {{16, 240}}), 24, "GSMRRInfo", "{DRX Used '240 sec'}");
}

} // namespace

} // namespace velmora
