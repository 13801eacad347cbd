// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/C2K/C2KNetwork.h"

#include <algorithm>
#include <cmath>

namespace velmora {
namespace {

constexpr double thermalNoise_dBm = -107;
/// What a sector sends beside its pilot.
constexpr double pilotShare_dB = 7;

double milliwatts(double dBm) {
    return std::pow(10.0, dBm / 10);
}

C2KSector sectorInPlaceOf(const UMTSCell& cell) {
    C2KSector sector;
    sector.pnOffset = cell.scramblingCode;
    sector.baseId = cell.cellId & 0xFFFF;
    const bool second = cell.area.plmn.mnc == 2;
    sector.sid = second ? 32002 : C2KNetwork::homeSID;
    sector.nid = second ? 21 : cell.area.lac - 4090; // 11 and 12 for 4101 and 4102
    sector.packetZone = cell.area.rac;
    sector.colorCode = 40 + cell.area.rac;
    sector.bandClass = second ? 0 : 1;
    sector.channel = second ? 283 : 375;
    sector.packetChannel = second ? 78 : 425;
    return sector;
}

} // namespace

void C2KNetwork::drive(double seconds) {
    _network.drive(seconds);
    measure();
}

double C2KNetwork::received_dBm(int sid) const {
    double total_mW = milliwatts(thermalNoise_dBm);
    for (const C2KPilot& pilot : _pilots)
        if (pilot.sector.sid == sid)
            total_mW += milliwatts(pilot.level_dBm + pilotShare_dB);
    return 10 * std::log10(total_mW);
}

void C2KNetwork::measure() {
    _pilots.clear();
    for (const UMTSMeasurement& each : _network.umts())
        _pilots.push_back({sectorInPlaceOf(*each.cell), static_cast<double>(each.rscp_dBm), 0, 0});
    for (C2KPilot& pilot : _pilots) {
        const double total_dBm = received_dBm(pilot.sector.sid);
        const double own_mW = milliwatts(pilot.level_dBm + pilotShare_dB);
        pilot.ecio_dB = std::max(pilot.level_dBm - total_dBm, -31.0);
        pilot.ci_dB = std::clamp(10 * std::log10(own_mW / (milliwatts(total_dBm) - own_mW)), -31.0, 13.0);
    }
}

} // namespace velmora
