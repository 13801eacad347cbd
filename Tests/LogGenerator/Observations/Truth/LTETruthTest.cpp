// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/LTE/LTEScenario.h"
#include "Tests/LogGenerator/Observations/Truth/TruthTest.h"

namespace velmora {
namespace {

class LTETruthTest : public TruthTest {
protected:
    LTETruthTest() : TruthTest(decodedTechnologies[1]) {}

    void compareServing(const Seen& value, const LTEMeasurement& serving) {
        switch (value.role) {
        case Role::ServingCell: expectNumber(value, serving.cell.identity); break;
        case Role::ServingArea: expectNumber(value, serving.cell.area.lac); break;
        case Role::ServingChannel: expectNumber(value, lteCarriers[serving.cell.carrier].downlink); break;
        case Role::ServingPhysicalCell: expectNumber(value, serving.cell.physicalId); break;
        // In steps of a quarter and an eighth of a decibel, or a quarter.
        case Role::ServingLevel: expectNumber(value, serving.rsrp_dBm, 0.125); break;
        case Role::ServingQuality: expectNumber(value, serving.rsrq_dB, 0.125); break;
        default: break;
        }
    }
    /// Of whichever carrier the record is.
    void compareNeighbour(const Row& row, const LTENetwork& network) {
        std::vector<double> levels;
        std::vector<double> qualities;
        const Seen& cell = row.at(Role::NeighbourPhysicalCell);
        for (std::size_t carrier = 0; carrier < lteCarriers.size(); ++carrier)
            for (const LTEMeasurement& each : network.cells(carrier))
                if (each.cell.physicalId == cell.number) {
                    levels.push_back(each.rsrp_dBm);
                    qualities.push_back(each.rsrq_dB);
                }
        EXPECT_FALSE(levels.empty()) << cell.path << " " << cell.number;
        expectNumber(cell, cell.number);
        if (const auto level = row.find(Role::NeighbourLevel); level != row.end())
            expectAmong(level->second, levels, 0.25);
        if (const auto quality = row.find(Role::NeighbourQuality); quality != row.end())
            expectAmong(quality->second, qualities, 0.125);
    }
};

TEST_F(LTETruthTest, WhatIsObservedIsWhatTheDriveMeant) {
    for (const std::uint64_t seed : {1, 7})
        play<LTEScenario>(
            seed, 8000, [&](const LTENetwork& network, const LTEPhone& before, const LTEPhone& after) {
                if (before.serving && after.serving && before.serving->cell == after.serving->cell)
                    for (const Seen& each : seen())
                        compareServing(each, *after.serving);
                for (const Row& row : rowsWith(Role::NeighbourPhysicalCell))
                    compareNeighbour(row, network);
            });
    expectCompared({Role::ServingArea, Role::ServingCell, Role::ServingChannel, Role::ServingPhysicalCell,
                    Role::ServingLevel, Role::ServingQuality, Role::NeighbourPhysicalCell,
                    Role::NeighbourLevel, Role::NeighbourQuality});
}

} // namespace
} // namespace velmora
