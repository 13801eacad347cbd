// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LTE/ServingCellMeasurement.h"

#include "Tests/LogGenerator/LTE/BitFields.h"
#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

namespace velmora {

namespace {

using testing::IsEmpty;

const auto make = inDictionary<ServingCellMeasurement>;
constexpr std::string_view trace = "Serving Cell Measurements";

// Of all ones: 511 / 4 - 140 = -12.25, 127 / 4 - 30 = 1.75, 511 / 2 - 140 = 115.5, 63 * 2 - 140 = -14,
// 127 - 30 = 97, 63 - 30 = 33, 63 * 2 = 126.
constexpr BitField fields[] = {
    {"Version", 13, 0, 8, "0", "1", "255"},
    {"E-ARFCN", 17, 0, 16, "0", "1", "65535"},
    {"Physical Cell ID", 19, 0, 9, "0", "1", "511"},
    {"Serving Layer Priority", 20, 1, 4, "0", "1", "15"},
    {"Measured RSRP", 21, 0, 9, "-140.00 dBm", "-139.75 dBm", "-12.25 dBm"},
    {"Average RSRP", 22, 1, 9, "-140.00 dBm", "-139.75 dBm", "-12.25 dBm"},
    {"Measured RSRQ", 23, 2, 7, "-30.00 dB", "-29.75 dB", "1.75 dB"},
    {"Average RSRQ", 24, 1, 7, "-30.00 dB", "-29.75 dB", "1.75 dB"},
    {"Measured RSSI", 25, 0, 9, "-140.00 dBm", "-139.50 dBm", "115.50 dBm"},
    {"Qrxlevmin", 26, 1, 6, "-140 dBm", "-138 dBm", "-14 dBm"},
    {"P_Max", 26, 7, 7, "-30 dBm", "-29 dBm", "97 dBm"},
    {"Max UE Tx Power", 27, 6, 6, "-30 dBm", "-29 dBm", "33 dBm"},
    {"Srxlev", 29, 0, 7, "-30 dBm", "-29 dBm", "97 dBm"},
    {"Num of Consecutive DRX Cycles of S < 0", 29, 7, 6, "0", "1", "63"},
    {"S Intra Search", 30, 5, 6, "0 dB", "2 dB", "126 dB"},
    {"S Non Intra Search", 31, 3, 6, "0 dBm", "2 dBm", "126 dBm"}, // not in dB
    {"Measurement Rules Updated", 32, 1, 1, "False", "True", "True"},
    {"Measurement Rules", 32, 2, 4, "0", "1", "15"},
};

TEST(ServingCellMeasurement, ReadsEveryFieldFromItsBits) {
    expectBitFields(fields, 33, [](Bytes bytes) {
        SectionHarness section = make();
        section.update(recordOf(0xB17F, bytes.subspan(13)));
        EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, std::string(trace)}}));
        return section.node();
    });
}

TEST(ServingCellMeasurement, ShowsARecord) {
    const Data full = record(0xB17F, R"(
        03                              # version
        EE EE EE
        14 05                           # E-ARFCN: 1300
        F7 0B                           # cell 0x1F7: 503, layer priority 5, then 3 unused bits
        A2 44 45 2F                     # RSRP 162: -99.50; 162: -99.50; RSRQ 81: -9.75; 23: -24.25
        96                              # RSSI 150: -65
        14                              # Qrxlevmin 10: -120; P_Max bit 0
        A9 0D                           # P_Max 0x52 = 82: 52; maximum power 0x36 = 54: 24; 4 unused bits
        A8                              # Srxlev 40: 10; DRX bit 0: 1
        A1 1A 14                        # DRX 3; S intra 21: 42 dB; S non-intra 3: 6 dBm; rules 5, not updated
        99                              # longer than needed
    )");
    ASSERT_EQ(full.size(), 34u);
    expectPrefixes(make, full, 33, trace,
                   "{Version '3', E-ARFCN '1300', Physical Cell ID '503', Serving Layer Priority '5', "
                   "Measured RSRP '-99.50 dBm', Average RSRP '-99.50 dBm', Measured RSRQ '-9.75 dB', "
                   "Average RSRQ '-24.25 dB', Measured RSSI '-65.00 dBm', Qrxlevmin '-120 dBm', "
                   "P_Max '52 dBm', Max UE Tx Power '24 dBm', Srxlev '10 dBm', "
                   "Num of Consecutive DRX Cycles of S < 0 '3', S Intra Search '42 dB', "
                   "S Non Intra Search '6 dBm', Measurement Rules Updated 'False', Measurement Rules '5'}");
}

