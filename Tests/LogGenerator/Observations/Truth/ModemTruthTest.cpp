// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/Modem/ModemScenario.h"
#include "Tests/LogGenerator/Observations/Truth/TruthTest.h"

namespace velmora {
namespace {

using Radio = ModemCell::Radio;

class ModemTruthTest : public TruthTest {
protected:
    ModemTruthTest() : TruthTest(decodedTechnologies[5]) {}

    void compareServing(const Seen& value, const ModemCell& serving) {
        switch (value.role) {
        case Role::ServingCountryCode: expectWords(value, digits(serving.area.plmn.mcc, 3)); break;
        case Role::ServingNetworkCode: expectWords(value, digits(serving.area.plmn.mnc, 2)); break;
        case Role::ServingArea: expectNumber(value, serving.area.lac); break;
        case Role::ServingCell: expectNumber(value, static_cast<double>(serving.identity)); break;
        case Role::ServingChannel: expectNumber(value, serving.channel); break;
        case Role::ServingPhysicalCell: expectNumber(value, serving.physical); break;
        case Role::ServingLevel: expectNumber(value, serving.level_dBm); break;
        case Role::ServingQuality: expectNumber(value, serving.quality_dB); break;
        default: break;
        }
    }
    /// Of whichever technology and carrier: no two share a channel number.
    void compareNeighbour(const Row& row, const NRNetwork& network) {
        const Seen& channel = row.at(Role::NeighbourChannel);
        const Seen& physical = row.at(Role::NeighbourPhysicalCell);
        std::vector<double> levels;
        std::vector<double> qualities;
        const auto collect = [&](Radio radio, std::size_t carrier) {
            for (const ModemCell& each : cellsOf(network, radio, carrier))
                if (each.channel == channel.number && each.physical == physical.number) {
                    levels.push_back(each.level_dBm);
                    qualities.push_back(each.quality_dB);
                }
        };
        collect(Radio::GSM, 0);
        collect(Radio::UMTS, 0);
        for (std::size_t carrier = 0; carrier < lteCarriers.size(); ++carrier)
            collect(Radio::LTE, carrier);
        for (std::size_t carrier = 0; carrier < nrCarriers.size(); ++carrier)
            collect(Radio::NR, carrier);
        EXPECT_FALSE(levels.empty()) << physical.path << " " << physical.number;
        expectNumber(channel, channel.number);
        expectNumber(physical, physical.number);
        expectAmong(row.at(Role::NeighbourLevel), levels);
        if (const auto quality = row.find(Role::NeighbourQuality); quality != row.end())
            expectAmong(quality->second, qualities);
    }
};

TEST_F(ModemTruthTest, WhatIsObservedIsWhatTheDriveMeant) {
    for (const std::uint64_t seed : {1, 7})
        play<ModemScenario>(
            seed, 4000, [&](const NRNetwork& network, const ModemPhone& before, const ModemPhone& after) {
                const bool isSteady =
                    before.serving && after.serving && before.serving->isSameCellAs(*after.serving);
                for (const Seen& each : seen()) {
                    if (isSteady)
                        compareServing(each, *after.serving);
                    if (each.role == Role::RegistrationState && before.registration == after.registration)
                        expectRaw(each, static_cast<int>(after.registration));
                }
                for (const Row& row : rowsWith(Role::NeighbourChannel))
                    compareNeighbour(row, network);
            });
    expectCompared({Role::ServingCountryCode, Role::ServingNetworkCode, Role::ServingArea, Role::ServingCell,
                    Role::ServingChannel, Role::ServingPhysicalCell, Role::ServingLevel, Role::ServingQuality,
                    Role::NeighbourChannel, Role::NeighbourPhysicalCell, Role::NeighbourLevel,
                    Role::NeighbourQuality, Role::RegistrationState});
}

} // namespace
} // namespace velmora
