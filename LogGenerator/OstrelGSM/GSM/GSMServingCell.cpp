// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/GSM/GSMServingCell.h"

#include "Platform/SystemLog.h"
#include "Platform/TelephonyService.h"

namespace velmora {

namespace {

// 0x5134: cell identity (3GPP TS 23.003 4.3.1), ARFCN (TS 45.005 2), BSIC (TS 23.003 4.3.2).
constexpr Field identityFields[] = {
    {"Cell ID",
     u16At(17),
     integer("%d"),
     {.role = Role::ServingCell, .identity = Identity::Location, .clause = "3GPP TS 23.003 4.3.1"}},
    {"ARFCN", u16At(13), integer("%d"), {.role = Role::ServingChannel, .clause = "3GPP TS 45.005 2"}},
    {"BSIC", u16At(15), integer("%d"), {.role = Role::ServingPhysicalCell, .clause = "3GPP TS 23.003 4.3.2"}},
};
constexpr Layout identity = layout(26, identityFields);

// 0x5137: C1 and C2 (3GPP TS 45.008 6.4), of which only the unsigned low halves are shown; the level is the
// modem's number without sign or offset, not RXLEV. "GSM RR Info" shows the same bytes otherwise, on purpose.
constexpr Field levelFields[] = {
    {"RSSI", u8At(15), integer("%d dBm"), {.role = Role::ServingLevel, .scale = negated}},
    {"C1 Value",
     u16At(16),
     integer("%d"),
     {.unit = Unit::DB, .sign = Sign::Signed, .clause = "3GPP TS 45.008 6.4"}},
    {"C2 Value",
     u16At(20),
     integer("%d"),
     {.unit = Unit::DB, .sign = Sign::Signed, .clause = "3GPP TS 45.008 6.4"}},
};
constexpr Layout levels = layout(29, levelFields);

// 0x5076: ARFCN (3GPP TS 45.005 2), only its low byte, on purpose: one above 255 shows modulo 256.
constexpr Field dedicatedFields[] = {
    {"MA Dedicated ARFCN", u8At(13), integer("%d")},
};
constexpr Layout dedicated = layout(17, dedicatedFields);

// As the telephony service reports it.
constexpr CellField cellFields[] = {
    {kVoxCellMonitorCellId,
     CellNumber::Whole,
     "Cell ID",
     integer("%d"),
     "GSMServingCell: Failed to retrieve Cell ID\n",
     {.role = Role::ServingCell, .identity = Identity::Location, .clause = "3GPP TS 23.003 4.3.1"}},
    {kVoxCellMonitorARFCN,
     CellNumber::Whole,
     "ARFCN",
     integer("%d"),
     "GSMServingCell: Failed to retrieve ARFCN\n",
     {.role = Role::ServingChannel, .clause = "3GPP TS 45.005 2"}},
};
constexpr CellKind cellKinds[] = {
    {kVoxCellMonitorRadioAccessTechnologyGSM, kVoxCellMonitorCellTypeServing},
};
constexpr CellTable servingCell{cellKinds, CellTable::Shown::First, cellFields};
constexpr View sectionViews[] = {
    {0x5134, identity},
    {0x5137, levels},
    {0x5076, dedicated},
    cellInformation,
};

} // namespace

std::span<const View> GSMServingCell::views() const {
    return sectionViews;
}

void GSMServingCell::trace() const {
    logLine(LogPriority::Warning, "GSMServingCell");
}

const CellTable& GSMServingCell::cellTable() const {
    return servingCell;
}

} // namespace velmora
