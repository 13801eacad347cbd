// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/RadioNetwork.h"

#include <array>
#include <cstddef>
#include <vector>

namespace velmora {

/// A carrier of the LTE network.
struct LTECarrier {
    int band;
    int downlink;        ///< EARFCN, inside the band with the entire bandwidth
    int uplink;          ///< the EARFCN that belongs to it
    int resourceBlocks;  ///< bandwidth: 6, 15, 25, 50, 75 or 100
    double advantage_dB; ///< how much stronger it arrives than one at 1.8 GHz
    int priority;        ///< of reselection: the wider the higher
};

/// One carrier of each bandwidth: 20 MHz in band 3, 15 in band 7, 10 in band 20, 5 in band 28, 3 in band 8
/// and 1.4 in band 5.
inline constexpr std::array<LTECarrier, 6> lteCarriers = {{
    {3, 1300, 19300, 100, 0, 6},
    {7, 3175, 21175, 75, -4, 5},
    {20, 6300, 24300, 50, 5, 4},
    {28, 9310, 27310, 25, 6, 3},
    {8, 3625, 21625, 15, 5, 2},
    {5, 2410, 20410, 6, 5, 1},
}};

struct LTECell {
    std::size_t carrier = 0; ///< index into `lteCarriers`
    int physicalId = 0;      ///< 0-503
    int identity = 0;        ///< 28 bits: base station and cell
    CellArea area;           ///< its LAC is the tracking area code
    friend bool operator==(const LTECell&, const LTECell&) = default;
};

struct LTEMeasurement {
    LTECell cell;
    double rsrp_dBm = -140; ///< -140 to -44
    double rsrq_dB = -19.5; ///< -19.5 to -3
    double rssi_dBm = -110; ///< of the entire carrier
};

/// The base stations of RadioNetwork with LTE on all sectors and all carriers, and the same car, which passes
/// the GSM and UMTS cells of that network, too. Depends only on the seed and the steps driven.
class LTENetwork {
public:
    explicit LTENetwork(std::uint64_t seed) : _network(seed), _random(seed ^ 0x17E) { measure(); }

    /// Drives on for that many seconds.
    void drive(double seconds);

    /// What the phone's receiver would measure now on that carrier, the best first; only cells above its
    /// sensitivity.
    [[nodiscard]] const std::vector<LTEMeasurement>& cells(std::size_t carrier) const {
        return _cells.at(carrier);
    }
    [[nodiscard]] const RadioNetwork& radio() const { return _network; }
    [[nodiscard]] const std::vector<GSMMeasurement>& gsm() const { return _network.gsm(); }
    [[nodiscard]] const std::vector<UMTSMeasurement>& umts() const { return _network.umts(); }

private:
    void measure();

    RadioNetwork _network;
    ScenarioRandom _random; ///< the measurements' noise
    std::array<std::vector<LTEMeasurement>, lteCarriers.size()> _cells;
};

} // namespace velmora
