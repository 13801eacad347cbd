// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/LTE/LTENetwork.h"

#include <algorithm>
#include <cmath>

namespace velmora {
namespace {

/// A resource element has so much less power than a UMTS pilot has.
constexpr double elementBelowPilot_dB = 10;
constexpr double noisePerElement_dBm = -125;
constexpr double load = 0.5; ///< of every cell
constexpr int elementsPerBlock = 12;
constexpr double sensitivity_dBm = -124;

constexpr int codesPerSector = 14; ///< the network spreads its scrambling codes so
constexpr int firstBaseStation = 0x1A000;

double milliwatts(double dBm) {
    return std::pow(10.0, dBm / 10);
}

/// The scrambling code, which is below 504 and different for every sector, is the cell's physical identity on
/// every carrier.
LTECell cellInPlaceOf(const UMTSCell& cell, std::size_t carrier) {
    const int sector = cell.scramblingCode / codesPerSector;
    const int number = sector % 3 + 1 + 3 * static_cast<int>(carrier);
    CellArea area = cell.area;
    area.lac += 3000; // tracking areas are not location areas
    return {carrier, cell.scramblingCode, (firstBaseStation + sector / 3) << 8 | number, area};
}

} // namespace

void LTENetwork::drive(double seconds) {
    _network.drive(seconds);
    measure();
}

void LTENetwork::measure() {
    for (std::size_t carrier = 0; carrier < lteCarriers.size(); ++carrier) {
        std::vector<LTEMeasurement>& cells = _cells[carrier];
        cells.clear();
        double element_mW = milliwatts(noisePerElement_dBm); // received in one resource element
        for (const UMTSMeasurement& each : _network.umts()) {
            const double level = each.rscp_dBm - elementBelowPilot_dB + lteCarriers[carrier].advantage_dB +
                                 0.5 * _random.normal();
            const double rsrp = std::clamp(level, -140.0, -44.0);
            element_mW += load * milliwatts(rsrp);
            if (rsrp >= sensitivity_dBm)
                cells.push_back({cellInPlaceOf(*each.cell, carrier), rsrp, 0, 0});
        }
        const double block_dBm = 10 * std::log10(elementsPerBlock * element_mW);
        for (LTEMeasurement& cell : cells) {
            cell.rsrq_dB = std::clamp(cell.rsrp_dBm - block_dBm, -19.5, -3.0);
            cell.rssi_dBm = block_dBm + 10 * std::log10(lteCarriers[carrier].resourceBlocks);
        }
        std::stable_sort(cells.begin(), cells.end(),
                         [](const auto& a, const auto& b) { return a.rsrp_dBm > b.rsrp_dBm; });
    }
}

} // namespace velmora
