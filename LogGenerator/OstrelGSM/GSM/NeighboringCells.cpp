// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/GSM/NeighboringCells.h"

#include "LogGenerator/Extra/CellFields.h"
#include "Platform/SystemLog.h"
#include "Platform/TelephonyService.h"

namespace velmora {

namespace {

constexpr std::size_t measuredMinimumLength = 29; // 0x5137
constexpr Field measuredFields[] = {
    {"ARFCN", u16At(0), integer("%d")},
    {"RSSI", u8At(2), integer("%d")}, // without a unit
    {"C1 Value", i32At(3), integer("%d")},
};
constexpr Layout measured = layout(14, measuredFields);
constexpr Where measuredARFCN = measuredFields[0].where;

constexpr std::size_t bsicMinimumLength = 15; // 0x51FF
constexpr std::size_t bsicEntryLength = 4;
constexpr Where bsicARFCN = u16At(0);
constexpr Where bsic = u8At(2);
static_assert(bsicARFCN.end() <= bsicEntryLength && bsic.end() <= bsicEntryLength);

// Twice the telephony service's number is the level in dBm.
constexpr CellField knownFields[] = {
    {kVoxCellMonitorARFCN, CellNumber::Low16, "ARFCN", integer("%d"),
     "NeighboringCells: Failed to retrieve ARFCN\n"},
    {kVoxCellMonitorRSSI, CellNumber::SignedLow16, "RSSI",
     unless(levelNotMeasured, "", integer("%d dBm", 0, 2)), "NeighboringCells: Failed to retrieve RSSI\n"},
};

constexpr CellRows known = {{kVoxCellMonitorRadioAccessTechnologyGSM, kVoxCellMonitorCellTypeNeighbor},
                            knownFields};

/// `bytes`: the number of cells, the entries of 0x5137, then those of 0x51FF.
void fill(Array& rows, const Record& bytes) {
    const CountedList cells(bytes, 1, measured.minimumLength, bytes.u8(0));
    const std::size_t behind = 1 + cells.count() * measured.minimumLength;
    const CountedList bsics(bytes, behind, bsicEntryLength, (bytes.size() - behind) / bsicEntryLength);
    for (std::size_t i = 0; i < cells.count(); ++i) {
        Dictionary& row = rows.appendRow();
        writeFields(row, cells[i], measured);
        // Of an ARFCN that stands there twice, the later one counts.
        for (std::size_t j = bsics.count(); j-- > 0;)
            if (bsicARFCN.read(bsics[j]) == measuredARFCN.read(cells[i])) {
                writeValue(row, "BSIC", integer("%d"), bsic.read(bsics[j]));
                break;
            }
    }
}

} // namespace

void NeighboringCells::updateWithData(const Data& data, std::uint32_t logCode) {
    logLine(LogPriority::Warning, "NeighboringCells");
    const Record record(data);
    switch (logCode) {
    case 0x5137: showMeasuredCells(record); break;
    case 0x51FF: keepBSICs(record); break;
    case 0xFF0001: showKnownCells(data); break;
    default: unknownLogMessage(logCode);
    }
}

void NeighboringCells::showMeasuredCells(const Record& record) {
    if (record.size() < measuredMinimumLength)
        return;
    const CountedList entries(record, measuredMinimumLength, measured.minimumLength, record.u8(28));
    reportMissingEntries(entries, 0x5137);
    // The BSICs as they are known now go with the cells.
    const Bytes cells = entries.entries().bytes();
    _measuredCells.assign(1, static_cast<std::uint8_t>(entries.whole()));
    _measuredCells.insert(_measuredCells.end(), cells.begin(), cells.end());
    _measuredCells.insert(_measuredCells.end(), arfcnToBsic.begin(), arfcnToBsic.end());
    showElementsWith<fill>(Record(Bytes(_measuredCells)));
}

void NeighboringCells::keepBSICs(const Record& record) {
    if (record.size() < bsicMinimumLength)
        return;
    const CountedList entries(record, bsicMinimumLength, bsicEntryLength, record.u8(14));
    reportMissingEntries(entries, 0x51FF);
    const Bytes kept = entries.entries().bytes();
    arfcnToBsic.assign(kept.begin(), kept.end());
}

void NeighboringCells::showKnownCells(const Data& data) {
    if (const std::vector<Cell>* cells = cellsOf(data))
        writeCellRows(array(), *cells, known, _knownCells);
    else
        clearElements();
}

} // namespace velmora
