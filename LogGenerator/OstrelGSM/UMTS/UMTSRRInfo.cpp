// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/UMTS/UMTSRRInfo.h"

#include "LogGenerator/Extra/CellFields.h"
#include "Platform/SystemLog.h"
#include "Platform/TelephonyService.h"

#include <limits>

namespace velmora {

namespace {

constexpr EnumText rrcStateRows[] = {
    {0, "Disconnected"}, {1, "Connecting"}, {2, "CELL_FACH"},
    {3, "CELL_DCH"},     {4, "CELL_PCH"},   {5, "URA_PCH"},
};
constexpr EnumTexts rrcStates(rrcStateRows, "Unknown");

constexpr Field stateFields[] = {
    {"RRC State", u8At(13), text(rrcStates)},
};
constexpr Layout state = layout(14, stateFields); // 0x4125

constexpr std::size_t powerMinimumLength = 16; // 0x4031
constexpr std::size_t powerEntryLength = 14;
constexpr Where powerTerm = i16At(4);
static_assert(powerTerm.end() <= powerEntryLength);

constexpr Field cellFields[] = {
    {"Cell ID", i32At(21), integer("%d")},
    {"Downlink Frequency", i32At(17), integer("%d")},
    {"Uplink Frequency", i32At(13), integer("%d")},
    {"URA ID", u16At(25), integer("%d")},
};
constexpr Layout cell = layout(29, cellFields); // 0x4127

constexpr Field cipheringFields[] = {
    {"Ciphering", u8At(13), flag("Enabled", "Disabled")},
};
constexpr Layout ciphering = layout(19, cipheringFields); // 0x4157

constexpr CellField servingCellFields[] = {
    {kVoxCellMonitorCellId, CellNumber::Whole, "Cell ID", integer("%d"),
     "UMTSRRInfo: Failed to retrieve Cell ID\n"},
    {kVoxCellMonitorUARFCN, CellNumber::Whole, "UARFCN", integer("%d"),
     "UMTSRRInfo: Failed to retrieve UARFCN\n"},
    {kVoxCellMonitorSCN, CellNumber::Whole, "Scrambling Code", integer("%d"),
     "UMTSRRInfo: Failed to retrieve Scrambling Code\n"},
};

CountedList powerEntries(const Record& record) {
    return CountedList(record, powerMinimumLength, powerEntryLength, record.u8(14));
}

void writeTransmitPower(Dictionary& node, const Record& record) {
    const CountedList entries = powerEntries(record);
    int sum = 0;
    int count = 0;
    for (std::size_t i = 0; i < entries.whole(); ++i) {
        const int term = static_cast<int>(powerTerm.read(entries[i]));
        if (term == 0)
            continue; // neither summed nor counted
        // The term is in tenths of a dB, and rounded toward zero.
        sum += (term + 512) / 10 - 70;
        ++count;
    }
    // The mean of no term is not a number and shows as that, on purpose. Dividing zero by zero would give it
    // a sign that depends on the processor.
    const double mean =
        count != 0 ? static_cast<double>(sum) / count : std::numeric_limits<double>::quiet_NaN();
    node.setText("Transmit Power", NumberText("%4.2lf dBm", mean).text());
}

} // namespace

void UMTSRRInfo::updateWithData(const Data& data, std::uint32_t logCode) {
    logLine(LogPriority::Warning, "UMTSRRInfo");
    const Record record(data);
    switch (logCode) {
    case 0x4125: show(record, state); break;
    case 0x4031: showTransmitPower(record); break;
    case 0x4127: showCell(record); break;
    case 0x4157: show(record, ciphering); break;
    case 0xFF0001: showServingCell(data); break;
    default: unknownLogMessage(logCode);
    }
}

void UMTSRRInfo::showTransmitPower(const Record& record) {
    if (record.size() < powerMinimumLength)
        return;
    reportMissingEntries(powerEntries(record), 0x4031);
    showWith<writeTransmitPower>(record);
}

void UMTSRRInfo::showCell(const Record& record) {
    if (!show(record, cell))
        return;
    // The telephony service's name for the downlink frequency goes when the baseband's arrives.
    if (Dictionary* const node = dictionary())
        node->removeLater("UARFCN");
}

void UMTSRRInfo::showServingCell(const Data& data) {
    const std::vector<Cell>* cells = cellsOf(data);
    if (!cells)
        return;
    if (const Cell* serving =
            firstCell(*cells, {kVoxCellMonitorRadioAccessTechnologyUMTS, kVoxCellMonitorCellTypeServing}))
        writeCellFields(dictionary(), *serving, servingCellFields);
}

} // namespace velmora
