// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/Ostrel_GSMLogGenerator.h"

#include "Platform/TelephonyService.h"
#include "Tests/LogGenerator/DecoderFixture.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

namespace velmora {

namespace {

class Ostrel_GSMGenerator : public DecoderFixture {
protected:
    Ostrel_GSMGenerator() : DecoderFixture("Ostrel_GSM", kVoxLogChannelTechnology_Ostrel_GSM) {}
};

TEST_F(Ostrel_GSMGenerator, IsTheTechnologysDecoder) {
    EXPECT_NE(dynamic_cast<Ostrel_GSMLogGenerator*>(generator.get()), nullptr);
    // The base class, which is at the same address, says the same once more.
    expectFirstAndLastLines<Ostrel_GSMLogGenerator>("Creating Ostrel_GSMLogGenerator object",
                                                    {"Ostrel_GSMLogGenerator", "Ostrel_GSMLogGenerator"});
}

TEST_F(Ostrel_GSMGenerator, AsksForTheCodesOfItsSections) {
    expectStartCommand({16389, 16433, 16662, 16677, 16679, 16727, 16762, 16929, 20594,
                        20598, 20780, 20788, 20791, 20980, 20981, 20982, 20984, 20987,
                        20989, 20991, 28976, 28977, 28978, 28981, 29008});
}

TEST_F(Ostrel_GSMGenerator, ARecordReachesItsSectionsInOrder) {
    EXPECT_EQ(update(recordWith(0x417A, 13)),
              traces({"ActiveSet", "DetectedSet", "MonitoredSet", "VirtualActiveSet"}));
    EXPECT_EQ(update(recordWith(0x4005, 13)), traces({"GSMSet", "UMTSSet"}));
    EXPECT_EQ(update(recordWith(0x5137, 13)),
              traces({"GPRSInformation", "GSMServingCell", "NeighboringCells", "GSMRRInfo"}));
    EXPECT_EQ(update(recordWith(0x51F6, 13)), traces({"GPRSInformation", "GSMRRInfo"}));
    // "Process CO" writes the word of "Process CS".
    EXPECT_EQ(update(recordWith(0x7131, 13)), traces({"ProcessCS", "ProcessCS"}));
    EXPECT_EQ(update(recordWith(0x7132, 13)),
              traces({"ProcessPS", "ProcessCS", "Serving PLMN", "ProcessCS"}));
    EXPECT_EQ(update(recordWith(0x7135, 13)), traces({"GPRSInformation", "Serving PLMN"}));
    EXPECT_EQ(update(cellInfo({})),
              traces({"GSMServingCell", "NeighboringCells", "Serving PLMN", "UMTSSet", "UMTSRRInfo"}));
    EXPECT_EQ(update(recordWith(0x1234, 13)), traces({}));
    // The extra stream's code 0x5137 is another one.
    EXPECT_EQ(update(record(0x5137, "", 0xFF)), traces({}));
}

TEST_F(Ostrel_GSMGenerator, EachSectionWritesIntoItsOwnNode) {
    update(record(0x7132, "02 03 00"));
    EXPECT_EQ(node("Registration", "Process PS"), "{MM Service State 'REG_STATE_REGISTERING'}");
    EXPECT_EQ(node("Registration", "Process CO"), "{MM Service State 'REG_STATE_REGISTERING'}");
    EXPECT_EQ(node("Registration", "Process CS"), "{MM Service State 'REG_STATE_REGISTERING'}");
    EXPECT_EQ(node("Registration", "Serving PLMN"), "{PLMN Sel Mod 'LIMITED_ROUTINE_ACQ'}");

    update(record(0x5137, "00 00 55 2A 00 00 00 2B 00 00 00 00 00 01 00 01 "
                          "05 00 06 07 00 00 00 00 00 00 00 00 00 00"));
    EXPECT_EQ(node("GSM", "GSM Serving Cell"), "{RSSI '85 dBm', C1 Value '42', C2 Value '43'}");
    EXPECT_EQ(node("GSM", "GSM RR Info"),
              "{Serving Rx Level '85', Rx Quality Full '42', Rx Quality Sub '43'}");
    EXPECT_EQ(node("GSM", "Neighboring Cells"), "[{ARFCN '5', RSSI '6', C1 Value '7'}]");
    EXPECT_EQ(node("Packet Data", "GPRS Information"), "{Cell Reselect Hysteresis 'Applied'}");
}

TEST_F(Ostrel_GSMGenerator, APrefixedRecordIsDecodedAlike) {
    update(joined(hex("81 00"), record(0x4125, "04")));
    EXPECT_EQ(node("UMTS", "UMTS RR Info"), "{RRC State 'CELL_PCH'}");
}

} // namespace

} // namespace velmora
