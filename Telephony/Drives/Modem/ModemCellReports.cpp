// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/Modem/ModemCellReports.h"

#include "Platform/TelephonyService.h"
#include "Telephony/Drives/Modem/ModemMessage.h"

#include <algorithm>
#include <limits>
#include <memory>

namespace velmora::modemReports {
namespace {

using Radio = ModemCell::Radio;
using namespace records;

std::string_view technologyOf(Radio radio) {
    switch (radio) {
    case Radio::GSM: return kVoxCellMonitorRadioAccessTechnologyGSM;
    case Radio::UMTS: return kVoxCellMonitorRadioAccessTechnologyUMTS;
    case Radio::LTE: return kVoxCellMonitorRadioAccessTechnologyLTE;
    case Radio::NR: return kVoxCellMonitorRadioAccessTechnologyNR;
    }
    return {};
}

void addIdentity(Dictionary& cell, const ModemCell& each) {
    cell.set(kVoxCellMonitorMCC, each.area.plmn.mcc);
    cell.set(kVoxCellMonitorMNC, each.area.plmn.mnc);
    cell.set(kVoxCellMonitorMNCDigits, 2);
    const bool isTracking = each.radio == Radio::LTE || each.radio == Radio::NR;
    cell.set(isTracking ? kVoxCellMonitorTAC : kVoxCellMonitorLAC, each.area.lac);
    cell.set(kVoxCellMonitorCellId, each.identity);
}

void addMeasurement(Dictionary& cell, const ModemCell& each) {
    switch (each.radio) {
    case Radio::GSM:
        cell.set(kVoxCellMonitorARFCN, each.channel);
        cell.set(kVoxCellMonitorBSIC, each.physical);
        cell.set(kVoxCellMonitorRSSI, each.level_dBm);
        break;
    case Radio::UMTS:
        cell.set(kVoxCellMonitorUARFCN, each.channel);
        cell.set(kVoxCellMonitorSCN, each.physical);
        cell.set(kVoxCellMonitorRSCP, each.level_dBm);
        cell.set(kVoxCellMonitorECN0, each.quality_dB);
        break;
    case Radio::LTE:
    case Radio::NR:
        cell.set(each.radio == Radio::LTE ? kVoxCellMonitorEARFCN : kVoxCellMonitorNRARFCN, each.channel);
        cell.set(kVoxCellMonitorPID, each.physical);
        cell.set(kVoxCellMonitorRSRP, each.level_dBm);
        cell.set(kVoxCellMonitorRSRQ, each.quality_dB);
        break;
    }
}

DictionaryRef cellOf(const ModemCell& each, std::string_view type) {
    const auto cell = std::make_shared<Dictionary>();
    cell->set(kVoxCellMonitorCellRadioAccessTechnology, technologyOf(each.radio));
    cell->set(kVoxCellMonitorCellType, type);
    return cell;
}

/// Of the cell that 5G non-standalone adds, a modem knows no identity.
Value servingCell(const ModemCell& each, bool isSecondary, bool isPlaceOnly) {
    const DictionaryRef cell = cellOf(each, kVoxCellMonitorCellTypeServing);
    if (!isSecondary)
        addIdentity(*cell, each);
    if (isPlaceOnly) {
        cell->set(kVoxCellMonitorIsPlace, true);
        return Value(cell);
    }
    addMeasurement(*cell, each);
    if (each.sinr_dB)
        cell->set(kVoxCellMonitorSINR, *each.sinr_dB);
    if (each.bandwidth_kHz > 0)
        cell->set(kVoxCellMonitorBandwidth, each.bandwidth_kHz);
    if (each.radio == Radio::UMTS || each.radio == Radio::LTE)
        cell->set(kVoxCellMonitorRSSI, each.rssi_dBm);
    if (each.radio == Radio::GSM || each.radio == Radio::LTE)
        cell->set(kVoxCellMonitorTimingAdvance, timingAdvanceOf(each));
    return Value(cell);
}

/// GSM neighbours have read their broadcast; of the others the modem knows what it measured.
Value neighborCell(const ModemCell& each) {
    const DictionaryRef cell = cellOf(each, kVoxCellMonitorCellTypeNeighbor);
    if (each.radio == Radio::GSM)
        addIdentity(*cell, each);
    addMeasurement(*cell, each);
    return Value(cell);
}

/// The best cells of that technology and carrier but the serving ones.
void addNeighbors(std::vector<ModemCell>& cells, const ModemReportContext& context, Radio radio,
                  std::size_t carrier, std::size_t limit) {
    const ModemPhone& phone = context.phone;
    for (const ModemCell& each : cellsOf(context.network, radio, carrier)) {
        const bool isServing = (phone.serving && each.isSameCellAs(*phone.serving)) ||
                               (phone.secondary && each.isSameCellAs(*phone.secondary));
        if (isServing)
            continue;
        if (limit-- == 0)
            return;
        cells.push_back(each);
    }
}

/// Those that a modem of that technology measures, by falling level.
std::vector<ModemCell> neighbors(const ModemReportContext& context) {
    const ModemPhone& phone = context.phone;
    std::vector<ModemCell> cells;
    // Another carrier in every second report.
    const std::size_t other = phone.carrier + 1 + context.cellReports % 2;
    switch (phone.radio) {
    case Radio::GSM:
        addNeighbors(cells, context, Radio::GSM, 0, 6);
        addNeighbors(cells, context, Radio::UMTS, 0, 2);
        break;
    case Radio::UMTS:
        addNeighbors(cells, context, Radio::UMTS, 0, 6);
        addNeighbors(cells, context, Radio::GSM, 0, 2);
        break;
    case Radio::LTE:
        addNeighbors(cells, context, Radio::LTE, phone.carrier, 5);
        addNeighbors(cells, context, Radio::LTE, other % lteCarriers.size(), 2);
        addNeighbors(cells, context, Radio::UMTS, 0, 1);
        if (phone.hasSecondary)
            addNeighbors(cells, context, Radio::NR, 0, 2);
        break;
    case Radio::NR:
        addNeighbors(cells, context, Radio::NR, phone.carrier, 5);
        addNeighbors(cells, context, Radio::NR, other % nrCarriers.size(), 1);
        addNeighbors(cells, context, Radio::LTE, 0, 2);
        break;
    }
    std::stable_sort(cells.begin(), cells.end(),
                     [](const ModemCell& a, const ModemCell& b) { return a.level_dBm > b.level_dBm; });
    return cells;
}

} // namespace

std::optional<RecordBuilder> cells(ModemReportContext& context) {
    ++context.cellReports;
    const ModemPhone& phone = context.phone;
    const DictionaryRef account = modemAccount(phone);
    if (!phone.isPresent())
        return modemMessage(LiveModemCode::cells, account);
    account->set(kVoxModemCellReport, static_cast<std::int64_t>(phone.cellReport));
    const bool isReported = phone.cellReport == ModemCellReport::Reported;
    if (isReported)
        account->set(kVoxModemNeighborReport, static_cast<std::int64_t>(phone.neighborReport));
    const ArrayRef list = makeArray();
    if (phone.serving && (isReported || phone.isPlaceOnly))
        list->append(servingCell(*phone.serving, false, phone.isPlaceOnly));
    if (phone.secondary && isReported)
        list->append(servingCell(*phone.secondary, true, false));
    if (phone.serving && isReported && phone.neighborReport == ModemCellReport::Reported)
        for (const ModemCell& each : neighbors(context))
            list->append(neighborCell(each));
    account->set(kVoxCellMonitorCells, Value(list));
    return modemMessage(LiveModemCode::cells, account);
}

RecordBuilder unreasonableCells(const ModemPhone& phone) {
    const DictionaryRef account = modemAccount(phone);
    account->set(kVoxModemCellReport, "0");
    const ArrayRef list = makeArray();
    list->append("not a cell");
    list->append(std::make_shared<Dictionary>(Dictionary{
        {std::string(kVoxCellMonitorCellRadioAccessTechnology), kVoxCellMonitorRadioAccessTechnologyLTE},
        {std::string(kVoxCellMonitorCellType), kVoxCellMonitorCellTypeServing},
        {std::string(kVoxCellMonitorMCC), 1000},
        {std::string(kVoxCellMonitorMNC), "01"},
        {std::string(kVoxCellMonitorTAC), 0xFFFE},
        {std::string(kVoxCellMonitorCellId), 0x7FFFFFFF},
        {std::string(kVoxCellMonitorEARFCN), -1},
        {std::string(kVoxCellMonitorPID), 504},
        {std::string(kVoxCellMonitorRSRP), std::numeric_limits<double>::quiet_NaN()},
        {std::string(kVoxCellMonitorRSRQ), -32768.0},
    }));
    list->append(std::make_shared<Dictionary>(
        Dictionary{{std::string(kVoxCellMonitorCellRadioAccessTechnology), "another technology"}}));
    account->set(kVoxCellMonitorCells, Value(list));
    return modemMessage(LiveModemCode::cells, account);
}

} // namespace velmora::modemReports
