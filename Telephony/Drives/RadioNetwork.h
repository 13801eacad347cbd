// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/ScenarioRandom.h"

#include <vector>

namespace velmora {

/// A network's identity. 001/01 and 001/02 are test networks: no operator has them.
struct PLMN {
    int mcc = 1;
    int mnc = 1;
    friend bool operator==(const PLMN&, const PLMN&) = default;
};

/// The areas of a cell of any radio technology.
struct CellArea {
    PLMN plmn;
    int lac = 0;
    int rac = 0;
    friend bool operator==(const CellArea&, const CellArea&) = default;
};

struct GSMCell {
    int arfcn = 0; ///< 1-124 in the 900 MHz band, 512-885 in the 1800 MHz band
    int bsic = 0;  ///< 0-63
    int cellId = 0;
    CellArea area;
};

struct UMTSCell {
    int uarfcn = 0;         ///< downlink, 10562-10838
    int scramblingCode = 0; ///< 0-511
    int cellId = 0;         ///< 28 bits: RNC and cell
    CellArea area;
};

struct GSMMeasurement {
    const GSMCell* cell = nullptr;
    int rssi_dBm = -110;
};

struct UMTSMeasurement {
    const UMTSCell* cell = nullptr;
    int rscp_dBm = -120;
    double ecno_dB = -24;
};

/// Base stations along a ring road and a car that drives round it: twelve sites of three sectors, GSM 900 and
/// UMTS on each and GSM 1800 on every third; two location areas of network 001/01 and one of 001/02. Levels
/// follow from transmit power, distance, sector pattern and slow fading, which changes as the car moves.
/// Depends only on the seed and the steps driven.
class RadioNetwork {
public:
    explicit RadioNetwork(std::uint64_t seed);
    // The measurements point into the network.
    RadioNetwork(const RadioNetwork&) = delete;
    RadioNetwork& operator=(const RadioNetwork&) = delete;

    /// Drives on for that many seconds.
    void drive(double seconds);

    /// What the phone's receiver would measure now, the best first; only cells above its sensitivity.
    [[nodiscard]] const std::vector<GSMMeasurement>& gsm() const { return _gsm; }
    [[nodiscard]] const std::vector<UMTSMeasurement>& umts() const { return _umts; }
    /// The total power received on the best UMTS cell's carrier.
    [[nodiscard]] double umtsRSSI_dBm() const { return _umtsRSSI_dBm; }
    /// Where the car is, from the centre of the ring.
    [[nodiscard]] double east_m() const { return _x_m; }
    [[nodiscard]] double north_m() const { return _y_m; }

private:
    struct Sector {
        double azimuth = 0; ///< radians
        std::vector<GSMCell> gsm;
        UMTSCell umts;
    };
    struct Site {
        double x_m = 0, y_m = 0;
        double fading_dB = 0;
        std::vector<Sector> sectors;
    };

    void build();
    void measure();
    [[nodiscard]] double pathGain_dB(const Site& site, const Sector& sector, double lossAt1km_dB) const;

    ScenarioRandom _random;
    std::vector<Site> _sites;
    double _angle = 0;      ///< where the car is on the ring, radians
    double _speed_mps = 13; ///< 0-23
    double _x_m = 0, _y_m = 0;
    std::vector<GSMMeasurement> _gsm;
    std::vector<UMTSMeasurement> _umts;
    double _umtsRSSI_dBm = -105;
};

} // namespace velmora
