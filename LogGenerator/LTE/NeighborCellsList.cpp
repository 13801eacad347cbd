// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LTE/NeighborCellsList.h"

#include "LogGenerator/LTE/Records.h"
#include "Platform/SystemLog.h"

namespace velmora {

using LTE::NeighborRecord;

namespace {

constexpr Place physicalCellID = bitsAt(0, 0, 9);

// Physical cell identity (3GPP TS 36.211 6.11), RSRP, RSRQ and RSSI (quantities of TS 36.214), Srxlev (TS
// 36.304 5.2.3.2), all on the modem's own scales. On purpose, both antennas are read from the same bits, and
// an RSRP step is half a decibel, twice the serving cell's.
constexpr Field cellFields[] = {
    {"Physical Cell ID",
     physicalCellID,
     integer("%d"),
     {.role = Role::NeighbourPhysicalCell, .clause = "3GPP TS 36.211 6.11"}},
    {"Measured RSSI", bitsAt(1, 1, 8), real("%4.2f dBm", 0.5, -140), {.clause = "3GPP TS 36.214 5.1.3"}},
    {"Measured RSRP",
     bitsAt(2, 1, 9),
     real("%4.2f dBm", 0.5, -140),
     {.role = Role::NeighbourLevel, .clause = "3GPP TS 36.214 5.1.1"}},
    {"Average RSRP", bitsAt(4, 0, 9), real("%4.2f dBm", 0.5, -140), {.clause = "3GPP TS 36.214 5.1.1"}},
    {"Measured RSRQ",
     bitsAt(5, 1, 7),
     real("%4.2f dB", 0.25, -30),
     {.role = Role::NeighbourQuality, .clause = "3GPP TS 36.214 5.1.3"}},
    {"Average RSRQ", bitsAt(6, 0, 7), real("%4.2f dB", 0.25, -30), {.clause = "3GPP TS 36.214 5.1.3"}},
    {"Srxlev",
     bitsAt(6, 7, 7),
     integer("%d dBm", -30),
     {.unit = Unit::DB, .clause = "3GPP TS 36.304 5.2.3.2"}},
    {"Frequency Offset", u16At(8), integer("%d")},
    {"Ant 0 Frame Offset", bitsAt(12, 0, 11), integer("%d")},
    {"Ant 0 Sample Offset", bitsAt(13, 3, 19), integer("%d")},
    {"Ant 1 Frame Offset", bitsAt(12, 0, 11), integer("%d")},
    {"Ant 1 Sample Offset", bitsAt(13, 3, 19), integer("%d")},
};
constexpr Layout cell = layout(NeighborRecord::cellLength, cellFields);
constexpr Content cellContents[] = {cell};
constexpr std::string_view cellKeys[] = {"Physical Cell ID"};
constexpr List rows{.contents = cellContents, .keys = cellKeys};
constexpr Content contents[] = {rows};

void traceCell(const Record& entry) {
    logFormat(LogPriority::Warning, "Physical Cell ID: %d\n", static_cast<int>(physicalCellID.read(entry)));
    for (const Field& field : cell.fields)
        if (field.format.kind == TextFormat::Kind::Real) {
            // One text for all five, on purpose.
            const auto raw = static_cast<double>(field.place.read(entry));
            logFormat(LogPriority::Warning, "Measured RSSI: %lf\n",
                      raw * field.format.scale + field.format.offset);
        }
}

constexpr View sectionViews[] = {{NeighborRecord::code, NeighborRecord::minimumLength, contents}};

} // namespace

std::span<const View> NeighborCellsList::views() const {
    return sectionViews;
}

void NeighborCellsList::check(const View& view, const Record& record) const {
    const NeighborRecord measurement(record);
    const CountedList& cells = measurement.cells();
    logFormat(LogPriority::Warning, "Number of neighboring cells being reported: %d\n",
              static_cast<int>(cells.count()));
    if (isLogged(LogPriority::Warning))
        for (std::size_t i = 0; i < cells.completeCount(); ++i)
            traceCell(cells[i]);
    reportMissingEntries(cells, view.code);
}

void NeighborCellsList::decode(const View&, const Record& record, FieldVisitor& visitor) const {
    visitor.rows(rows, NeighborRecord(record).cells(), cell);
}

} // namespace velmora
