// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/GSM/NeighboringCells.h"

#include "Platform/SystemLog.h"
#include "Platform/TelephonyService.h"

namespace velmora {

namespace {

constexpr std::uint32_t measuredCode = 0x5137;
constexpr std::size_t measuredMinimumLength = 29;
// ARFCN (3GPP TS 45.005 2), C1 (TS 45.008 6.4); the level is the modem's number, not RXLEV.
constexpr Field measuredFields[] = {
    {"ARFCN", u16At(0), integer("%d"), {.role = Role::NeighbourChannel, .clause = "3GPP TS 45.005 2"}},
    {"RSSI",
     u8At(2),
     integer("%d"),
     {.role = Role::NeighbourLevel, .unit = Unit::DBm, .scale = negated}}, // without a unit
    {"C1 Value", i32At(3), integer("%d"), {.unit = Unit::DB, .clause = "3GPP TS 45.008 6.4"}},
};
constexpr Layout measured = layout(14, measuredFields);
constexpr Place measuredARFCN = measuredFields[0].place;

// 0x51FF: the BSIC (3GPP TS 23.003 4.3.2) of an ARFCN. It is shown with the cells of 0x5137, whose records do
// not hold it.
constexpr std::size_t bsicMinimumLength = 15;
constexpr std::size_t bsicEntryLength = 4;
constexpr Place bsicARFCN = u16At(0);
constexpr Place bsicOfARFCN = u8At(2);
constexpr Field bsic{
    "BSIC", computed, integer("%d"), {.role = Role::NeighbourPhysicalCell, .clause = "3GPP TS 23.003 4.3.2"}};
static_assert(bsicARFCN.end() <= bsicEntryLength && bsicOfARFCN.end() <= bsicEntryLength);

// As the telephony service reports it: twice its number is the level in dBm.
constexpr CellField serviceFields[] = {
    {kVoxCellMonitorARFCN,
     CellNumber::Low16,
     "ARFCN",
     integer("%d"),
     "NeighboringCells: Failed to retrieve ARFCN\n",
     {.role = Role::NeighbourChannel, .clause = "3GPP TS 45.005 2"}},
    {kVoxCellMonitorRSSI,
     CellNumber::SignedLow16,
     "RSSI",
     unless(levelNotMeasured, "", integer("%d dBm", 0, 2)),
     "NeighboringCells: Failed to retrieve RSSI\n",
     {.role = Role::NeighbourLevel}},
};

constexpr CellKind serviceKinds[] = {
    {kVoxCellMonitorRadioAccessTechnologyGSM, kVoxCellMonitorCellTypeNeighbor},
};
constexpr std::string_view serviceKeys[] = {"ARFCN"};
constexpr CellTable serviceCells{serviceKinds, CellTable::Shown::Rows, serviceFields, {.keys = serviceKeys}};

constexpr Content cellContents[] = {measured, bsic};
constexpr std::string_view cellKeys[] = {"ARFCN", "BSIC"};
constexpr List rows{.contents = cellContents, .keys = cellKeys};
constexpr Content contents[] = {rows};

CountedList measuredCells(const Record& record) {
    return CountedList(record, measuredMinimumLength, measured.minimumLength, record.u8(28));
}

CountedList bsics(const Record& record) {
    return CountedList(record, bsicMinimumLength, bsicEntryLength, record.u8(14));
}

/// What `bsics` returned for an earlier record.
CountedList bsicEntries(Bytes entries) {
    return CountedList(Record(entries), 0, bsicEntryLength, entries.size() / bsicEntryLength);
}
constexpr View sectionViews[] = {
    {measuredCode, measuredMinimumLength, contents},
    {0x51FF, bsicMinimumLength},
    cellInformation,
};

} // namespace

std::span<const View> NeighboringCells::views() const {
    return sectionViews;
}

void NeighboringCells::trace() const {
    logLine(LogPriority::Warning, "NeighboringCells");
}

const CellTable& NeighboringCells::cellTable() const {
    return serviceCells;
}

void NeighboringCells::check(const View& view, const Record& record) const {
    reportMissingEntries(view.code == measuredCode ? measuredCells(record) : bsics(record), view.code);
}

void NeighboringCells::updateWithData(const Data& data, std::uint32_t logCode) {
    const Record record(data);
    const View* const view = viewOf(logCode);
    if (!view || view->code == cellInformation.code || record.size() < view->minimumLength) {
        CellSection::updateWithData(data, logCode);
        return;
    }
    trace();
    check(*view, record);
    if (view->code == measuredCode) {
        // The current BSICs are kept with the cells.
        keep(*view, record, 1, [this] { _bsicsOfCells = arfcnToBsic; });
    } else {
        const Bytes kept = bsics(record).entries().bytes();
        arfcnToBsic.assign(kept.begin(), kept.end());
    }
}

Value NeighboringCells::memory() const {
    return arfcnToBsic.empty() ? Value() : Value(Data::copyOf(arfcnToBsic));
}

void NeighboringCells::setMemory(const Value& memory) {
    const Bytes bytes = memory.asData() ? memory.asData()->bytes() : Bytes();
    arfcnToBsic.assign(bytes.begin(), bytes.end());
}

void NeighboringCells::decode(const View& view, const Record& record, FieldVisitor& visitor) const {
    if (view.code == cellInformation.code) {
        CellSection::decode(view, record, visitor);
        return;
    }
    const CountedList cells = measuredCells(record);
    const CountedList knownBSICs = bsicEntries(_bsicsOfCells);
    visitor.beginList(rows);
    for (std::size_t i = 0; i < cells.completeCount(); ++i) {
        visitor.beginRow();
        visitor.fields(cells[i], measured);
        // Of an ARFCN that is listed twice, the later entry counts.
        for (std::size_t j = knownBSICs.count(); j-- > 0;)
            if (bsicARFCN.read(knownBSICs[j]) == measuredARFCN.read(cells[i])) {
                visitor.number(bsic, bsicOfARFCN.read(knownBSICs[j]));
                break;
            }
        visitor.endRow();
    }
    visitor.endList();
}

} // namespace velmora
