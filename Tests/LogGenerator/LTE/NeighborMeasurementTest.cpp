// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LTE/NeighborCellsList.h"
#include "LogGenerator/LTE/NeighborMeasurementMisc.h"
#include "Tests/LogGenerator/LTE/BitFields.h"
#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

namespace velmora {

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

/// A record of that count field (the number of cells less one) and of `cells` zero cells.
Data neighbours(unsigned countLessOne, std::size_t cells) {
    return recordWith(0xB180, 21 + 20 * cells,
                      {{19, static_cast<std::uint8_t>(countLessOne << 6)},
                       {20, static_cast<std::uint8_t>(countLessOne >> 2)}});
}

TEST(NeighborMeasurementMisc, ReadsEveryFieldFromItsBits) {
    constexpr BitField fields[] = {
        {"Version", 13, 0, 8, "0", "1", "255"},
        {"E-ARFCN", 17, 0, 16, "0", "1", "65535"},
        {"Qrxlevmin", 19, 0, 6, "-140 dBm", "-138 dBm", "-14 dBm"}, // 63 * 2 - 140
    };
    expectBitFields(fields, 21, [](Bytes bytes) {
        SectionHarness section = inDictionary<NeighborMeasurementMisc>();
        section.update(recordOf(0xB180, bytes.subspan(13)));
        EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, "Neighbor Measurements"}}));
        return section.node();
    });
}

TEST(NeighborMeasurementMisc, ShowsTheHeader) {
    const Data header = record(0xB180, R"(
        02                              # version
        EE EE EE
        14 05                           # E-ARFCN: 1300
        0A F8                           # Qrxlevmin 10: -120; one neighbour; 5 unused bits
        99                              # longer than needed
    )");
    expectPrefixes(inDictionary<NeighborMeasurementMisc>, header, 21, "Neighbor Measurements",
                   "{Version '2', E-ARFCN '1300', Qrxlevmin '-120 dBm'}");
}

// Of all ones: 255 / 2 - 140 = -12.5, 511 / 2 - 140 = 115.5, 127 / 4 - 30 = 1.75, 127 - 30 = 97. The antennas
// share their bits.
constexpr BitField cellFields[] = {
    {"Physical Cell ID", 0, 0, 9, "0", "1", "511"},
    {"Measured RSSI", 1, 1, 8, "-140.00 dBm", "-139.50 dBm", "-12.50 dBm"},
    {"Measured RSRP", 2, 1, 9, "-140.00 dBm", "-139.50 dBm", "115.50 dBm"},
    {"Average RSRP", 4, 0, 9, "-140.00 dBm", "-139.50 dBm", "115.50 dBm"},
    {"Measured RSRQ", 5, 1, 7, "-30.00 dB", "-29.75 dB", "1.75 dB"},
    {"Average RSRQ", 6, 0, 7, "-30.00 dB", "-29.75 dB", "1.75 dB"},
    {"Srxlev", 6, 7, 7, "-30 dBm", "-29 dBm", "97 dBm"},
    {"Frequency Offset", 8, 0, 16, "0", "1", "65535"},
    {"Ant 0 Frame Offset", 12, 0, 11, "0", "1", "2047"},
    {"Ant 0 Sample Offset", 13, 3, 19, "0", "1", "524287"},
    {"Ant 1 Frame Offset", 12, 0, 11, "0", "1", "2047"},
    {"Ant 1 Sample Offset", 13, 3, 19, "0", "1", "524287"},
};

TEST(NeighborCellsList, ReadsEveryFieldFromItsBits) {
    expectBitFields(cellFields, 20, [](Bytes bytes) {
        SectionHarness section = inArray<NeighborCellsList>();
        section.update(joined(neighbours(0, 0), Data::copyOf(bytes)), 0xB180);
        EXPECT_EQ(section.value().asArray()->size(), 1u);
        return shown(section.value().asArray()->empty() ? Value() : (*section.value().asArray())[0]);
    });
}

