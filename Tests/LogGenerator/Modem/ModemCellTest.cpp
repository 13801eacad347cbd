// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/Modem/ModemFixture.h"

#include <gmock/gmock.h>

#include <limits>

namespace velmora {
namespace {

class ModemCellTest : public ModemFixture {
protected:
    /// What is shown of the only serving cell, without the state.
    std::string servingCell(const Value& cell) {
        const std::string node = after("Serving Cell", {cellMessage({cell})});
        constexpr std::string_view beginning = "{State 'Registered', ";
        EXPECT_TRUE(node.starts_with(beginning)) << node;
        return "{" + node.substr(beginning.size());
    }
};

// 310-5: the modem says that the network code has three digits. TA 5: 5 * 299792458 m/s / 2 * 16 / 30720000
// /s = 390.4 m. EARFCN 1600 is 400 * 100 kHz above the lower edges of band 3,
// 1805 and 1710 MHz, and in the downlink of band 9, 1844.9 to 1879.9 MHz. 0x1A2B3 is 107187, 0x1A2B304 is
// 27439876.
TEST_F(ModemCellTest, LTE) {
    EXPECT_EQ(servingCell(cell("LTE", "Serving",
                               {{"MCC", 310},
                                {"MNC", 5},
                                {"MNCDigits", 3},
                                {"CellId", 0x1A2B304},
                                {"TAC", 4660},
                                {"PID", 257},
                                {"EARFCN", 1600},
                                {"Bandwidth", 20000},
                                {"RSRP", -95.3},
                                {"RSRQ", -11.5},
                                {"SINR", 12.25},
                                {"RSSI", -65},
                                {"PathLoss", 110},
                                {"TimingAdvance", 5}})),
              "{Radio Technology 'LTE', PLMN '310-005', MCC '310', MNC '005', Cell Identity '27439876', "
              "eNB ID '107187', Sector '4', TAC '4660', PCI '257', EARFCN '1600', Bands '3', "
              "Overlapping Bands '9', Downlink '1845.000 MHz', Uplink '1750.000 MHz', "
              "Bandwidth '20.0 MHz', RSRP '-95.3 dBm', RSRQ '-11.5 dB', SINR '12.2 dB', RSSI '-65.0 dBm', "
              "Path Loss '110.0 dB', Timing Advance '5', Distance '390 m'}");
}

// NCI 0x1234567AB = 4886718379: gNB 0x123456 = 1193046, sector 0x7AB = 1963. NR-ARFCN 630000: 3000 MHz + 15
// kHz
// * (630000 - 600000) = 3450 MHz.
TEST_F(ModemCellTest, NR) {
    EXPECT_EQ(servingCell(cell("NR", "Serving",
                               {{"MCC", 1},
                                {"MNC", 1},
                                {"MNCDigits", 2},
                                {"CellId", std::int64_t{0x1234567AB}},
                                {"TAC", 0x123456},
                                {"PID", 1007},
                                {"NRARFCN", 630000},
                                {"RSRP", -101},
                                {"RSRQ", -10.5},
                                {"SINR", -3},
                                {"TimingAdvance", 3846}})),
              "{Radio Technology 'NR', PLMN '001-01', MCC '001', MNC '01', Cell Identity '4886718379', "
              "gNB ID (if of 24 bits) '1193046', Sector (if of 12 bits) '1963', TAC '1193046', PCI '1007', "
              "NR-ARFCN '630000', Bands 'n77, n78', Downlink '3450.000 MHz', "
              "RSRP '-101.0 dBm', RSRQ '-10.5 dB', SINR '-3.0 dB', Timing Advance '3846'}");
}

// 0x0C5A1B2 is RNC 0x0C5 = 197, cell 0xA1B2 = 41394. UARFCN 10700: 10700 / 5 = 2140 MHz, 190 MHz less up.
TEST_F(ModemCellTest, UMTS) {
    EXPECT_EQ(servingCell(cell("UMTS", "Serving",
                               {{"MCC", 262},
                                {"MNC", 1},
                                {"CellId", 0x0C5A1B2},
                                {"LAC", 65533},
                                {"SCN", 511},
                                {"UARFCN", 10700},
                                {"RSCP", -88},
                                {"ECN0", -7.5},
                                {"PathLoss", 120.5}})),
              "{Radio Technology 'UMTS', PLMN '262-01', MCC '262', MNC '01', Cell Identity '12951986', "
              "RNC ID '197', Cell of RNC '41394', LAC '65533', PSC '511', UARFCN '10700', Bands 'I', "
              "Downlink '2140.000 MHz', Uplink '1950.000 MHz', RSCP '-88.0 dBm', Ec-No '-7.5 dB', "
              "Path Loss '120.5 dB'}");
}

// An identity of 16 bits is one without its RNC.
TEST_F(ModemCellTest, TDSCDMA) {
    EXPECT_EQ(servingCell(cell(
                  "UTRAN", "Serving",
                  {{"MCC", 460}, {"MNC", 0}, {"CellId", 41394}, {"LAC", 1}, {"SCN", 127}, {"RSCP", -70}})),
              "{Radio Technology 'TD-SCDMA', PLMN '460-00', MCC '460', MNC '00', Cell Identity '41394', "
              "LAC '1', Cell Parameter ID '127', RSCP '-70.0 dBm'}");
}

// BSIC 59: colour codes 7 and 3. ARFCN 62: 890 + 0.2 * 62 = 902.4 MHz up, 45 MHz more down. TA 3: 3 * 553.46
// m.
TEST_F(ModemCellTest, GSM) {
    EXPECT_EQ(
        servingCell(cell("GSM", "Serving",
                         {{"MCC", 262},
                          {"MNC", 99},
                          {"CellId", 65535},
                          {"LAC", 257},
                          {"BSIC", 59},
                          {"ARFCN", 62},
                          {"RSSI", -71},
                          {"TimingAdvance", 3}})),
        "{Radio Technology 'GSM', PLMN '262-99', MCC '262', MNC '99', Cell Identity '65535', LAC '257', "
        "BSIC '59', NCC-BCC '7-3', ARFCN '62', Bands 'P-GSM 900', Downlink '947.400 MHz', "
        "Uplink '902.400 MHz', RXLEV '-71.0 dBm', Timing Advance '3', Distance '1660 m'}");
}

TEST_F(ModemCellTest, CDMA2000) {
    EXPECT_EQ(servingCell(cell("CDMA", "Serving",
                               {{"SID", 16420},
                                {"NID", 3},
                                {"BaseStation", 1044},
                                {"PN", 120},
                                {"PilotStrength", -6.5},
                                {"RSSI", -80}})),
              "{Radio Technology 'CDMA2000', SID '16420', NID '3', Base Station ID '1044', PN Offset '120', "
              "Pilot Strength '-6.5 dB', RSSI '-80.0 dBm'}");
}

// The network's place is no measurement: the channel and level that are there are of another cell.
TEST_F(ModemCellTest, KnownByIdentityAlone) {
    EXPECT_EQ(servingCell(cell("LTE", "Serving",
                               {{"MCC", 1},
                                {"MNC", 1},
                                {"CellId", 257},
                                {"TAC", 7},
                                {"PID", 3},
                                {"EARFCN", 1300},
                                {"RSRP", -90},
                                {"IsPlace", true}})),
              "{Radio Technology 'LTE', Known by Identity Alone 'Yes', PLMN '001-01', MCC '001', MNC '01', "
              "Cell Identity '257', eNB ID '1', Sector '1', TAC '7'}");
}

// Where no channel number tells it, the modem's own frequency counts.
TEST_F(ModemCellTest, AFrequencyWithoutAChannel) {
    EXPECT_EQ(
        servingCell(cell("NR", "Serving", {{"DownlinkFrequency", 3450120}, {"UplinkFrequency", 3450120}})),
        "{Radio Technology 'NR', Downlink '3450.120 MHz', Uplink '3450.120 MHz'}");
}

struct UnknownCase {
    const char* technology;
    const char* key;
    Value value;
};

class UnknownNumberTest : public ModemCellTest, public testing::WithParamInterface<UnknownCase> {};

TEST_P(UnknownNumberTest, IsAbsent) {
    const UnknownCase& unknown = GetParam();
    const std::string without = servingCell(cell(unknown.technology, "Serving", {{"Other", 1}}));
    EXPECT_EQ(servingCell(cell(unknown.technology, "Serving", {{unknown.key, unknown.value}})), without);
}

constexpr double notANumber = std::numeric_limits<double>::quiet_NaN();
constexpr double infinite = std::numeric_limits<double>::infinity();
constexpr std::int64_t unknown32 = 0x7FFFFFFF;

const UnknownCase unknownNumbers[] = {
    {"LTE", "TAC", 0},
    {"LTE", "TAC", 0xFFFE},
    {"LTE", "TAC", 0xFFFF},
    {"LTE", "TAC", 0x10000},
    {"NR", "TAC", 0},
    {"NR", "TAC", 0xFFFE},
    {"NR", "TAC", 0xFFFF},
    {"NR", "TAC", 0xFFFFFE},
    {"NR", "TAC", 0xFFFFFF},
    {"GSM", "LAC", 0},
    {"UMTS", "LAC", 0xFFFE},
    {"LTE", "TAC", unknown32},
    {"LTE", "TAC", "7"},
    {"LTE", "TAC", true},
    {"LTE", "TAC", 7.5},
    {"GSM", "CellId", 0x10000},
    {"LTE", "CellId", 0x10000000},
    {"LTE", "CellId", unknown32},
    {"NR", "CellId", unknown32},
    {"NR", "CellId", std::int64_t{0xFFFFFFFF}},
    {"NR", "CellId", std::int64_t{0x1000000000}},
    {"LTE", "CellId", -1},
    {"LTE", "PID", 504},
    {"NR", "PID", 1008},
    {"UMTS", "SCN", 512},
    {"UTRAN", "SCN", 128},
    {"GSM", "BSIC", 64},
    {"GSM", "ARFCN", 1024},
    {"UMTS", "UARFCN", 16384},
    {"LTE", "EARFCN", 262144},
    {"LTE", "EARFCN", unknown32},
    {"NR", "NRARFCN", 3279166},
    {"LTE", "RSRP", notANumber},
    {"LTE", "RSRP", infinite},
    {"LTE", "RSRP", -infinite},
    {"LTE", "RSRP", unknown32},
    {"LTE", "RSRP", 0},
    {"LTE", "RSRP", -32768.0},
    {"LTE", "RSRP", "-90"},
    {"NR", "SINR", 327.67},
    {"UMTS", "ECN0", 0.5},
    {"GSM", "RSSI", 99},
    {"GSM", "TimingAdvance", 64},
    {"LTE", "TimingAdvance", 1283},
    {"NR", "TimingAdvance", 3847},
    {"UMTS", "TimingAdvance", 3},
    {"LTE", "MCC", 0},
    {"LTE", "MCC", 1000},
    {"LTE", "MNC", 1000},
    {"LTE", "IsPlace", false},
    {"LTE", "Bandwidth", 0},
    {"LTE", "DownlinkFrequency", 0},
    {"CDMA", "PN", 512},
    // What another radio technology has.
    {"GSM", "EARFCN", 1300},
    {"LTE", "SCN", 3},
    {"LTE", "RSCP", -90},
};
INSTANTIATE_TEST_SUITE_P(Numbers, UnknownNumberTest, testing::ValuesIn(unknownNumbers));

TEST_F(ModemCellTest, OfFiveGNonStandaloneBothAreShown) {
    update(cellMessage({cell("LTE", "Serving", {{"PID", 1}}), cell("NR", "Serving", {{"PID", 2}})}));
    EXPECT_EQ(sectionNode("Serving Cell"), "{State 'Registered', Radio Technology 'LTE', PCI '1'}");
    EXPECT_EQ(sectionNode("Secondary Cell"), "{State 'Registered', Radio Technology 'NR', PCI '2'}");
    EXPECT_EQ(sectionNode("Neighbor Cells"), "{State 'None', Cells []}");
    update(cellMessage({cell("NR", "Serving", {{"PID", 2}})}));
    EXPECT_EQ(sectionNode("Serving Cell"), "{State 'Registered', Radio Technology 'NR', PCI '2'}");
    EXPECT_EQ(sectionNode("Secondary Cell"), "{State 'None'}");
}

TEST_F(ModemCellTest, WhatIsNoCellAndAThirdServingCellAreReported) {
    const Value lte = cell("LTE", "Serving", {{"PID", 1}});
    const LogLines lines =
        update(cellMessage({lte, lte, lte, "text", cell("LTE", "Other"), cell("", "Serving"),
                            cell("WiFi", "Neighbor"), cell("GSM", "Neighbor")}));
    EXPECT_THAT(
        lines,
        testing::Contains(CapturedLog::Line{LogPriority::Error, "Record 0xFF0001: 3 of 8 entries"}).Times(1));
    EXPECT_EQ(text("Neighbor Cells", "State"), "1 cell");
}

} // namespace
} // namespace velmora
