// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LTE/LTEServingCellInfo.h"

#include "Platform/SystemLog.h"
#include "Platform/TelephonyService.h"

namespace velmora {

namespace {

/// By the number of resource blocks (3GPP TS 36.101 5.6).
constexpr EnumText bandwidthRows[] = {
    {6, "1.4 MHz"}, {15, "3 MHz"}, {25, "5 MHz"}, {50, "10 MHz"}, {75, "15 MHz"}, {100, "20 MHz"},
};
constexpr EnumTexts bandwidths(bandwidthRows, "Unknown");

// As the modem reports it.
constexpr Field antennaFields[] = {
    {"Num Tx Antennas", u8At(20), integer("%d")},
};
constexpr Layout antennas = layout(22, antennaFields);
constexpr std::uint32_t antennaCode = 0xB0C1;

// Physical cell identity (3GPP TS 36.211 6.11), EARFCN and band (TS 36.101 5.7.3, 5.5), cell identity and TAC
// (TS 23.003 19.6, 19.4.2.3).
constexpr std::uint32_t cellCode = 0xB0C2;
constexpr std::size_t cellMinimumLength = 38;
constexpr Field carrierFields[] = {
    {"Physical Cell ID",
     u16At(14),
     integer("%d"),
     {.role = Role::ServingPhysicalCell, .clause = "3GPP TS 36.211 6.11"}},
    {"Download Frequency",
     u16At(16),
     integer("%d"),
     {.role = Role::ServingChannel, .clause = "3GPP TS 36.101 5.7.3"}},
    {"Upload Frequency", u16At(18), integer("%d"), {.clause = "3GPP TS 36.101 5.7.3"}},
};
constexpr Layout carrier = layout(cellMinimumLength, carrierFields);
constexpr Field identityFields[] = {
    {"Download Bandwidth", u8At(20), text(bandwidths), {.clause = "3GPP TS 36.101 5.6"}},
    {"Upload Bandwidth", u8At(21), text(bandwidths), {.clause = "3GPP TS 36.101 5.6"}},
    {"Cell Identity",
     u32At(22),
     integer("%d"),
     {.role = Role::ServingCell, .identity = Identity::Location, .clause = "3GPP TS 23.003 19.6"}},
    {"Tracking Area Code",
     u16At(26),
     integer("%d"),
     {.role = Role::ServingArea, .identity = Identity::Location, .clause = "3GPP TS 23.003 19.4.2.3"}},
    {"Freq Band Indicator", u32At(28), integer("%d"), {.clause = "3GPP TS 36.101 5.5"}},
};
constexpr Layout identity = layout(cellMinimumLength, identityFields);

// As the telephony service reports it.
constexpr CellField servingCellFields[] = {
    {kVoxCellMonitorTAC,
     CellNumber::Whole,
     "Tracking Area Code",
     integer("%d"),
     "Serving Cell Info: Failed to retrieve TAC\n",
     {.role = Role::ServingArea, .identity = Identity::Location, .clause = "3GPP TS 23.003 19.4.2.3"}},
    {kVoxCellMonitorCellId,
     CellNumber::Whole,
     "Cell Identity",
     integer("%d"),
     "Serving Cell Info: Failed to retrieve Cell ID\n",
     {.role = Role::ServingCell, .identity = Identity::Location, .clause = "3GPP TS 23.003 19.6"}},
    {kVoxCellMonitorPID,
     CellNumber::Whole,
     "Physical Cell ID",
     integer("%d"),
     "Serving Cell Info: Failed to retrieve Physical Cell ID\n",
     {.role = Role::ServingPhysicalCell, .clause = "3GPP TS 36.211 6.11"}},
    {kVoxCellMonitorBandInfo,
     CellNumber::Whole,
     "Freq Band Indicator",
     integer("%d"),
     "Serving Cell Info: Failed to retrieve Freq Band Indicator\n",
     {.clause = "3GPP TS 36.101 5.5"}},
    {kVoxCellMonitorUARFCN,
     CellNumber::Whole,
     "UARFCN",
     integer("%d"),
     "Serving Cell Info: Failed to retrieve UARFCN\n",
     {.role = Role::ServingChannel, .clause = "3GPP TS 36.101 5.7.3"}},
};
constexpr CellKind cellKinds[] = {
    {kVoxCellMonitorRadioAccessTechnologyLTE, kVoxCellMonitorCellTypeServing},
};
constexpr CellTable servingCell{cellKinds, CellTable::Shown::First, servingCellFields};
constexpr Content cellContents[] = {carrier, identity};
constexpr View sectionViews[] = {
    {cellCode, carrier.minimumLength, cellContents},
    {antennaCode, antennas},
    cellInformation,
};

} // namespace

std::span<const View> LTEServingCellInfo::views() const {
    return sectionViews;
}

void LTEServingCellInfo::trace() const {
    logLine(LogPriority::Warning, "LTE Serving Cell Info"); // not the section's name
}

const CellTable& LTEServingCellInfo::cellTable() const {
    return servingCell;
}

void LTEServingCellInfo::check(const View& view, const Record&) const {
    // On purpose, it is shown and reported as unknown as well.
    if (view.code == antennaCode)
        unknownLogMessage(view.code);
}

void LTEServingCellInfo::decode(const View& view, const Record& record, FieldVisitor& visitor) const {
    if (view.code != cellCode) {
        CellSection::decode(view, record, visitor);
        return;
    }
    visitor.fields(record, carrier);
    // The baseband's downlink frequency replaces the telephony service's, which has another label.
    visitor.removed("UARFCN");
    visitor.fields(record, identity);
}

} // namespace velmora
