// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/IFX/IFXScenario.h"
#include "Tests/LogGenerator/Observations/Truth/TruthTest.h"

namespace velmora {
namespace {

class IFXTruthTest : public TruthTest {
protected:
    IFXTruthTest() : TruthTest(decodedTechnologies[4]) {}

    /// The network and the base station colour code (3GPP TS 23.003 4.3.2).
    [[nodiscard]] static std::string bsic(const GSMCell& cell) {
        return std::to_string(cell.bsic / 8) + "-" + std::to_string(cell.bsic % 8);
    }
    void compareServing(const Seen& value, const GSMMeasurement& serving, const CellArea& area) {
        switch (value.role) {
        case Role::ServingCell: expectNumber(value, serving.cell->cellId); break;
        case Role::ServingArea: expectNumber(value, area.lac); break;
        case Role::ServingChannel: expectNumber(value, serving.cell->arfcn); break;
        case Role::ServingPhysicalCell: expectWords(value, bsic(*serving.cell)); break;
        case Role::ServingLevel: expectNumber(value, serving.rssi_dBm); break;
        default: break;
        }
    }
    void compareState(const Seen& value, IFXPhone::State state) {
        using State = IFXPhone::State;
        static const std::map<State, std::string> texts = {{State::Searching, "Searching"},
                                                           {State::Limited, "Limited Service"},
                                                           {State::Registering, "Registering"},
                                                           {State::Idle, "Idle"},
                                                           {State::Call, "Call"},
                                                           {State::PacketSession, "Packet Transfer"}};
        if (value.role == Role::RegistrationState)
            expectWords(value, texts.at(state));
    }
    void compareNeighbour(const Row& row, const RadioNetwork& network) {
        for (const GSMMeasurement& each : network.gsm())
            if (row.at(Role::NeighbourChannel).number == each.cell->arfcn &&
                row.at(Role::NeighbourPhysicalCell).words == bsic(*each.cell)) {
                expectNumber(row.at(Role::NeighbourChannel), each.cell->arfcn);
                expectNumber(row.at(Role::NeighbourLevel), each.rssi_dBm);
                return;
            }
        ADD_FAILURE() << "no such cell is near: " << row.begin()->second.path;
    }
};

TEST_F(IFXTruthTest, WhatIsObservedIsWhatTheDriveMeant) {
    IFXScenario scenario(1);
    for (int i = 0; i < 600 && !HasFailure(); ++i) {
        decode(scenario.next().message);
        const IFXPhone& phone = scenario.phone();
        for (const Seen& each : seen()) {
            compareState(each, phone.state);
            if (phone.serving)
                compareServing(each, *phone.serving, phone.registeredArea);
        }
        for (const Row& row : rowsWith(Role::NeighbourChannel))
            compareNeighbour(row, scenario.network());
    }
    expectCompared({Role::ServingArea, Role::ServingCell, Role::ServingChannel, Role::ServingPhysicalCell,
                    Role::ServingLevel, Role::NeighbourChannel, Role::NeighbourLevel,
                    Role::RegistrationState});
}

} // namespace
} // namespace velmora
