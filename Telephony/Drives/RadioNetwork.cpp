// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/RadioNetwork.h"

#include <algorithm>
#include <cmath>
#include <map>
#include <numbers>

namespace velmora {
namespace {

constexpr double ringLength_m = 1800; ///< half axes of the ring road
constexpr double ringWidth_m = 1100;
constexpr int siteCount = 12;

constexpr double gsmPower_dBm = 40;   ///< radiated, less what the car's body takes
constexpr double pilotPower_dBm = 31; ///< of the UMTS pilot, likewise
constexpr double gsm900LossAt1km_dB = 121;
constexpr double gsm1800LossAt1km_dB = 128;
constexpr double umtsLossAt1km_dB = 129;

constexpr double fadingDeviation_dB = 6;
constexpr double fadingDistance_m = 60;

constexpr int gsmSensitivity_dBm = -108;
constexpr int gsmStrongest_dBm = -47;
constexpr int rscpSensitivity_dBm = -118;
constexpr int rscpStrongest_dBm = -40;
constexpr double thermalNoise_dBm = -101;

double milliwatts(double dBm) {
    return std::pow(10.0, dBm / 10);
}

/// The location areas as the ring passes through them.
CellArea areaOfSite(int site) {
    if (site < 5)
        return {{1, 1}, 4101, 1};
    if (site < 9)
        return {{1, 1}, 4102, 2};
    return {{1, 2}, 5201, 7};
}

} // namespace

RadioNetwork::RadioNetwork(std::uint64_t seed) : _random(seed) {
    build();
    drive(0);
}

void RadioNetwork::build() {
    const double turn = 2 * std::numbers::pi;
    _angle = _random.unit() * turn;
    for (int number = 0; number < siteCount; ++number) {
        const double angle = (number + 0.5 * (_random.unit() - 0.5)) * turn / siteCount;
        const double aside = 1 + (_random.unit() - 0.5) * 0.5; // inside or outside the ring
        Site site;
        site.x_m = ringLength_m * aside * std::cos(angle);
        site.y_m = ringWidth_m * aside * std::sin(angle);
        site.fading_dB = fadingDeviation_dB * _random.normal();
        const CellArea area = areaOfSite(number);
        const bool second = area.plmn.mnc == 2;
        const double firstAzimuth = _random.unit() * turn;
        for (int index = 0; index < 3; ++index) {
            const int cell = number * 3 + index;
            Sector sector;
            sector.azimuth = firstAzimuth + index * turn / 3;
            // Each network has its own share of the band, and no channel comes twice: the steps of 7 and 11
            // run through their shares before they repeat.
            sector.gsm.push_back(
                {(second ? 70 : 12) + cell * 7 % 50, _random.between(0, 63), 10101 + cell * 10, area});
            if (number % 3 == 0)
                sector.gsm.push_back({(second ? 700 : 540) + cell * 11 % 120, _random.between(0, 63),
                                      10105 + cell * 10, area});
            sector.umts = {second ? 10738 : 10588, cell * 14 + _random.between(0, 13),
                           (second ? 0x0520000 : 0x0410000) + 201 + cell * 10, area};
            site.sectors.push_back(std::move(sector));
        }
        _sites.push_back(std::move(site));
    }
}

void RadioNetwork::drive(double seconds) {
    // Traffic: the speed wanders, and now and then a light is red.
    _speed_mps += (14 - _speed_mps) * std::min(1.0, 0.05 * seconds) + _random.normal() * std::sqrt(seconds);
    if (_random.chance(0.008 * seconds))
        _speed_mps = 0;
    _speed_mps = std::clamp(_speed_mps, 0.0, 23.0);
    const double way_m = _speed_mps * seconds;

    const double along = std::hypot(ringLength_m * std::sin(_angle), ringWidth_m * std::cos(_angle));
    _angle = std::fmod(_angle + way_m / along, 2 * std::numbers::pi);
    _x_m = ringLength_m * std::cos(_angle);
    _y_m = ringWidth_m * std::sin(_angle);

    const double kept = 1 - std::min(1.0, way_m / fadingDistance_m);
    for (Site& site : _sites)
        site.fading_dB =
            kept * site.fading_dB + fadingDeviation_dB * std::sqrt(1 - kept * kept) * _random.normal();
    measure();
}

double RadioNetwork::pathGain_dB(const Site& site, const Sector& sector, double lossAt1km_dB) const {
    const double dx = _x_m - site.x_m;
    const double dy = _y_m - site.y_m;
    const double distance_km = std::max(0.05, std::hypot(dx, dy) / 1000);
    const double turn = 2 * std::numbers::pi;
    const double aside = std::remainder(std::atan2(dy, dx) - sector.azimuth, turn) * 360 / turn;
    const double pattern_dB = std::min(12 * (aside / 65) * (aside / 65), 20.0);
    return site.fading_dB - lossAt1km_dB - 37.6 * std::log10(distance_km) - pattern_dB;
}

void RadioNetwork::measure() {
    _gsm.clear();
    _umts.clear();
    std::map<int, double> carriers_mW; // total power by UMTS carrier
    for (const Site& site : _sites) {
        for (const Sector& sector : site.sectors) {
            for (const GSMCell& cell : sector.gsm) {
                const double loss = cell.arfcn < 512 ? gsm900LossAt1km_dB : gsm1800LossAt1km_dB;
                const double level = gsmPower_dBm + pathGain_dB(site, sector, loss) + _random.normal();
                const int rssi = std::min(gsmStrongest_dBm, static_cast<int>(std::lround(level)));
                if (rssi >= gsmSensitivity_dBm)
                    _gsm.push_back({&cell, rssi});
            }
            const double pilot =
                pilotPower_dBm + pathGain_dB(site, sector, umtsLossAt1km_dB) + _random.normal();
            const int rscp = std::min(rscpStrongest_dBm, static_cast<int>(std::lround(pilot)));
            // A cell sends about seven decibels more than its pilot when it carries some traffic.
            carriers_mW.try_emplace(sector.umts.uarfcn, milliwatts(thermalNoise_dBm)).first->second +=
                milliwatts(rscp + 5 + 2 * _random.unit());
            if (rscp >= rscpSensitivity_dBm)
                _umts.push_back({&sector.umts, rscp, 0});
        }
    }
    for (UMTSMeasurement& each : _umts) {
        const double total_dBm = 10 * std::log10(carriers_mW[each.cell->uarfcn]);
        each.ecno_dB = std::clamp(std::round(2 * (each.rscp_dBm - total_dBm)) / 2, -24.0, -1.0);
    }
    std::stable_sort(_gsm.begin(), _gsm.end(), [](auto& a, auto& b) { return a.rssi_dBm > b.rssi_dBm; });
    std::stable_sort(_umts.begin(), _umts.end(), [](auto& a, auto& b) { return a.rscp_dBm > b.rscp_dBm; });
    if (!_umts.empty())
        _umtsRSSI_dBm = 10 * std::log10(carriers_mW[_umts.front().cell->uarfcn]);
}

} // namespace velmora
