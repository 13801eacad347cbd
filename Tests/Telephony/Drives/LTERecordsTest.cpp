// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/LTE/LTERecords.h"

#include "Telephony/Drives/ServiceRecords.h"
#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

#include <string>

namespace velmora {
namespace {

using namespace records;

const LTECell cellA{0, 503, 0x1A00001, {{1, 1}, 7101, 1}};
const LTECell cellB{0, 300, 0x1A00102, {{1, 2}, 8201, 7}};

TEST(LTERecords, servingCellIsAsDocumented) {
    EXPECT_EQ(lteServingCell(cellA).message(zeroHour()), record(0xB0C2, R"(
        02
        F7 01                   # cell 503
        14 05                   # downlink 1300
        64 4B                   # uplink 19300
        64 64                   # 100 resource blocks either way
        01 00 A0 01             # identity
        BD 1B                   # tracking area 7101
        03 00 00 00             # band
        01 00   02   01 00      # 001, two digits, 01
        00
    )"));
    EXPECT_EQ(lteAntennas(cellA, 4).message(zeroHour()),
              record(0xB0C1, "02   F7 01   14 05   00 00   04 // antennas\n 64"));
}

TEST(LTERecords, intraFrequencyIsAsDocumented) {
    const LTEMeasurement serving{cellA, -100, -10, -65};
    const LTEMeasurement neighbour{cellB, -99.75, -9.875, -65};
    EXPECT_EQ(lteIntraFrequency(serving, 999, {neighbour}, {neighbour, serving}).message(zeroHour()),
              record(0xB179, R"(
        03 00 00 00
        14 05                   # 1300
        F7 01                   # cell 503
        E7 03                   # subframe
        A0 00                   # (-100 + 140) * 4
        50 00                   # (-10 + 20) * 8
        01 02                   # neighbours, detected cells
        2C 01   A1 00   51 00   # cell 300
        2C 01   F7 01
    )"));
}

TEST(LTERecords, idleMeasurementIsPacked) {
    LTEIdleMeasurement measurement;
    measurement.now = {cellA, -99.5, -9.75, -65};
    measurement.average = {cellA, -99.25, -24.25, 0};
    measurement.cyclesBelow = 3;
    measurement.limitedPower = true;
    measurement.rulesUpdated = true;
    measurement.rules = 5;
    EXPECT_EQ(lteIdleMeasurement(measurement).message(zeroHour()), record(0xB17F, R"(
        01 00 00 00
        14 05                   # 1300
        F7 0D                   # cell 0x1F7, priority 6 << 1
        A2 46 45 2F             # RSRP 162, 163 << 1; RSRQ 81 << 2 from byte 23 on, 23 << 1
        96                      # RSSI 150
        94 5A 0D                # Qrxlevmin 10 << 1; P_Max 53 << 7; maximum power 53 << 6 from byte 27 on
        B2 E1 22                # Srxlev 50; cycles 3 << 7; S intra 23 << 5; S non-intra 4 << 3
        16                      # updated 1 << 1; rules 5 << 2
    )"));
    measurement.limitedPower = false;
    measurement.searchesAlways = true;
    const Data absent = lteIdleMeasurement(measurement).message(zeroHour());
    EXPECT_EQ(Data::copyOf(absent.bytes().subspan(26, 2)), hex("14 60")) << "64 << 7";
    EXPECT_EQ(absent.from(31), hex("02 17")) << "32 << 3";
}

TEST(LTERecords, levelsOutOfRangeAreCut) {
    LTEIdleMeasurement measurement;
    measurement.now = {cellA, -200, -60, 200};
    measurement.average = {cellA, 0, 10, 0};
    const Data cut = lteIdleMeasurement(measurement).message(zeroHour());
    // RSRP 0 and 511 << 1, RSRQ 0 << 2 and 127 << 1, RSSI 511; bit 0 of byte 26 with Qrxlevmin 10 << 1.
    EXPECT_EQ(Data::copyOf(cut.bytes().subspan(21, 6)), hex("00 FE 03 FE FF 15"));
    EXPECT_EQ(cut.bytes()[29], 0) << "Srxlev";
}

TEST(LTERecords, neighboursArePacked) {
    LTENeighbour cell;
    cell.now = {cellB, -106, -20, -40.5};
    cell.average = {cellB, -105, -19.5, 0};
    cell.frequencyOffset = 65534;
    cell.frameOffset = 1234;
    cell.sampleOffset = 149121;
    EXPECT_EQ(lteNeighbours(lteCarriers[0], {cell}).message(zeroHour()), record(0xB180, R"(
        01 00 00 00
        14 05                   # 1300
        0A 00                   # Qrxlevmin 10; one cell, as 0 << 6
        2C 8F 89 00             # cell 0x12C; RSSI 199 << 1; RSRP 68 << 1
        46 50                   # average RSRP 70; RSRQ 40 << 1
        2A 16                   # average RSRQ 42; Srxlev 44 << 7
        FE FF 00 00             # frequency offset
        D2 0C 34 12             # frame 0x4D2; sample 149121 << 3 from byte 13 on
        00 00 00 00
    )"));
    const Data most = lteNeighbours(lteCarriers[0], std::vector<LTENeighbour>(33)).message(zeroHour());
    EXPECT_EQ(most.size(), 21U + 32 * 20);
    EXPECT_EQ(Data::copyOf(most.bytes().subspan(19, 2)), hex("CA 07")) << "31 << 6";
}

struct CandidateCase {
    const char* name;
    std::vector<ReselectionCandidate> candidates;
    const char* bytes; ///< from the count on
};

TEST(LTERecords, candidatesAreAsDocumented) {
    const CandidateCase cases[] = {
        {"none", {}, "00 00"},
        {"LTE", {{RATType::LTE, 5, 1300, 503}}, "01 00   05 00 00 00   14 05   80 FB"}, // 503 << 7
        {"UTRAN", {{RATType::UTRAN, 2, 10588, 300}}, "01 00   02 00 01 00   5C 29   2C 01"},
        {"GERAN", {{RATType::GERAN, 1, 124, 63, 1}}, "01 00   01 00 02 00   7C 00   01 3F"},
        {"CDMA 1x",
         {{RATType::CDMA1xRTT, 0, 283, 168, 10}},
         "01 00   00 00 03 00   0A 00 00 00   1B 01   A8 00"},
        {"HRPD", {{RATType::CDMAHRPD, 0, 283, 168, 10}}, "01 00   00 00 04 00   0A 00 00 00   1B 01   A8 00"},
        {"unknown", {{RATType::Other, 7}}, "01 00   07 00 09 00"},
        {"side by side, with room for what is read of the second",
         {{RATType::UTRAN, 2, 10588, 300}, {RATType::CDMA1xRTT, 1, 283, 168, 10}, {RATType::Other, 7}},
         "03 00   02 00 01 00   01 00 03 00   07 00 09 00   00 00 00 00"},
    };
    for (const CandidateCase& c : cases)
        EXPECT_EQ(reselectionCandidates(cellA, c.candidates).message(zeroHour()),
                  record(0xB186, "01 00   14 05   F7 01   " + std::string(c.bytes)))
            << c.name;
}

TEST(LTERecords, cellInformationHasATrackingArea) {
    const DictionaryRef cell = lteCellInformation({cellA, -100, -10, -65}, false);
    const DictionaryRef wanted = std::make_shared<Dictionary>(
        Dictionary{{"kVoxCellMonitorCellRadioAccessTechnology", "kVoxCellMonitorRadioAccessTechnologyLTE"},
                   {"kVoxCellMonitorCellType", "kVoxCellMonitorCellTypeNeighbor"},
                   {"kVoxCellMonitorMCC", 1},
                   {"kVoxCellMonitorMNC", 1},
                   {"kVoxCellMonitorTAC", 7101},
                   {"kVoxCellMonitorCellId", 0x1A00001},
                   {"kVoxCellMonitorUARFCN", 1300},
                   {"kVoxCellMonitorPID", 503},
                   {"kVoxCellMonitorBandInfo", 3}});
    EXPECT_EQ(Value(cell), Value(wanted));
}

TEST(RecordBuilderBitsTest, setsAndClearsTheFieldsBitsAlone) {
    RecordBuilder builder(1, 16);
    EXPECT_EQ(builder.u8(13, 0xFF).u16(14, 0xFFFF).bits(13, 6, 11, 0).message(zeroHour()).from(13),
              hex("3F 00 FE"));
    EXPECT_EQ(builder.bits(13, 6, 11, 0x7FF).message(zeroHour()).from(13), hex("FF FF FF"));
    EXPECT_EQ(builder.bits(13, 1, 4, 5).message(zeroHour()).from(13), hex("EB FF FF")) << "0101 at bit 1";
    EXPECT_EQ(builder.bits(16, 7, 2, 3).message(zeroHour()).from(13), hex("EB FF FF 80 01")) << "grows";
}

} // namespace
} // namespace velmora
