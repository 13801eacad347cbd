// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/UMTS/UMTSRRInfo.h"

#include "Platform/SystemLog.h"
#include "Platform/TelephonyService.h"

#include <limits>

namespace velmora {

namespace {

// 0x4125: RRC states (3GPP TS 25.331 7.1), with the modem's own numbers.
constexpr EnumText rrcStateRows[] = {
    {0, "Disconnected"}, {1, "Connecting"}, {2, "CELL_FACH"},
    {3, "CELL_DCH"},     {4, "CELL_PCH"},   {5, "URA_PCH"},
};
constexpr EnumTexts rrcStates(rrcStateRows, "Unknown");

constexpr Field stateFields[] = {
    {"RRC State", u8At(13), text(rrcStates), {.role = Role::RadioState, .clause = "3GPP TS 25.331 7.1"}},
};
constexpr Layout state = layout(14, stateFields);

// The transmit power, on the modem's own scale (see meanPower).
constexpr std::uint32_t powerCode = 0x4031;
constexpr std::size_t powerMinimumLength = 16;
constexpr std::size_t powerEntryLength = 14;
constexpr Place powerTerm = i16At(4);
static_assert(powerTerm.end() <= powerEntryLength);
constexpr Field transmitPower{"Transmit Power", computed, real("%4.2lf dBm"), {.absent = " nan dBm"}};

// 0x4127: cell identity and URA identity (3GPP TS 25.331 10.3.2.2, 10.3.2.6), UARFCN (TS 25.101 5.4.3).
constexpr Field cellFields[] = {
    {"Cell ID",
     i32At(21),
     integer("%d"),
     {.role = Role::ServingCell, .identity = Identity::Location, .clause = "3GPP TS 25.331 10.3.2.2"}},
    {"Downlink Frequency",
     i32At(17),
     integer("%d"),
     {.role = Role::ServingChannel, .clause = "3GPP TS 25.101 5.4.3"}},
    {"Uplink Frequency", i32At(13), integer("%d"), {.clause = "3GPP TS 25.101 5.4.3"}},
    {"URA ID",
     u16At(25),
     integer("%d"),
     {.identity = Identity::Location, .clause = "3GPP TS 25.331 10.3.2.6"}},
};
constexpr Layout cell = layout(29, cellFields);
constexpr std::uint32_t cellCode = 0x4127;

// 0x4157: as the modem reports it.
constexpr Field cipheringFields[] = {
    {"Ciphering", u8At(13), flag("Enabled", "Disabled"), {.clause = "3GPP TS 33.102 6.6"}},
};
constexpr Layout ciphering = layout(19, cipheringFields);

// As the telephony service reports it.
constexpr CellField servingCellFields[] = {
    {kVoxCellMonitorCellId,
     CellNumber::Whole,
     "Cell ID",
     integer("%d"),
     "UMTSRRInfo: Failed to retrieve Cell ID\n",
     {.role = Role::ServingCell, .identity = Identity::Location, .clause = "3GPP TS 25.331 10.3.2.2"}},
    {kVoxCellMonitorUARFCN,
     CellNumber::Whole,
     "UARFCN",
     integer("%d"),
     "UMTSRRInfo: Failed to retrieve UARFCN\n",
     {.role = Role::ServingChannel, .clause = "3GPP TS 25.101 5.4.3"}},
    {kVoxCellMonitorSCN,
     CellNumber::Whole,
     "Scrambling Code",
     integer("%d"),
     "UMTSRRInfo: Failed to retrieve Scrambling Code\n",
     {.role = Role::ServingPhysicalCell, .clause = "3GPP TS 25.213 5.2.2"}},
};
constexpr CellKind cellKinds[] = {
    {kVoxCellMonitorRadioAccessTechnologyUMTS, kVoxCellMonitorCellTypeServing},
};
constexpr CellTable servingCell{cellKinds, CellTable::Shown::First, servingCellFields};

CountedList powerEntries(const Record& record) {
    return CountedList(record, powerMinimumLength, powerEntryLength, record.u8(14));
}

/// The mean of the transmit powers, in dBm.
double meanPower(const Record& record) {
    const CountedList entries = powerEntries(record);
    int sum = 0;
    int count = 0;
    for (std::size_t i = 0; i < entries.completeCount(); ++i) {
        const int term = static_cast<int>(powerTerm.read(entries[i]));
        if (term == 0)
            continue; // neither summed nor counted
        // The term is in tenths of a dB, and rounded toward zero.
        sum += (term + 512) / 10 - 70;
        ++count;
    }
    // The mean of no term is not a number and shows as that, on purpose. Dividing zero by zero would result
    // in a sign that depends on the processor.
    return count != 0 ? static_cast<double>(sum) / count : std::numeric_limits<double>::quiet_NaN();
}
constexpr Content powerContents[] = {transmitPower};
constexpr View sectionViews[] = {
    {0x4125, state}, {powerCode, powerMinimumLength, powerContents}, {cellCode, cell}, {0x4157, ciphering},
    cellInformation,
};

} // namespace

std::span<const View> UMTSRRInfo::views() const {
    return sectionViews;
}

void UMTSRRInfo::trace() const {
    logLine(LogPriority::Warning, "UMTSRRInfo");
}

const CellTable& UMTSRRInfo::cellTable() const {
    return servingCell;
}

void UMTSRRInfo::check(const View& view, const Record& record) const {
    if (view.code == powerCode)
        reportMissingEntries(powerEntries(record), view.code);
}

void UMTSRRInfo::decode(const View& view, const Record& record, FieldVisitor& visitor) const {
    if (view.code == powerCode) {
        visitor.real(transmitPower, meanPower(record));
        return;
    }
    CellSection::decode(view, record, visitor);
    // The baseband's downlink frequency replaces the telephony service's, which has another label.
    if (view.code == cellCode)
        visitor.removed("UARFCN");
}

} // namespace velmora
