// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LTE/ConnectedModeMeasurementMisc.h"
#include "LogGenerator/LTE/DetectedCells.h"
#include "LogGenerator/LTE/MeasuredNeighborCells.h"
#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

namespace velmora {

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

constexpr std::string_view servingTrace = "Connected mode LTE Intra-frequency Measurement";

/// Two neighbours and three detected cells.
constexpr std::string_view twoAndThree = R"(
    EE EE EE EE
    14 05                               # E-ARFCN: 1300
    F7 01                               # cell 503
    E7 03                               # subframe 999
    A0 00                               # RSRP 160: 40 - 140 = -100
    50 00                               # RSRQ 80: 10 - 20 = -10
    02                                  # neighbours
    03                                  # detected cells
    01 00   00 00   00 00               # neighbour 1: -140 dBm, -20 dB
    FF 01   A2 01   9F 00               # neighbour 511: 104.5 - 140 = -35.5; 19.875 - 20 = -0.125
    2C 01                               # detected 300
    00 80                               # 32768
    07 00                               # 7
)";
constexpr std::string_view serving =
    "{E-ARFCN '1300', Serving Physical Cell ID '503', Subframe Number '999', "
    "Serving Filtered RSRP '-100.00 dBm', Serving Filtered RSRQ '-10.00 dB'}";
constexpr const char* neighbours[] = {
    "{Physical Cell ID '1', Filtered RSRP '-140.00 dBm', Filtered RSRQ '-20.00 dB'}",
    "{Physical Cell ID '511', Filtered RSRP '-35.50 dBm', Filtered RSRQ '-0.12 dB'}",
};
constexpr const char* detected[] = {
    "{Physical Cell ID '300'}",
    "{Physical Cell ID '32768'}",
    "{Physical Cell ID '7'}",
};

/// The first `count` of the rows as a list.
template <std::size_t N>
std::string list(const char* const (&rows)[N], std::size_t count) {
    std::string result = "[";
    for (std::size_t i = 0; i < std::min(count, N); ++i)
        result.append(i == 0 ? "" : ", ").append(rows[i]);
    return result.append("]");
}

TEST(ConnectedModeMeasurementMisc, ShowsTheServingCell) {
    expectPrefixes(inDictionary<ConnectedModeMeasurementMisc>, record(0xB179, twoAndThree), 29, servingTrace,
                   std::string(serving));
    SectionHarness section = inDictionary<ConnectedModeMeasurementMisc>();
    section.update(record(0xB179, twoAndThree));
    EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, std::string(servingTrace)}}));
    // What the lists miss is none of this section's business.
    section.update(withByte(record(0xB179, twoAndThree), 27, 255));
    EXPECT_THAT(section.errors(), IsEmpty());
}

struct Scale {
    std::uint8_t low, high;
    const char* rsrp;
    const char* rsrq;
};
// 65535 / 4 - 140 = 16243.75; 65535 / 8 - 20 = 8171.875, which as every exact half is rounded to even, here
// up; 3 / 8 - 20 = -19.625 is rounded toward zero.
constexpr Scale scales[] = {
    {0x00, 0x00, "-140.00 dBm", "-20.00 dB"},   {0x01, 0x00, "-139.75 dBm", "-19.88 dB"},
    {0x02, 0x00, "-139.50 dBm", "-19.75 dB"},   {0x03, 0x00, "-139.25 dBm", "-19.62 dB"},
    {0x00, 0x01, "-76.00 dBm", "12.00 dB"},     {0x00, 0x80, "8052.00 dBm", "4076.00 dB"},
    {0xFF, 0xFF, "16243.75 dBm", "8171.88 dB"},
};

TEST(ConnectedModeMeasurementMisc, ScalesLevelAndQuality) {
    for (const Scale& scale : scales) {
        SectionHarness section = inDictionary<ConnectedModeMeasurementMisc>();
        // Level and quality are adjacent: the other's bits are the opposite.
        const auto notLow = static_cast<std::uint8_t>(~scale.low);
        const auto notHigh = static_cast<std::uint8_t>(~scale.high);
        section.update(recordWith(
            0xB179, 29, {{22, notHigh}, {23, scale.low}, {24, scale.high}, {25, notLow}, {26, notHigh}}));
        EXPECT_EQ(section.text("Serving Filtered RSRP"), scale.rsrp);
        section.update(
            recordWith(0xB179, 29, {{23, notLow}, {24, notHigh}, {25, scale.low}, {26, scale.high}}));
        EXPECT_EQ(section.text("Serving Filtered RSRQ"), scale.rsrq);
    }
}

TEST(ConnectedModeMeasurementMisc, ReadsUnsigned16Bits) {
    SectionHarness section = inDictionary<ConnectedModeMeasurementMisc>();
    section.update(
        recordWith(0xB179, 29, {{17, 0xFF}, {18, 0xFF}, {19, 0x00}, {20, 0x80}, {21, 0xFE}, {22, 0xFF}}));
    EXPECT_EQ(section.text("E-ARFCN"), "65535");
    EXPECT_EQ(section.text("Serving Physical Cell ID"), "32768");
    EXPECT_EQ(section.text("Subframe Number"), "65534");
}

