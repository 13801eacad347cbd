// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/UTRAN/UTRANRecords.h"

#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <string>
#include <utility>
#include <vector>

namespace velmora {
namespace {

using namespace records;

const UTRANCell cellA{10054, 85, 0x041012D, {{1, 1}, 4101, 1}};
const UTRANCell cellB{10121, 42, 7, {{1, 1}, 4101, 1}};

/// A record of zeros but for the parts, each from its offset on.
Data sparse(std::uint16_t code, std::size_t length,
            const std::vector<std::pair<std::size_t, std::string>>& parts) {
    std::vector<std::uint8_t> payload(length - 13);
    for (const auto& [offset, bytes] : parts) {
        const Data part = hex(bytes);
        std::copy(part.bytes().begin(), part.bytes().end(),
                  payload.begin() + static_cast<std::ptrdiff_t>(offset - 13));
    }
    return recordOf(code, payload);
}

TEST(UTRANRecords, rrcStateIsAsDocumented) {
    EXPECT_EQ(utranRRCState(RRCState::URAPCH).message(zeroHour()), record(0xD0E0, "01 // version\n 05"));
}

TEST(UTRANRecords, servingCellIsAsDocumented) {
    EXPECT_EQ(utranServingCell(cellA, true).message(zeroHour()), record(0xD0E2, R"(
        00
        00              # access restrictions: 0x41012D = 4260141 is no multiple of 7
        05              # URA: 4101 = 0x1005
        00
        46 27           # uplink 10054
        46 27           # downlink
        2D 01 41 00     # cell
        01              # emergency calls only
    )"));
    const Data other = utranServingCell(cellB, false).message(zeroHour());
    EXPECT_EQ(other.bytes()[14], 1) << "7 is a multiple of 7";
    EXPECT_EQ(other.bytes()[25], 0);
}

TEST(UTRANRecords, neighboursArePacked) {
    EXPECT_EQ(
        utranNeighbours({{{cellA, -25}, UTRANSet::Monitored, false}, {{cellB, -80}, UTRANSet::None, true}})
            .message(zeroHour()),
        sparse(0xD00A, 168 + 2 * 16,
               {{16, "04"},              // two
                {168, "46 67 75 2B"},    // 10054, 85, step 91 of -25 dBm, 1, 0
                {184, "89 A7 8A E4"}})); // 10121, 42, step 36 = 00100 100 of -80 dBm, 3, 1
    EXPECT_EQ(utranNeighbours({}).message(zeroHour()), sparse(0xD00A, 168, {}));
    // Levels outside the reporting range.
    EXPECT_EQ(utranNeighbours({{{{}, -130}, UTRANSet::Active, false}, {{{}, -10}, UTRANSet::Active, false}})
                  .message(zeroHour()),
              sparse(0xD00A, 200, {{16, "04"}, {184, "00 00 60 0B"}}));
}

TEST(UTRANRecords, gsmNeighboursAreAsDocumented) {
    const GSMCell cell{540, 37, 10101, {{1, 1}, 4101, 1}};
    EXPECT_EQ(utranGSMNeighbours({{&cell, -85}}).message(zeroHour()), record(0xD00E, R"(
        00 00 00
        01              # one
        75 A7           # cell 10101 = 0x2775, band indicator 0, BSIC valid
        04 05           # BSIC 37
        1C 02           # ARFCN 540
        AB FF           # -85 dBm
    )"));
}

TEST(UTRANRecords, channelQualityIsAsDocumented) {
    EXPECT_EQ(
        utranChannelQuality({{1, 0.01}, {5, 1}}, {{0, 1, {8, 9}}, {1, 2, {-20, 30}}}).message(zeroHour()),
        sparse(0xD00C, 357 + 16,
               {{14, "80 20"},                       // two and two
                {17, "01 20"},                       // a hundredth: 63 - 2/0.065 = 32.2
                {19, "05 3F"},                       // every block
                {357, "00 01 26 00 00 00 00 00"},    // 8 dB: 38; the second slot is not its own
                {365, "01 02 00 3F 00 00 00 00"}})); // both ends of the range
    EXPECT_EQ(utranChannelQuality({}, {}).message(zeroHour()), sparse(0xD00C, 289, {}));
    EXPECT_EQ(utranChannelQuality({{1, 0}, {2, 1e-9}}, {}).message(zeroHour()),
              sparse(0xD00C, 357, {{14, "80 00"}, {17, "01 00"}, {19, "02 01"}}));
}

TEST(UTRANRecords, countsEndWhereTheirFieldsAndTablesDo) {
    EXPECT_EQ(utranNeighbours(std::vector<UTRANNeighbour>(40)).size(), 168u + 32 * 16);
    const Data quality =
        utranChannelQuality(std::vector<UTRANTransportChannel>(9), std::vector<UTRANCompositeChannel>(9))
            .message(zeroHour());
    EXPECT_EQ(quality.size(), 289u + 34 * 8 + 8 * 8);
    EXPECT_EQ(quality.bytes()[14], 0x00);
    EXPECT_EQ(quality.bytes()[15], 0x82);
}

TEST(UTRANNetworkTest, cellsAreTDCellsThatDoNotRepeat) {
    UTRANNetwork network(3);
    std::vector<UTRANCell> cells;
    for (int step = 0; step < 600; ++step) {
        network.drive(1);
        int last = 0;
        for (const UTRANMeasurement& each : network.cells()) {
            EXPECT_GE(each.cell.uarfcn, 10054);
            EXPECT_LE(each.cell.uarfcn, 10121);
            EXPECT_GE(each.cell.parameterId, 0);
            EXPECT_LE(each.cell.parameterId, 127);
            EXPECT_TRUE(last == 0 || each.rscp_dBm <= last) << "the best first";
            last = each.rscp_dBm;
            if (std::find(cells.begin(), cells.end(), each.cell) == cells.end())
                cells.push_back(each.cell);
        }
    }
    EXPECT_GE(cells.size(), 12u);
    for (std::size_t i = 0; i < cells.size(); ++i)
        for (std::size_t j = 0; j < i; ++j)
            EXPECT_FALSE(cells[i].uarfcn == cells[j].uarfcn && cells[i].parameterId == cells[j].parameterId);
}

} // namespace
} // namespace velmora
