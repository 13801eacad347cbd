// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/TelephonyService.h"
#include "Tests/LogGenerator/DecoderFixture.h"
#include "Tests/Support/Hex.h"

namespace velmora {

namespace {

class LTEGenerator : public DecoderFixture {
protected:
    LTEGenerator() : DecoderFixture("LTE", kVoxLogChannelTechnology_Ostrel_LTE) {}
};

TEST_F(LTEGenerator, EachSectionWritesIntoItsOwnNode) {
    update(record(0xB179, "EE EE EE EE   14 05   F7 01   01 00   A0 00   50 00   01 01"
                          "02 00 A0 00 50 00   03 00"));
    EXPECT_EQ(node("Connected Mode", "Connected mode LTE Intra-frequency Measurement"),
              "{E-ARFCN '1300', Serving Physical Cell ID '503', Subframe Number '1', "
              "Serving Filtered RSRP '-100.00 dBm', Serving Filtered RSRQ '-10.00 dB'}");
    EXPECT_EQ(node("Connected Mode", "Measured Neighbor Cells"),
              "[{Physical Cell ID '2', Filtered RSRP '-100.00 dBm', Filtered RSRQ '-10.00 dB'}]");
    EXPECT_EQ(node("Connected Mode", "Detected Cells"), "[{Physical Cell ID '3'}]");

    update(record(0xB186, "01 EE   14 05   F7 01   01 00   06 00   07 00"));
    EXPECT_EQ(node("Reselection", "Reselection Candidates"),
              "{Version '1', Serving EARFCN '1300', Serving Cell ID '503'}");
    EXPECT_EQ(node("Reselection", "Reselection Candidates List"),
              "[{Candidate Priority '6', Candidate RAT Type '?\?'}]");

    update(recordWith(0xB180, 41, {{13, 2}}));
    EXPECT_EQ(node("Idle Mode Neighbors", "Neighbor Measurements"),
              "{Version '2', E-ARFCN '0', Qrxlevmin '-140 dBm'}");
    EXPECT_NE(node("Idle Mode Neighbors", "Neighbor Cells List"), "[]");
}

} // namespace

} // namespace velmora