TEST(MeasuredNeighborCells, EndsWithTheLastCompleteNeighbour) {
    expectPrefixes(inArray<MeasuredNeighborCells>, record(0xB179, twoAndThree), 29, "Measured Neighbor Cells",
                   [](std::size_t length) { return list(neighbours, (length - 29) / 6); });
    SectionHarness section = inArray<MeasuredNeighborCells>();
    const Array* array = section.value().asArray();
    section.update(record(0xB179, twoAndThree));
    EXPECT_EQ(section.node(), list(neighbours, 2));
    EXPECT_EQ(section.value().asArray(), array);
    EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, "Measured Neighbor Cells"}}));
    section.update(prefixOf(record(0xB179, twoAndThree), 40));
    EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, "Measured Neighbor Cells"},
                                         {LogPriority::Error, "Record 0xB179: 1 of 2 entries"}}));
    section.update(prefixOf(record(0xB179, twoAndThree), 29));
    EXPECT_THAT(section.errors(), ElementsAre("Record 0xB179: 0 of 2 entries"));
    EXPECT_EQ(section.node(), "[]");
}

TEST(MeasuredNeighborCells, ScalesLevelAndQuality) {
    for (const Scale& scale : scales) {
        SectionHarness section = inArray<MeasuredNeighborCells>();
        section.update(recordWith(
            0xB179, 35, {{27, 1}, {31, scale.low}, {32, scale.high}, {33, scale.low}, {34, scale.high}}));
        EXPECT_EQ(section.node(), "[{Physical Cell ID '0', Filtered RSRP '" + std::string(scale.rsrp) +
                                      "', Filtered RSRQ '" + scale.rsrq + "'}]");
    }
}

TEST(MeasuredNeighborCells, AllThatAByteCounts) {
    SectionHarness section = inArray<MeasuredNeighborCells>();
    section.update(recordWith(0xB179, 29 + 255 * 6, {{27, 255}, {29 + 254 * 6, 9}}));
    ASSERT_EQ(section.value().asArray()->size(), 255u);
    EXPECT_EQ(shown((*section.value().asArray())[254]),
              "{Physical Cell ID '9', Filtered RSRP '-140.00 dBm', Filtered RSRQ '-20.00 dB'}");
    EXPECT_THAT(section.errors(), IsEmpty());
    section.update(recordWith(0xB179, 28 + 255 * 6, {{27, 255}}));
    EXPECT_EQ(section.value().asArray()->size(), 254u);
    EXPECT_THAT(section.errors(), ElementsAre("Record 0xB179: 254 of 255 entries"));
}

TEST(DetectedCells, FollowTheAnnouncedNeighbours) {
    // 29 + 2 * 6 = 41.
    expectPrefixes(inArray<DetectedCells>, record(0xB179, twoAndThree), 29, "Detected Cells",
                   [](std::size_t length) { return list(detected, length < 41 ? 0 : (length - 41) / 2); });
    SectionHarness section = inArray<DetectedCells>();
    const Array* array = section.value().asArray();
    section.update(record(0xB179, twoAndThree));
    EXPECT_EQ(section.node(), list(detected, 3));
    EXPECT_EQ(section.value().asArray(), array);
    EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, "Detected Cells"}}));

    // With one neighbour less they begin where the second one was.
    section.update(withByte(record(0xB179, twoAndThree), 27, 1));
    EXPECT_EQ(section.node(),
              "[{Physical Cell ID '511'}, {Physical Cell ID '418'}, {Physical Cell ID '159'}]");
    section.update(withByte(record(0xB179, twoAndThree), 27, 0));
    EXPECT_EQ(section.node(), "[{Physical Cell ID '1'}, {Physical Cell ID '0'}, {Physical Cell ID '0'}]");
    // With one more they lie past it, where the record has none: 29 + 18 is its end.
    section.update(withByte(record(0xB179, twoAndThree), 27, 3));
    EXPECT_EQ(section.node(), "[]");
    EXPECT_THAT(section.errors(), ElementsAre("Record 0xB179: 0 of 3 entries"));
    section.update(withByte(record(0xB179, twoAndThree), 27, 255));
    EXPECT_THAT(section.errors(), ElementsAre("Record 0xB179: 0 of 3 entries"));
}

TEST(DetectedCells, EndWithTheLastCompleteCell) {
    SectionHarness section = inArray<DetectedCells>();
    section.update(withByte(record(0xB179, twoAndThree), 28, 4));
    EXPECT_EQ(section.node(), list(detected, 3));
    EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, "Detected Cells"},
                                         {LogPriority::Error, "Record 0xB179: 3 of 4 entries"}}));
    section.update(recordWith(0xB179, 29 + 255 * 8, {{27, 255}, {28, 255}, {28 + 255 * 8, 1}}));
    ASSERT_EQ(section.value().asArray()->size(), 255u);
    EXPECT_EQ(shown((*section.value().asArray())[254]), "{Physical Cell ID '256'}");
    EXPECT_THAT(section.errors(), IsEmpty());
}

TEST(IntraFrequencySections, ARecordWithoutCellsEmptiesTheLists) {
    const Data none = recordWith(0xB179, 29, {{17, 0x2C}, {18, 0x01}});
    SectionHarness misc = inDictionary<ConnectedModeMeasurementMisc>();
    misc.update(record(0xB179, twoAndThree)).update(none);
    EXPECT_EQ(misc.node(), "{E-ARFCN '300', Serving Physical Cell ID '0', Subframe Number '0', "
                           "Serving Filtered RSRP '-140.00 dBm', Serving Filtered RSRQ '-20.00 dB'}");
    SectionHarness measured = inArray<MeasuredNeighborCells>();
    measured.update(record(0xB179, twoAndThree)).update(none);
    EXPECT_EQ(measured.node(), "[]");
    EXPECT_THAT(measured.errors(), IsEmpty());
    SectionHarness found = inArray<DetectedCells>();
    found.update(record(0xB179, twoAndThree)).update(none);
    EXPECT_EQ(found.node(), "[]");
    EXPECT_THAT(found.errors(), IsEmpty());
}

} // namespace

} // namespace velmora
