// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/TelephonyService.h"
#include "Tests/LogGenerator/DecoderFixture.h"
#include "Tests/Support/Hex.h"

namespace velmora {

namespace {

class Ostrel_GSMGenerator : public DecoderFixture {
protected:
    Ostrel_GSMGenerator() : DecoderFixture("Ostrel_GSM", kVoxLogChannelTechnology_Ostrel_GSM) {}
};

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

} // namespace

} // namespace velmora
