// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/UMTS/UMTSSet.h"

#include "LogGenerator/Extra/CellFields.h"
#include "Platform/SystemLog.h"
#include "Platform/TelephonyService.h"

namespace velmora {

namespace {

constexpr std::size_t rankedMinimumLength = 15; // 0x4005
// "GSM Set" reads other entries at the same place: which of the two counts is not zero tells what they are.
constexpr Where rankedCount = u8At(13);
static_assert(rankedCount.end() <= rankedMinimumLength);

constexpr Field rankedFields[] = {
    {"Scrambling Code", u16At(2), integer("%d")},
    {"RSCP", i8At(4), integer("%d dB", -21)},
    {"Energy Per Chip", i8At(7), real("%f dB", 0.5)},
    {"Downlink Frequency", i16At(0), integer("%d")}, // signed, although a channel number is not
    {"Ranking Value", i16At(8), integer("%d")},
    {"Rank Cell RSCP", i16At(5), integer("%d dB")},
};
constexpr Layout ranked = layout(10, rankedFields);

constexpr CellField knownFields[] = {
    {kVoxCellMonitorUARFCN, CellNumber::Low16, "UARFCN", integer("%d"),
     "UMTSSet: Failed to retrieve UARFCN\n"},
    {kVoxCellMonitorSCN, CellNumber::Low16, "Scrambling Code", integer("%d"),
     "UMTSSet: Failed to retrieve Scrambling Code\n"},
    {kVoxCellMonitorRSCP, CellNumber::SignedLow16, "RSCP", unless(levelNotMeasured, "", integer("%d dBm")),
     "UMTSSet: Failed to retrieve RSCP\n"},
    {kVoxCellMonitorECN0, CellNumber::SignedLow16, "Energy Per Chip",
     unless(levelNotMeasured, "", integer("%d dB")), "UMTSSet: Failed to retrieve Energy Per Chip\n"},
};
constexpr CellRows known = {{kVoxCellMonitorRadioAccessTechnologyUMTS, kVoxCellMonitorCellTypeNeighbor},
                            knownFields};

} // namespace

void UMTSSet::updateWithData(const Data& data, std::uint32_t logCode) {
    logLine(LogPriority::Warning, "UMTSSet");
    switch (logCode) {
    case 0x4005: showRankedCells(Record(data)); break;
    case 0xFF0001: showKnownCells(data); break;
    default: unknownLogMessage(logCode);
    }
}

void UMTSSet::showRankedCells(const Record& record) {
    if (record.size() < rankedMinimumLength)
        return;
    const CountedList entries(record, rankedMinimumLength, ranked.minimumLength,
                              static_cast<std::size_t>(rankedCount.read(record)));
    showRows(entries, ranked, 0x4005);
}

void UMTSSet::showKnownCells(const Data& data) {
    if (const std::vector<Cell>* cells = cellsOf(data))
        writeCellRows(array(), *cells, known, _knownCells);
    else
        clearElements();
}

} // namespace velmora