/// Two cells.
constexpr std::string_view twoCells = R"(
    02                                  # version
    EE EE EE
    14 05                               # E-ARFCN: 1300
    4A 00                               # Qrxlevmin 10, two neighbours
    2C 8F 89 00                         # cell 300; RSSI 199, RSRP 68: 99.5 - 140 and 34 - 140
    46 50                               # average RSRP 70: 35 - 140; RSRQ 40: 10 - 30
    AA 0A                               # average RSRQ 42: 10.5 - 30; Srxlev 21: 21 - 30
    FE FF                               # frequency offset 65534
    EE EE
    D2 0C 34 12                         # frame 0x4D2: 1234; sample 1 + 0x34 * 32 + 0x12 * 8192
    EE EE EE EE
    01 00 00 EE   00 00   00 00   00 00   EE EE   00 00 00 00   EE EE EE EE # cell 1
)";
// Of the second cell's 0xEE bytes none is shown: the RSRP's bits end at bit 1 of byte 3, which is set: 256.
constexpr const char* cells[] = {
    "{Physical Cell ID '300', Measured RSSI '-40.50 dBm', Measured RSRP '-106.00 dBm', "
    "Average RSRP '-105.00 dBm', Measured RSRQ '-20.00 dB', Average RSRQ '-19.50 dB', Srxlev '-9 dBm', "
    "Frequency Offset '65534', Ant 0 Frame Offset '1234', Ant 0 Sample Offset '149121', "
    "Ant 1 Frame Offset '1234', Ant 1 Sample Offset '149121'}",
    "{Physical Cell ID '1', Measured RSSI '-140.00 dBm', Measured RSRP '-12.00 dBm', "
    "Average RSRP '-140.00 dBm', Measured RSRQ '-30.00 dB', Average RSRQ '-30.00 dB', Srxlev '-30 dBm', "
    "Frequency Offset '0', Ant 0 Frame Offset '0', Ant 0 Sample Offset '0', "
    "Ant 1 Frame Offset '0', Ant 1 Sample Offset '0'}",
};

std::string list(std::size_t count) {
    std::string result = "[";
    for (std::size_t i = 0; i < count; ++i)
        result.append(i == 0 ? "" : ", ").append(cells[i]);
    return result.append("]");
}

TEST(NeighborCellsList, EndsWithTheLastCompleteCell) {
    const Data two = record(0xB180, twoCells);
    ASSERT_EQ(two.size(), 61u);
    expectPrefixes(inArray<NeighborCellsList>, two, 21, "Neighbor Cells List",
                   [](std::size_t length) { return list((length - 21) / 20); });
    SectionHarness section = inArray<NeighborCellsList>();
    section.update(prefixOf(two, 60));
    EXPECT_THAT(section.errors(), ElementsAre("Record 0xB180: 1 of 2 entries"));
    section.update(prefixOf(two, 40));
    EXPECT_THAT(section.errors(), ElementsAre("Record 0xB180: 0 of 2 entries"));
    // Two bytes of a third cell are none.
    section.update(joined(two, hex("07 00")));
    EXPECT_EQ(section.node(), list(2));
    EXPECT_THAT(section.errors(), IsEmpty());
}

