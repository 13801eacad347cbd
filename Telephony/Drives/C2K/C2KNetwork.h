// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/RadioNetwork.h"

#include <vector>

namespace velmora {

/// A sector of the CDMA2000 network: its pilot and what it broadcasts about the system. 1x and EV-DO have a
/// carrier each and share the pilot's offset.
struct C2KSector {
    int pnOffset = 0;      ///< 0-511, in units of 64 chips
    int baseId = 0;        ///< 16 bits
    int sid = 0;           ///< 15 bits
    int nid = 0;           ///< 1-65534
    int packetZone = 0;    ///< 8 bits
    int colorCode = 0;     ///< of the EV-DO subnet
    int bandClass = 0;     ///< of both carriers: 0 or 1
    int channel = 0;       ///< of 1x
    int packetChannel = 0; ///< of EV-DO
};

struct C2KPilot {
    C2KSector sector;
    double level_dBm = -120; ///< of the pilot
    double ecio_dB = -31;    ///< of the pilot, against all that is received on the 1x carrier
    double ci_dB = -31;      ///< of the sector, against all else that is received on the EV-DO carrier
};

/// The base stations of RadioNetwork with CDMA2000 sectors in the place of the UMTS cells, and the same car.
/// The first network is system 32001 with the networks 11 and 12, in the PCS band; the second is system 32002
/// with network 21, in the cellular band, where the phone roams. Depends only on the seed and the steps
/// driven.
class C2KNetwork {
public:
    explicit C2KNetwork(std::uint64_t seed) : _network(seed) { measure(); }

    static constexpr int homeSID = 32001;

    /// Drives on for that many seconds.
    void drive(double seconds);

    /// What the phone's receiver would measure now, the strongest first.
    [[nodiscard]] const std::vector<C2KPilot>& pilots() const { return _pilots; }
    /// All that is received on the carriers of that system.
    [[nodiscard]] double received_dBm(int sid) const;
    [[nodiscard]] const RadioNetwork& radio() const { return _network; }

private:
    void measure();

    RadioNetwork _network;
    std::vector<C2KPilot> _pilots;
};

} // namespace velmora