struct NotPresentCase {
    const char* name;
    std::vector<ByteAt> bytes;
    const char* label;
    const char* expected;
};

Data measurementWith(const std::vector<ByteAt>& bytes) {
    Data result = recordWith(0xB17F, 33);
    for (const ByteAt& byte : bytes)
        result = withByte(result, byte.offset, byte.value);
    return result;
}

TEST(ServingCellMeasurement, OneRawValueMeansNotPresent) {
    const NotPresentCase cases[] = {
        // P_Max: bit 7 of byte 26 is its lowest, bit 5 of byte 27 its highest.
        {"P_Max 63", {{26, 0x80}, {27, 0x1F}}, "P_Max", "33 dBm"},
        {"P_Max 64", {{27, 0x20}}, "P_Max", "Not Present"},
        {"P_Max 65", {{26, 0x80}, {27, 0x20}}, "P_Max", "35 dBm"},
        // The maximum power's 6 bits end at 63: it is never absent.
        {"maximum power 63", {{27, 0xC0}, {28, 0x0F}}, "Max UE Tx Power", "33 dBm"},
        {"the bit that would make it 64", {{28, 0x10}}, "Max UE Tx Power", "-30 dBm"},
        {"maximum power 32", {{28, 0x08}}, "Max UE Tx Power", "2 dBm"},
        // S intra search: bit 5 of byte 30 is its lowest, bit 2 of byte 31 its highest.
        {"S intra search 5", {{30, 0xA0}}, "S Intra Search", "10 dB"},
        {"S intra search 31", {{30, 0xE0}, {31, 0x03}}, "S Intra Search", "62 dB"},
        {"S intra search 32", {{31, 0x04}}, "S Intra Search", "Not Present"},
        {"S intra search 33", {{30, 0x20}, {31, 0x04}}, "S Intra Search", "66 dB"},
        // S non-intra search: bit 3 of byte 31 is its lowest, bit 0 of byte 32 its highest.
        {"S non-intra search 31", {{31, 0xF8}}, "S Non Intra Search", "62 dBm"},
        {"S non-intra search 32", {{32, 0x01}}, "S Non Intra Search", "Not Present"},
        {"S non-intra search 33", {{31, 0x08}, {32, 0x01}}, "S Non Intra Search", "66 dBm"},
    };
    for (const NotPresentCase& c : cases) {
        SectionHarness section = make();
        section.update(measurementWith(c.bytes));
        EXPECT_EQ(section.text(c.label), c.expected) << c.name;
        EXPECT_THAT(section.errors(), IsEmpty()) << c.name;
    }
}

TEST(ServingCellMeasurement, NoMaximumPowerIsNotPresent) {
    for (unsigned raw = 0; raw < 64; ++raw) {
        SectionHarness section = make();
        section.update(measurementWith(
            {{27, static_cast<std::uint8_t>(raw << 6)}, {28, static_cast<std::uint8_t>(raw >> 2 | 0xF0)}}));
        EXPECT_EQ(section.text("Max UE Tx Power"), std::to_string(static_cast<int>(raw) - 30) + " dBm");
    }
}

TEST(ServingCellMeasurement, AShortRecordKeepsWhatIsShown) {
    SectionHarness section = make();
    section.update(recordWith(0xB17F, 33, {{13, 7}}));
    const std::string before = section.node();
    section.update(recordWith(0xB17F, 32, {{13, 8}}));
    EXPECT_EQ(section.node(), before);
    section.update(recordWith(0xB17F, 33, {{13, 9}}));
    EXPECT_EQ(section.text("Version"), "9");
}

} // namespace

} // namespace velmora
