#include "LogGenerator/OstrelGSM/NeighboringCells.h"

#include "LogGenerator/CellFields.h"
#include "LogGenerator/ExtraPayload.h"
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
    clearElements();
    const CountedList entries(record, measuredMinimumLength, measured.minimumLength, record.u8(28));
    if (entries.count() == 0)
        return;
    const Array cells = rows(entries, measured, 0x5137);
    for (const Value& cell : cells) {
        Dictionary& row = *cell.asDictionary();
        if (const Value* known = arfcnToBsic.find(*row["ARFCN"].asString()))
            row.set("BSIC", *known);
    }
    replaceElements(cells);
}

void NeighboringCells::keepBSICs(const Record& record) {
    if (record.size() < bsicMinimumLength)
        return;
    arfcnToBsic = Dictionary();
    const CountedList entries(record, bsicMinimumLength, bsicEntryLength, record.u8(14));
    reportMissingEntries(entries, 0x51FF);
    for (std::size_t i = 0; i < entries.whole(); ++i)
        writeValue(arfcnToBsic, NumberText("%d", bsicARFCN.read(entries[i])).text(), integer("%d"),
                   bsic.read(entries[i]));
}

void NeighboringCells::showKnownCells(const Data& data) {
    const CellInfoArrayReader reader(data);
    clearElements(); // before the cells are looked at: where there are none to be had, the list stays empty
    const Array* cells = reader.cells();
    if (!cells)
        return;
    Array known;
    for (const Value& cell : *cells) {
        if (!isCell(cell, kVoxCellMonitorRadioAccessTechnologyGSM, kVoxCellMonitorCellTypeNeighbor))
            continue;
        const DictionaryRef row = makeDictionary();
        writeCellFields(row.get(), *cell.asDictionary(), knownFields);
        known.append(row); // even one without a field
    }
    replaceElements(known);
}

} // namespace velmora
