// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/RadioNetwork.h"

#include <cstdint>
#include <vector>

namespace velmora {

/// A cell of the time-division network.
struct UTRANCell {
    int uarfcn = 0;      ///< of both directions: 10054-10121, the channels around 2010-2025 MHz
    int parameterId = 0; ///< cell parameter id, 0-127
    int cellId = 0;      ///< 28 bits: RNC and cell
    CellArea area;
    friend bool operator==(const UTRANCell&, const UTRANCell&) = default;
};

struct UTRANMeasurement {
    UTRANCell cell;
    int rscp_dBm = -120; ///< of the primary common control channel
};

/// The base stations of RadioNetwork with a TD-SCDMA cell in the place of each UMTS one, and the same car:
/// nine carriers, so that every cell has a few neighbours on its own. No carrier has a cell parameter id
/// twice. Depends only on the seed and the steps driven.
class UTRANNetwork {
public:
    explicit UTRANNetwork(std::uint64_t seed) : _network(seed) { measure(); }

    /// Drives on for that many seconds.
    void drive(double seconds);

    /// What the phone's receiver would measure now, the best first; only cells above its sensitivity.
    [[nodiscard]] const std::vector<UTRANMeasurement>& cells() const { return _cells; }
    [[nodiscard]] const std::vector<GSMMeasurement>& gsm() const { return _network.gsm(); }
    [[nodiscard]] const RadioNetwork& radio() const { return _network; }

private:
    void measure();

    RadioNetwork _network;
    std::vector<UTRANMeasurement> _cells;
};

} // namespace velmora
