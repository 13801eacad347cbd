// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/UMTS/HSDPAInformation.h"

#include "Platform/SystemLog.h"

namespace velmora {

namespace {

constexpr EnumText carrierRows[] = {
    {0, "Single Carrier"},
    {1, "MIMO"},
    {2, "Dual Carrier"},
    {3, "Reserved"},
};
constexpr EnumTexts carriers(carrierRows, "Reserved");

constexpr Field statusFields[] = {
    {"Version", u8At(13), integer("%u")},
    {"Sub Frames", bitsAt(14, 0, 10), integer("%u")},
    {"Carrier Info", bitsAt(15, 2, 2), text(carriers)},
};
constexpr Layout status = layout(18, statusFields); // 0x4221
constexpr std::size_t primaryCountAt = 16;
constexpr std::size_t secondaryCountAt = 17;

constexpr Field processFields[] = {
    {"Process ID", u8At(0), integer("%u")},
    {"No Rx Bits", u32At(1), integer("%u")},
    {"New Tx", u16At(5), integer("%u")},
    {"Block Errors", u16At(7), integer("%u")},
};
constexpr Layout process = layout(9, processFields);
constexpr ListField primaryProcesses = {"Primary HARQ Process", process};
constexpr ListField secondaryProcesses = {"Secondary HARQ Process", process};
// How far every primary process moves the secondary ones: not the nine bytes of its entry. That is how the
// record is read, and it is kept.
constexpr std::size_t primarySpan = 162;

} // namespace

void HSDPAInformation::updateWithData(const Data& data, std::uint32_t logCode) {
    logLine(LogPriority::Warning, "HSDPA Info");
    if (logCode != 0x4221)
        return; // without a word, unlike the other sections
    const Record record(data);
    if (!show(record, status))
        return;
    const std::size_t primaryCount = record.u8(primaryCountAt);
    const std::size_t secondaryCount = record.u8(secondaryCountAt);
    // Where a kind has no process, what was shown of it stays.
    if (primaryCount != 0) {
        const CountedList primary(record, status.minimumLength, process.minimumLength, primaryCount);
        showList(primaryProcesses, primary, logCode);
    }
    if (secondaryCount != 0) {
        const CountedList secondary(record, status.minimumLength + primarySpan * primaryCount,
                                    process.minimumLength, secondaryCount);
        showList(secondaryProcesses, secondary, logCode);
    }
}

} // namespace velmora
