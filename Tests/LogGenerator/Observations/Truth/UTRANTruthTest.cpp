// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/UTRAN/UTRANScenario.h"
#include "Tests/LogGenerator/Observations/Truth/TruthTest.h"
#include "Tests/Support/Hex.h"

#include <algorithm>

namespace velmora {
namespace {

// The level is a plain number: no source tells its unit, so that it has no role.
class UTRANTruthTest : public TruthTest {
protected:
    UTRANTruthTest() : TruthTest(decodedTechnologies[2]) {}

    void compareServing(const Seen& value, const UTRANCell& serving) {
        switch (value.role) {
        case Role::ServingCell: expectNumber(value, serving.cellId); break;
        case Role::ServingArea: expectNumber(value, serving.area.lac); break;
        case Role::ServingChannel: expectNumber(value, serving.uarfcn); break;
        case Role::ServingPhysicalCell: expectNumber(value, serving.parameterId); break;
        default: break;
        }
    }
    void compareNeighbour(const Row& row, const UTRANPhone& phone, const UTRANNetwork& network) {
        std::vector<UTRANMeasurement> cells = network.cells();
        if (phone.serving) // the list has the serving cell, too, even where it is hardly received
            cells.push_back(*phone.serving);
        const Seen& channel = row.at(Role::NeighbourChannel);
        const Seen& cell = row.at(Role::NeighbourPhysicalCell);
        std::vector<double> identities;
        for (const UTRANMeasurement& each : cells)
            if (each.cell.uarfcn == channel.number)
                identities.push_back(each.cell.parameterId);
        expectNumber(channel, channel.number);
        expectAmong(cell, identities);
    }
};

TEST_F(UTRANTruthTest, WhatIsObservedIsWhatTheDriveMeant) {
    for (const std::uint64_t seed : {1, 7})
        play<UTRANScenario>(
            seed, 8000, [&](const UTRANNetwork& network, const UTRANPhone& before, const UTRANPhone& after) {
                const bool isSteady =
                    before.serving && after.serving && before.serving->cell == after.serving->cell;
                for (const Seen& each : seen()) {
                    if (isSteady)
                        compareServing(each, after.serving->cell);
                    if (each.role == Role::RadioState && before.rrc == after.rrc)
                        expectRaw(each, static_cast<int>(after.rrc));
                }
                if (isSteady)
                    for (const Row& row : rowsWith(Role::NeighbourChannel))
                        compareNeighbour(row, after, network);
            });
    expectCompared({Role::ServingArea, Role::ServingCell, Role::ServingChannel, Role::ServingPhysicalCell,
                    Role::NeighbourChannel, Role::NeighbourPhysicalCell, Role::RadioState});
}

TEST_F(UTRANTruthTest, AStateThatTheRecordLacksIsAbsent) {
    decode(record(0xD0E0, "01 04"));
    ASSERT_EQ(seen().size(), 1u);
    EXPECT_EQ(seen()[0].raw, 4);
    decode(record(0xD0E0, "01"));
    EXPECT_TRUE(seen().empty());
    decode(record(0xD0E0, "02 04")); // an unknown version
    EXPECT_TRUE(seen().empty());
}

} // namespace
} // namespace velmora
