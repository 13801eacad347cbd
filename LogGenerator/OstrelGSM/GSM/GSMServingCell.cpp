// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/GSM/GSMServingCell.h"

#include "LogGenerator/Extra/CellFields.h"
#include "Platform/SystemLog.h"
#include "Platform/TelephonyService.h"

namespace velmora {

namespace {

constexpr Field identityFields[] = {
    {"Cell ID", u16At(17), integer("%d")},
    {"ARFCN", u16At(13), integer("%d")},
    {"BSIC", u16At(15), integer("%d")},
};
constexpr Layout identity = layout(26, identityFields); // 0x5134

// The level is shown without sign or offset, and of C1 and C2 only the unsigned low halves; "GSM RR Info"
// shows the same bytes otherwise. Both readings are meant.
constexpr Field levelFields[] = {
    {"RSSI", u8At(15), integer("%d dBm")},
    {"C1 Value", u16At(16), integer("%d")},
    {"C2 Value", u16At(20), integer("%d")},
};
constexpr Layout levels = layout(29, levelFields); // 0x5137

// Only the low byte of the channel number, on purpose: one above 255 shows modulo 256.
constexpr Field dedicatedFields[] = {
    {"MA Dedicated ARFCN", u8At(13), integer("%d")},
};
constexpr Layout dedicated = layout(17, dedicatedFields); // 0x5076

constexpr CellField cellFields[] = {
    {kVoxCellMonitorCellId, CellNumber::Whole, "Cell ID", integer("%d"),
     "GSMServingCell: Failed to retrieve Cell ID\n"},
    {kVoxCellMonitorARFCN, CellNumber::Whole, "ARFCN", integer("%d"),
     "GSMServingCell: Failed to retrieve ARFCN\n"},
};

} // namespace

void GSMServingCell::updateWithData(const Data& data, std::uint32_t logCode) {
    logLine(LogPriority::Warning, "GSMServingCell");
    const Record record(data);
    switch (logCode) {
    case 0x5134: show(record, identity); break;
    case 0x5137: show(record, levels); break;
    case 0x5076: show(record, dedicated); break;
    case 0xFF0001: showServingCell(data); break;
    default: unknownLogMessage(logCode);
    }
}

void GSMServingCell::showServingCell(const Data& data) {
    const std::vector<Cell>* cells = cellsOf(data);
    if (!cells)
        return;
    if (const Cell* cell =
            firstCell(*cells, {kVoxCellMonitorRadioAccessTechnologyGSM, kVoxCellMonitorCellTypeServing}))
        writeCellFields(dictionary(), *cell, cellFields);
}

} // namespace velmora
