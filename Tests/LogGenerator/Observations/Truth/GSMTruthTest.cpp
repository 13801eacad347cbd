// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/GSM/GSMScenario.h"
#include "Tests/LogGenerator/Observations/Truth/TruthTest.h"

#include <set>

namespace velmora {
namespace {

class GSMTruthTest : public TruthTest {
protected:
    GSMTruthTest() : TruthTest(decodedTechnologies[0]) {}

    [[nodiscard]] static bool isOfUMTS(const Seen& value) {
        return value.path.find("/UMTS ") != std::string::npos;
    }
    void compareStates(const Seen& value, const GSMPhone& before, const GSMPhone& after) {
        const bool isUMTS = isOfUMTS(value);
        if (value.role == Role::RegistrationState && before.registration == after.registration)
            expectRaw(value, static_cast<int>(after.registration));
        if (value.role == Role::RadioState && isUMTS && before.rrc == after.rrc)
            expectRaw(value, static_cast<int>(after.rrc));
        if (value.role == Role::RadioState && !isUMTS && before.rr == after.rr)
            expectRaw(value, static_cast<int>(after.rr));
    }
    void compareArea(const Seen& value, const CellArea& area) {
        switch (value.role) {
        case Role::ServingCountryCode: expectWords(value, digits(area.plmn.mcc, 3)); break;
        case Role::ServingNetworkCode: expectWords(value, digits(area.plmn.mnc, 2)); break;
        case Role::ServingArea: expectNumber(value, area.lac); break;
        default: break;
        }
    }
    void compareServing(const Seen& value, const GSMMeasurement& serving) {
        switch (value.role) {
        case Role::ServingCell: expectNumber(value, serving.cell->cellId); break;
        case Role::ServingChannel: expectNumber(value, serving.cell->arfcn); break;
        case Role::ServingPhysicalCell: expectNumber(value, serving.cell->bsic); break;
        case Role::ServingLevel: expectNumber(value, serving.rssi_dBm); break;
        default: break;
        }
    }
    void compareServing(const Seen& value, const UMTSMeasurement& serving) {
        // The active set begins with the serving cell; others follow in soft handover.
        if (!value.row.empty() && !value.row.ends_with("/0"))
            return;
        switch (value.role) {
        case Role::ServingCell: expectNumber(value, serving.cell->cellId); break;
        case Role::ServingChannel: expectNumber(value, serving.cell->uarfcn); break;
        case Role::ServingPhysicalCell: expectNumber(value, serving.cell->scramblingCode); break;
        case Role::ServingQuality: expectNumber(value, serving.ecno_dB, 1); break;
        default: break;
        }
    }
    /// The modem reports the received power and the Ec/No; a code's power follows from both, each in whole
    /// decibels and rounded.
    void compareActiveSet(const UMTSMeasurement& serving, double received_dBm) {
        for (const Row& row : rowsWith(Role::ServingLevel))
            if (row.at(Role::ServingPhysicalCell).number == serving.cell->scramblingCode)
                expectNumber(row.at(Role::ServingLevel), received_dBm + serving.ecno_dB, 2);
    }
    void compareNeighbours(const RadioNetwork& network) {
        for (const GSMMeasurement& each : network.gsm())
            _bsics[each.cell->arfcn].insert(each.cell->bsic);
        for (const Row& row : rowsWith(Role::NeighbourChannel)) {
            const Seen& channel = row.at(Role::NeighbourChannel);
            if (isOfUMTS(channel))
                compareUMTSNeighbour(row, network);
            else
                compareGSMNeighbour(row, network);
        }
    }
    void compareGSMNeighbour(const Row& row, const RadioNetwork& network) {
        const Seen& channel = row.at(Role::NeighbourChannel);
        std::vector<double> channels;
        std::vector<double> levels;
        for (const GSMMeasurement& each : network.gsm()) {
            channels.push_back(each.cell->arfcn);
            if (each.cell->arfcn == channel.number)
                levels.push_back(each.rssi_dBm);
        }
        expectAmong(channel, channels);
        if (const auto level = row.find(Role::NeighbourLevel); level != row.end())
            expectAmong(level->second, levels, 1); // the service's steps are of two decibels
        // The BSICs come in a record of their own, which may be older.
        if (const auto bsic = row.find(Role::NeighbourPhysicalCell); bsic != row.end())
            expectAmong(bsic->second, bsicsOf(static_cast<int>(channel.number)));
    }
    void compareUMTSNeighbour(const Row& row, const RadioNetwork& network) {
        const auto isOf = [&row](const UMTSCell& cell) {
            return row.at(Role::NeighbourChannel).number == cell.uarfcn &&
                   row.at(Role::NeighbourPhysicalCell).number == cell.scramblingCode;
        };
        for (const UMTSMeasurement& each : network.umts())
            if (isOf(*each.cell)) {
                expectNumber(row.at(Role::NeighbourChannel), each.cell->uarfcn);
                expectNumber(row.at(Role::NeighbourLevel), each.rscp_dBm);
                expectNumber(row.at(Role::NeighbourQuality), each.ecno_dB, 1);
                return;
            }
        ADD_FAILURE() << "no such cell is near: " << row.begin()->second.path;
    }

private:
    [[nodiscard]] std::vector<double> bsicsOf(int arfcn) const {
        const auto found = _bsics.find(arfcn);
        return found == _bsics.end() ? std::vector<double>()
                                     : std::vector<double>(found->second.begin(), found->second.end());
    }

    std::map<int, std::set<int>> _bsics; ///< of the cells that have been near, by channel
};

TEST_F(GSMTruthTest, WhatIsObservedIsWhatTheDriveMeant) {
    for (const std::uint64_t seed : {1, 7}) {
        play<GSMScenario>(seed, 12000,
                          [&](const RadioNetwork& network, const GSMPhone& before, const GSMPhone& after) {
                              const bool onGSM = after.gsm.cell && before.gsm.cell == after.gsm.cell;
                              const bool onUMTS = after.umts.cell && before.umts.cell == after.umts.cell;
                              for (const Seen& each : seen()) {
                                  compareStates(each, before, after);
                                  if (before.area() == after.area())
                                      compareArea(each, after.area());
                                  if (onGSM)
                                      compareServing(each, after.gsm);
                                  if (onUMTS)
                                      compareServing(each, after.umts);
                              }
                              if (onUMTS)
                                  compareActiveSet(after.umts, network.umtsRSSI_dBm());
                              compareNeighbours(network);
                          });
    }
    expectCompared({Role::ServingCountryCode, Role::ServingNetworkCode, Role::ServingArea, Role::ServingCell,
                    Role::ServingChannel, Role::ServingPhysicalCell, Role::ServingLevel, Role::ServingQuality,
                    Role::NeighbourChannel, Role::NeighbourPhysicalCell, Role::NeighbourLevel,
                    Role::NeighbourQuality, Role::RegistrationState, Role::RadioState});
}

} // namespace
} // namespace velmora
