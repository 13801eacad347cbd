// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/UTRAN/UTRANServingCellInfo.h"

#include "Platform/SystemLog.h"
#include "Platform/TelephonyService.h"

namespace velmora {

namespace {

// 0xD0E2: cell identity (3GPP TS 25.331 10.3.2.2), UARFCN (TS 25.102 5.4.3), a byte of the URA identity (TS
// 25.331 10.3.2.6); access rights as the modem reports them.
constexpr Field cellFields[] = {
    {"Cell Access Restrictions", u8At(14), integer("%d")},
    {"Cell ID",
     i32At(21),
     integer("%d"),
     {.role = Role::ServingCell, .identity = Identity::Location, .clause = "3GPP TS 25.331 10.3.2.2"}},
    {"Downlink UARFCN",
     u16At(19),
     integer("%d"),
     {.role = Role::ServingChannel, .clause = "3GPP TS 25.102 5.4.3"}},
    {"Uplink UARFCN", u16At(17), integer("%d"), {.clause = "3GPP TS 25.102 5.4.3"}},
    {"URA ID",
     u8At(15),
     integer("%d"),
     {.identity = Identity::Location, .clause = "3GPP TS 25.331 10.3.2.6"}},
    {"Allowed Access", bitsAt(25, 0, 1), flag("Emergency Calls Only", "All Calls")},
};
constexpr Layout servingCell = layout(26, cellFields);

// As the telephony service reports it.
constexpr CellField serviceFields[] = {
    {kVoxCellMonitorLAC,
     CellNumber::Whole,
     "Local Area Code",
     integer("%d"),
     "Serving Cell Info: Failed to retrieve LAC\n",
     {.role = Role::ServingArea, .identity = Identity::Location, .clause = "3GPP TS 23.003 4.1"}},
    {kVoxCellMonitorCellId,
     CellNumber::Whole,
     "Cell ID",
     integer("%d"),
     "Serving Cell Info: Failed to retrieve Cell ID\n",
     {.role = Role::ServingCell, .identity = Identity::Location, .clause = "3GPP TS 25.331 10.3.2.2"}},
    {kVoxCellMonitorBandInfo, CellNumber::Whole, "Freq Band Indicator", integer("%d"),
     "Serving Cell Info: Failed to retrieve Freq Band Indicator\n"},
    {kVoxCellMonitorSCN,
     CellNumber::Whole,
     "Cell Scrambling Code",
     integer("%d"),
     "Serving Cell Info: Failed to retrieve Cell Scrambling Code\n",
     {.role = Role::ServingPhysicalCell, .clause = "3GPP TS 25.223"}},
    {kVoxCellMonitorUARFCN,
     CellNumber::Whole,
     "Uplink UARFCN",
     integer("%d"),
     "Serving Cell Info: Failed to retrieve UARFCN\n",
     {.clause = "3GPP TS 25.102 5.4.3"}},
    // The service reports one channel number, which is shown under both labels, on purpose.
    {kVoxCellMonitorUARFCN,
     CellNumber::Whole,
     "Downlink UARFCN",
     integer("%d"),
     "",
     {.role = Role::ServingChannel, .clause = "3GPP TS 25.102 5.4.3"}},
};
constexpr CellKind cellKinds[] = {
    {kVoxCellMonitorRadioAccessTechnologyUTRAN, kVoxCellMonitorCellTypeServing},
};
constexpr CellTable serviceCells{cellKinds, CellTable::Shown::Last, serviceFields};
constexpr View sectionViews[] = {
    {0xD0E2, servingCell},
    cellInformation,
};

} // namespace

std::span<const View> UTRANServingCellInfo::views() const {
    return sectionViews;
}

void UTRANServingCellInfo::trace() const {
    logLine(LogPriority::Warning, "Serving Cell Info");
}

const CellTable& UTRANServingCellInfo::cellTable() const {
    return serviceCells;
}

void UTRANServingCellInfo::unknownCode(std::uint32_t) const {}

void UTRANServingCellInfo::noCells() const {} // without the line that other sections write

} // namespace velmora