TEST(NeighborCellsList, TracesTheCellsWithOneTextForFiveValues) {
    SectionHarness section = inArray<NeighborCellsList>();
    const Array* array = section.value().asArray();
    section.update(record(0xB180, twoCells));
    EXPECT_EQ(section.node(), list(2));
    EXPECT_EQ(section.value().asArray(), array);
    constexpr int warning = LogPriority::Warning;
    EXPECT_EQ(section.lines(), (LogLines{{warning, "Neighbor Cells List"},
                                         {warning, "Number of neighboring cells being reported: 2\n"},
                                         {warning, "Physical Cell ID: 300\n"},
                                         {warning, "Measured RSSI: -40.500000\n"},
                                         {warning, "Measured RSSI: -106.000000\n"}, // measured RSRP
                                         {warning, "Measured RSSI: -105.000000\n"}, // average RSRP
                                         {warning, "Measured RSSI: -20.000000\n"},  // measured RSRQ
                                         {warning, "Measured RSSI: -19.500000\n"},  // average RSRQ
                                         {warning, "Physical Cell ID: 1\n"},
                                         {warning, "Measured RSSI: -140.000000\n"},
                                         {warning, "Measured RSSI: -12.000000\n"},
                                         {warning, "Measured RSSI: -140.000000\n"},
                                         {warning, "Measured RSSI: -30.000000\n"},
                                         {warning, "Measured RSSI: -30.000000\n"}}));
    // The number is the record's count, and only complete cells are traced.
    section.update(prefixOf(record(0xB180, twoCells), 21));
    EXPECT_EQ(section.lines(), (LogLines{{warning, "Neighbor Cells List"},
                                         {warning, "Number of neighboring cells being reported: 2\n"},
                                         {LogPriority::Error, "Record 0xB180: 0 of 2 entries"}}));
}

TEST(NeighborCellsList, TheCountIsOneMoreThanItsFiveBits) {
    for (unsigned field = 0; field < 32; ++field) {
        SectionHarness section = inArray<NeighborCellsList>();
        section.update(neighbours(field, 33));
        EXPECT_EQ(section.value().asArray()->size(), field + 1);
        EXPECT_EQ(section.lines().at(1).text,
                  "Number of neighboring cells being reported: " + std::to_string(field + 1) + "\n");
    }
    // The bits on both sides of the field are none of it.
    SectionHarness section = inArray<NeighborCellsList>();
    section.update(withByte(withByte(neighbours(0, 33), 19, 0x3F), 20, 0xF8));
    EXPECT_EQ(section.value().asArray()->size(), 1u);
    section.update(neighbours(31, 31));
    EXPECT_EQ(section.value().asArray()->size(), 31u);
    EXPECT_THAT(section.errors(), ElementsAre("Record 0xB180: 31 of 32 entries"));
}

TEST(NeighborCellsList, AntennaOneRepeatsAntennaZero) {
    for (unsigned step = 0; step < 40; ++step) {
        // 0x9E3779B1 spreads its multiples over all bits.
        const std::uint32_t bits = step * 0x9E3779B1u;
        SectionHarness section = inArray<NeighborCellsList>();
        section.update(recordWith(0xB180, 41,
                                  {{33, static_cast<std::uint8_t>(bits)},
                                   {34, static_cast<std::uint8_t>(bits >> 8)},
                                   {35, static_cast<std::uint8_t>(bits >> 16)},
                                   {36, static_cast<std::uint8_t>(bits >> 24)},
                                   {37, static_cast<std::uint8_t>(~bits)},
                                   {38, static_cast<std::uint8_t>(~bits >> 8)},
                                   {39, static_cast<std::uint8_t>(~bits >> 16)},
                                   {40, static_cast<std::uint8_t>(~bits >> 24)}}));
        const Dictionary& row = *(*section.value().asArray())[0].asDictionary();
        EXPECT_EQ(row["Ant 1 Frame Offset"], row["Ant 0 Frame Offset"]);
        EXPECT_EQ(row["Ant 1 Sample Offset"], row["Ant 0 Sample Offset"]);
        EXPECT_EQ(row["Ant 0 Frame Offset"], Value(std::to_string(bits & 0x7FF)));
        EXPECT_EQ(row["Ant 0 Sample Offset"], Value(std::to_string(bits >> 11 & 0x7FFFF)));
    }
}

TEST(NeighborCellsList, EveryRecordRebuildsTheList) {
    SectionHarness section = inArray<NeighborCellsList>();
    section.update(neighbours(5, 6));
    EXPECT_EQ(section.value().asArray()->size(), 6u);
    section.update(neighbours(1, 2));
    EXPECT_EQ(section.value().asArray()->size(), 2u);
    section.update(neighbours(5, 0));
    EXPECT_EQ(section.node(), "[]");
}

} // namespace

} // namespace velmora
