// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/Modem/NRNetwork.h"

#include <algorithm>
#include <cmath>

namespace velmora {
namespace {

/// A resource element has so much less power than a UMTS pilot has.
constexpr double elementBelowPilot_dB = 10;
constexpr double noisePerElement_dBm = -125;
constexpr double load = 0.3; ///< of every cell
constexpr int elementsPerBlock = 12;
constexpr double sensitivity_dBm = -122;

constexpr int codesPerSector = 14; ///< the network spreads its scrambling codes so
constexpr int firstPhysicalId = 504;
constexpr std::int64_t firstBaseStation = 0xA1000;

double milliwatts(double dBm) {
    return std::pow(10.0, dBm / 10);
}

NRCell cellInPlaceOf(const UMTSCell& cell, std::size_t carrier) {
    const int sector = cell.scramblingCode / codesPerSector;
    const int number = sector % 3 + 1 + 3 * static_cast<int>(carrier);
    CellArea area = cell.area;
    area.lac += 70'000; // tracking areas are not location areas, and need more than 16 bits
    return {carrier, firstPhysicalId + cell.scramblingCode, (firstBaseStation + sector / 3) << 12 | number,
            area};
}

} // namespace

void NRNetwork::drive(double seconds) {
    _network.drive(seconds);
    measure();
}

void NRNetwork::measure() {
    for (std::size_t carrier = 0; carrier < nrCarriers.size(); ++carrier) {
        std::vector<NRMeasurement>& cells = _cells[carrier];
        cells.clear();
        double element_mW = milliwatts(noisePerElement_dBm); // received in one resource element
        for (const UMTSMeasurement& each : _network.umts()) {
            const double level = each.rscp_dBm - elementBelowPilot_dB + nrCarriers[carrier].advantage_dB +
                                 0.5 * _random.normal();
            const double rsrp = std::clamp(level, -140.0, -44.0);
            element_mW += load * milliwatts(rsrp);
            if (rsrp >= sensitivity_dBm)
                cells.push_back({cellInPlaceOf(*each.cell, carrier), rsrp, 0, 0});
        }
        for (NRMeasurement& cell : cells) {
            const double own_mW = milliwatts(cell.rsrp_dBm);
            const double block_dBm = 10 * std::log10(elementsPerBlock * element_mW);
            const double others_dBm = 10 * std::log10(element_mW - load * own_mW);
            cell.rsrq_dB = std::clamp(cell.rsrp_dBm - block_dBm, -19.5, -3.0);
            cell.sinr_dB = std::clamp(cell.rsrp_dBm - others_dBm, -20.0, 40.0);
        }
        std::stable_sort(cells.begin(), cells.end(),
                         [](const auto& a, const auto& b) { return a.rsrp_dBm > b.rsrp_dBm; });
    }
}

} // namespace velmora
