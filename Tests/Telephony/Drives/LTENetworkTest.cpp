// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/LTE/LTENetwork.h"

#include <gtest/gtest.h>

#include <cmath>
#include <set>

namespace velmora {
namespace {

struct Band {
    int number;
    int firstDownlink, lastDownlink;
    int firstUplink, lastUplink;
};
/// Channels of the bands that the network uses; a channel is 100 kHz.
constexpr Band bands[] = {
    {3, 1200, 1949, 19200, 19949}, {5, 2400, 2649, 20400, 20649},  {7, 2750, 3449, 20750, 21449},
    {8, 3450, 3799, 21450, 21799}, {20, 6150, 6449, 24150, 24449}, {28, 9210, 9659, 27210, 27659},
};

TEST(LTENetworkTest, carriersLieInTheirBands) {
    std::set<int> blocks;
    for (const LTECarrier& carrier : lteCarriers) {
        int found = 0;
        for (const Band& band : bands) {
            if (band.number != carrier.band)
                continue;
            ++found;
            // 1.4, 3, 5, 10, 15 and 20 MHz, half of it on each side.
            const int half = carrier.resourceBlocks == 6 ? 7 : carrier.resourceBlocks;
            EXPECT_GE(carrier.downlink - half, band.firstDownlink);
            EXPECT_LE(carrier.downlink + half - 1, band.lastDownlink);
            EXPECT_EQ(carrier.uplink - carrier.downlink, band.firstUplink - band.firstDownlink);
            EXPECT_LE(carrier.uplink, band.lastUplink);
        }
        EXPECT_EQ(found, 1) << carrier.band;
        blocks.insert(carrier.resourceBlocks);
    }
    EXPECT_EQ(blocks, (std::set<int>{6, 15, 25, 50, 75, 100}));
}

TEST(LTENetworkTest, cellsAreOfTheirCarrierAndInRange) {
    for (const std::uint64_t seed : {1U, 2U, 3U}) {
        LTENetwork network(seed);
        for (int step = 0; step < 300; ++step) {
            network.drive(1);
            std::set<int> identities;
            for (std::size_t carrier = 0; carrier < lteCarriers.size(); ++carrier) {
                const auto& cells = network.cells(carrier);
                ASSERT_FALSE(cells.empty());
                std::set<int> physical;
                for (std::size_t i = 0; i < cells.size(); ++i) {
                    const LTEMeasurement& each = cells[i];
                    EXPECT_EQ(each.cell.carrier, carrier);
                    EXPECT_GE(each.cell.physicalId, 0);
                    EXPECT_LE(each.cell.physicalId, 503);
                    EXPECT_GT(each.cell.identity, 0);
                    EXPECT_LT(each.cell.identity, 1 << 28);
                    EXPECT_TRUE(physical.insert(each.cell.physicalId).second);
                    EXPECT_TRUE(identities.insert(each.cell.identity).second);
                    EXPECT_GE(each.rsrp_dBm, -140);
                    EXPECT_LE(each.rsrp_dBm, -44);
                    EXPECT_GE(each.rsrq_dB, -19.5);
                    EXPECT_LE(each.rsrq_dB, -3);
                    EXPECT_GT(each.rssi_dBm, each.rsrp_dBm);
                    EXPECT_LE(each.rssi_dBm, -12.5);
                    EXPECT_TRUE(i == 0 || each.rsrp_dBm <= cells[i - 1].rsrp_dBm);
                }
            }
        }
    }
}

TEST(LTENetworkTest, theRoundPassesAllTrackingAreas) {
    LTENetwork network(1);
    std::set<int> areas;
    for (int second = 0; second < 1500; ++second) {
        network.drive(1);
        areas.insert(network.cells(0).front().cell.area.lac);
    }
    EXPECT_EQ(areas, (std::set<int>{7101, 7102, 8201}));
}

} // namespace
} // namespace velmora
