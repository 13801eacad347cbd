// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LTE/LTELogGenerator.h"

#include "Platform/TelephonyService.h"
#include "Tests/LogGenerator/DecoderFixture.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

namespace velmora {

namespace {

class LTEGenerator : public DecoderFixture {
protected:
    LTEGenerator() : DecoderFixture("LTE", kVoxLogChannelTechnology_Ostrel_LTE) {}
};

TEST_F(LTEGenerator, IsTheTechnologysDecoder) {
    EXPECT_NE(dynamic_cast<LTELogGenerator*>(generator.get()), nullptr);
    // The base class, which is at the same address, has one wording for every technology.
    expectFirstAndLastLines<LTELogGenerator>("Creating LTELogGenerator object",
                                             {"LTELogGenerator", "Ostrel_GSMLogGenerator"});
}

TEST_F(LTEGenerator, AsksForTheCodesOfItsSections) {
    expectStartCommand({45249, 45250, 45433, 45439, 45440, 45446});
}

TEST_F(LTEGenerator, ARecordReachesItsSectionsInOrder) {
    EXPECT_EQ(update(recordWith(0xB0C1, 13)), traces({"LTE Serving Cell Info"}));
    EXPECT_EQ(update(recordWith(0xB0C2, 13)), traces({"LTE Serving Cell Info"}));
    EXPECT_EQ(update(recordWith(0xB179, 13)), traces({"Connected mode LTE Intra-frequency Measurement",
                                                      "Measured Neighbor Cells", "Detected Cells"}));
    EXPECT_EQ(update(recordWith(0xB17F, 13)), traces({"Serving Cell Measurements"}));
    EXPECT_EQ(update(recordWith(0xB180, 13)), traces({"Neighbor Measurements", "Neighbor Cells List"}));
    EXPECT_EQ(update(recordWith(0xB186, 13)),
              traces({"Reselection Candidates", "Reselection Candidates List"}));
    EXPECT_EQ(update(cellInfo({})), traces({"LTE Serving Cell Info"}));
    EXPECT_EQ(update(extraRecord(0, makeDictionary())), traces({"SimInfo"}));
    EXPECT_EQ(update(extraRecord(2, makeArray())), traces({"PDPContextList"}));
    EXPECT_EQ(update(recordWith(0x1234, 13)), traces({}));
    // The extra stream's code 0xB179 is another one.
    EXPECT_EQ(update(record(0xB179, "", 0xFF)), traces({}));
}

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

TEST_F(LTEGenerator, APrefixedRecordIsDecodedAlike) {
    update(joined(hex("81 00"), recordWith(0xB0C1, 22, {{20, 2}})));
    EXPECT_EQ(node("Serving Cell", "Serving Cell Info"), "{Num Tx Antennas '2'}");
}

} // namespace

} // namespace velmora
