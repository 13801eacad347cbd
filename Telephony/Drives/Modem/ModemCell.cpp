// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/Modem/ModemCell.h"

#include <algorithm>
#include <cmath>

namespace velmora {
namespace {

using Radio = ModemCell::Radio;

constexpr double lteLoad = 0.5; ///< of every cell of LTENetwork
constexpr int elementsPerBlock = 12;

double tenths(double value) {
    return std::round(10 * value) / 10;
}

/// From level and quality, which have the power of a whole resource block.
double sinrOf(const LTEMeasurement& cell) {
    const double own_mW = std::pow(10.0, cell.rsrp_dBm / 10);
    const double element_mW = std::pow(10.0, (cell.rsrp_dBm - cell.rsrq_dB) / 10) / elementsPerBlock;
    const double others_mW = std::max(element_mW - lteLoad * own_mW, own_mW / 10'000);
    return std::clamp(10 * std::log10(own_mW / others_mW), -20.0, 40.0);
}

/// 3GPP TS 36.101, table 5.6-1.
int lteBandwidth_kHz(int resourceBlocks) {
    return resourceBlocks == 6 ? 1400 : resourceBlocks * 200;
}

ModemCell gsmCell(const GSMMeasurement& each) {
    ModemCell cell{Radio::GSM, each.cell->area, each.cell->cellId, each.cell->arfcn, each.cell->bsic};
    cell.level_dBm = each.rssi_dBm;
    return cell;
}

ModemCell umtsCell(const UMTSMeasurement& each, double rssi_dBm) {
    ModemCell cell{Radio::UMTS, each.cell->area, each.cell->cellId, each.cell->uarfcn,
                   each.cell->scramblingCode};
    cell.level_dBm = each.rscp_dBm;
    cell.quality_dB = each.ecno_dB;
    cell.rssi_dBm = tenths(rssi_dBm);
    return cell;
}

ModemCell lteCell(const LTEMeasurement& each) {
    const LTECarrier& carrier = lteCarriers[each.cell.carrier];
    ModemCell cell{Radio::LTE, each.cell.area, each.cell.identity, carrier.downlink, each.cell.physicalId};
    cell.level_dBm = tenths(each.rsrp_dBm);
    cell.quality_dB = tenths(each.rsrq_dB);
    cell.sinr_dB = tenths(sinrOf(each));
    cell.rssi_dBm = tenths(each.rssi_dBm);
    cell.bandwidth_kHz = lteBandwidth_kHz(carrier.resourceBlocks);
    return cell;
}

ModemCell nrCell(const NRMeasurement& each) {
    const NRCarrier& carrier = nrCarriers[each.cell.carrier];
    ModemCell cell{Radio::NR, each.cell.area, each.cell.identity, carrier.channel, each.cell.physicalId};
    cell.level_dBm = tenths(each.rsrp_dBm);
    cell.quality_dB = tenths(each.rsrq_dB);
    cell.sinr_dB = tenths(each.sinr_dB);
    cell.bandwidth_kHz = carrier.bandwidth_kHz;
    return cell;
}

} // namespace

std::vector<ModemCell> cellsOf(const NRNetwork& network, Radio radio, std::size_t carrier) {
    std::vector<ModemCell> cells;
    switch (radio) {
    case Radio::GSM:
        for (const GSMMeasurement& each : network.radio().gsm())
            cells.push_back(gsmCell(each));
        break;
    case Radio::UMTS:
        for (const UMTSMeasurement& each : network.radio().umts())
            cells.push_back(umtsCell(each, network.radio().umtsRSSI_dBm()));
        break;
    case Radio::LTE:
        for (const LTEMeasurement& each : network.lte().cells(carrier))
            cells.push_back(lteCell(each));
        break;
    case Radio::NR:
        for (const NRMeasurement& each : network.cells(carrier))
            cells.push_back(nrCell(each));
        break;
    }
    return cells;
}

int timingAdvanceOf(const ModemCell& cell) {
    // What arrives at 1 km, and the way there and back that a step means: a bit of GSM, 16 samples of LTE.
    const bool isGSM = cell.radio == Radio::GSM;
    const double levelAt1km_dBm = isGSM ? -81 : -108;
    const double step_km = isGSM ? 0.554 : 0.078;
    const double distance_km = std::pow(10.0, (levelAt1km_dBm - cell.level_dBm) / 37.6);
    return static_cast<int>(std::clamp(distance_km / step_km, 0.0, isGSM ? 63.0 : 1282.0));
}

} // namespace velmora
