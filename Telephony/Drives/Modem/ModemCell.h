// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/Modem/NRNetwork.h"

#include <cstddef>
#include <cstdint>
#include <optional>
#include <vector>

namespace velmora {

/// A cell of any radio technology with its measurement, as a modem reports it: values in the steps in which
/// the modem knows them.
struct ModemCell {
    enum class Radio : std::uint8_t { GSM, UMTS, LTE, NR };

    Radio radio = Radio::GSM;
    CellArea area; ///< its LAC is the tracking area code of LTE and NR
    std::int64_t identity = 0;
    int channel = 0;                              ///< of the downlink
    int physical = 0;                             ///< BSIC, scrambling code, physical identity
    double level_dBm = 0;                         ///< RSSI, RSCP, RSRP
    double quality_dB = 0;                        ///< Ec/N0, RSRQ; of GSM none
    std::optional<double> sinr_dB = std::nullopt; ///< of LTE and NR
    double rssi_dBm = 0;                          ///< of the whole carrier; of NR none
    int bandwidth_kHz = 0;                        ///< of LTE and NR

    [[nodiscard]] bool isSameCellAs(const ModemCell& other) const {
        return radio == other.radio && channel == other.channel && physical == other.physical &&
               identity == other.identity;
    }
};

/// The cells that the modem measures of that technology, the best first; of LTE and NR those of the carrier,
/// an index into `lteCarriers` or `nrCarriers`.
[[nodiscard]] std::vector<ModemCell> cellsOf(const NRNetwork& network, ModemCell::Radio radio,
                                             std::size_t carrier);

/// As the air interface counts it, from the level: the network has no measurement of the distance.
[[nodiscard]] int timingAdvanceOf(const ModemCell& cell);

} // namespace velmora
