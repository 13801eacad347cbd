// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/LTE/LTENetwork.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <vector>

namespace velmora {

/// A carrier of the NR network.
struct NRCarrier {
    int channel; ///< NR-ARFCN
    int bandwidth_kHz;
    double advantage_dB; ///< how much stronger it arrives than LTE at 1.8 GHz
};

/// 3600 MHz in band n78, and 775 MHz in n28.
inline constexpr std::array<NRCarrier, 2> nrCarriers = {{{640000, 80'000, -5}, {155000, 20'000, 6}}};

struct NRCell {
    std::size_t carrier = 0;   ///< index into `nrCarriers`
    int physicalId = 0;        ///< 504-1007, so that no LTE cell has it
    std::int64_t identity = 0; ///< 36 bits: base station of 24 and cell of 12
    CellArea area;             ///< its LAC is the tracking area code, of 24 bits
    friend bool operator==(const NRCell&, const NRCell&) = default;
};

struct NRMeasurement {
    NRCell cell;
    double rsrp_dBm = -140; ///< -140 to -44
    double rsrq_dB = -19.5; ///< -19.5 to -3
    double sinr_dB = -20;   ///< -20 to 40
};

/// The base stations of LTENetwork with NR on all sectors and both carriers, and the same car. Depends only
/// on the seed and the steps driven.
class NRNetwork {
public:
    explicit NRNetwork(std::uint64_t seed) : _network(seed), _random(seed ^ 0x5A5A) { measure(); }

    /// Drives on for that many seconds.
    void drive(double seconds);

    /// What the phone's receiver would measure now on that carrier, the best first; only cells above its
    /// sensitivity.
    [[nodiscard]] const std::vector<NRMeasurement>& cells(std::size_t carrier) const {
        return _cells.at(carrier);
    }
    [[nodiscard]] const LTENetwork& lte() const { return _network; }
    [[nodiscard]] const RadioNetwork& radio() const { return _network.radio(); }

private:
    void measure();

    LTENetwork _network;
    ScenarioRandom _random; ///< the measurements' noise
    std::array<std::vector<NRMeasurement>, nrCarriers.size()> _cells;
};

} // namespace velmora
