// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/UMTS/UMTSSet.h"

#include "Platform/SystemLog.h"
#include "Platform/TelephonyService.h"

namespace velmora {

namespace {

constexpr std::size_t rankedMinimumLength = 15; // 0x4005
// "GSM Set" reads other entries at the same offset: the count that is not zero decides what they are.
constexpr Place rankedCount = u8At(13);
static_assert(rankedCount.end() <= rankedMinimumLength);

// UARFCN (3GPP TS 25.101 5.4.3), primary scrambling code (TS 25.213 5.2.2); CPICH RSCP and Ec/No are
// quantities of TS 25.215 on the modem's own scales, not the steps of TS 25.133 9.1.1.3 and 9.1.2.3.
constexpr Field rankedFields[] = {
    {"Scrambling Code",
     u16At(2),
     integer("%d"),
     {.role = Role::NeighbourPhysicalCell, .clause = "3GPP TS 25.213 5.2.2"}},
    {"RSCP",
     i8At(4),
     integer("%d dB", -21),
     {.role = Role::NeighbourLevel, .unit = Unit::DBm, .clause = "3GPP TS 25.215 5.1.1"}},
    {"Energy Per Chip",
     i8At(7),
     real("%f dB", 0.5),
     {.role = Role::NeighbourQuality, .clause = "3GPP TS 25.215 5.1.5"}},
    {"Downlink Frequency",
     i16At(0),
     integer("%d"),
     {.role = Role::NeighbourChannel,
      .sign = Sign::Unsigned,
      .clause = "3GPP TS 25.101 5.4.3"}}, // signed, although a channel number is not
    {"Ranking Value", i16At(8), integer("%d")},
    {"Rank Cell RSCP", i16At(5), integer("%d dB"), {.unit = Unit::DBm, .clause = "3GPP TS 25.215 5.1.1"}},
};
constexpr Layout ranked = layout(10, rankedFields);
constexpr Content rankedContents[] = {ranked};
constexpr std::string_view rankedKeys[] = {"Downlink Frequency", "Scrambling Code"};
constexpr List rows{.contents = rankedContents, .keys = rankedKeys};
constexpr Content contents[] = {rows};

CountedList rankedCells(const Record& record) {
    return CountedList(record, rankedMinimumLength, ranked.minimumLength,
                       static_cast<std::size_t>(rankedCount.read(record)));
}

// As the telephony service reports it.
constexpr CellField serviceFields[] = {
    {kVoxCellMonitorUARFCN,
     CellNumber::Low16,
     "UARFCN",
     integer("%d"),
     "UMTSSet: Failed to retrieve UARFCN\n",
     {.role = Role::NeighbourChannel, .clause = "3GPP TS 25.101 5.4.3"}},
    {kVoxCellMonitorSCN,
     CellNumber::Low16,
     "Scrambling Code",
     integer("%d"),
     "UMTSSet: Failed to retrieve Scrambling Code\n",
     {.role = Role::NeighbourPhysicalCell, .clause = "3GPP TS 25.213 5.2.2"}},
    {kVoxCellMonitorRSCP,
     CellNumber::SignedLow16,
     "RSCP",
     unless(levelNotMeasured, "", integer("%d dBm")),
     "UMTSSet: Failed to retrieve RSCP\n",
     {.role = Role::NeighbourLevel, .clause = "3GPP TS 25.215 5.1.1"}},
    {kVoxCellMonitorECN0,
     CellNumber::SignedLow16,
     "Energy Per Chip",
     unless(levelNotMeasured, "", integer("%d dB")),
     "UMTSSet: Failed to retrieve Energy Per Chip\n",
     {.role = Role::NeighbourQuality, .clause = "3GPP TS 25.215 5.1.5"}},
};
constexpr CellKind serviceKinds[] = {
    {kVoxCellMonitorRadioAccessTechnologyUMTS, kVoxCellMonitorCellTypeNeighbor},
};
constexpr std::string_view serviceKeys[] = {"UARFCN", "Scrambling Code"};
constexpr CellTable serviceCells{serviceKinds, CellTable::Shown::Rows, serviceFields, {.keys = serviceKeys}};
constexpr View sectionViews[] = {
    {0x4005, rankedMinimumLength, contents},
    cellInformation,
};

} // namespace

std::span<const View> UMTSSet::views() const {
    return sectionViews;
}

void UMTSSet::trace() const {
    logLine(LogPriority::Warning, "UMTSSet");
}

const CellTable& UMTSSet::cellTable() const {
    return serviceCells;
}

void UMTSSet::check(const View& view, const Record& record) const {
    reportMissingEntries(rankedCells(record), view.code);
}

void UMTSSet::decode(const View& view, const Record& record, FieldVisitor& visitor) const {
    if (view.code == cellInformation.code)
        CellSection::decode(view, record, visitor);
    else
        visitor.rows(rows, rankedCells(record), ranked);
}

} // namespace velmora
