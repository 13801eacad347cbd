// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/UMTS/HSDPAInformation.h"

#include "Platform/SystemLog.h"

namespace velmora {

namespace {

// 0x4221: HARQ processes of MAC-hs (3GPP TS 25.321); all of it as the modem reports it.
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
constexpr Layout status = layout(18, statusFields);
constexpr std::size_t primaryCountAt = 16;
constexpr std::size_t secondaryCountAt = 17;

constexpr Field processFields[] = {
    {"Process ID", u8At(0), integer("%u"), {.clause = "3GPP TS 25.321"}},
    {"No Rx Bits", u32At(1), integer("%u")},
    {"New Tx", u16At(5), integer("%u")},
    {"Block Errors", u16At(7), integer("%u")},
};
constexpr Layout process = layout(9, processFields);
constexpr Content processContents[] = {process};
constexpr std::string_view processKeys[] = {"Process ID"};
constexpr List primaryList{.label = "Primary HARQ Process", .contents = processContents, .keys = processKeys};
constexpr List secondaryList{
    .label = "Secondary HARQ Process", .contents = processContents, .keys = processKeys};
constexpr Content contents[] = {status, primaryList, secondaryList};
// How far every primary process moves the secondary ones: not the nine bytes of its entry, on purpose.
constexpr std::size_t primarySpan = 162;

CountedList primaryProcesses(const Record& record) {
    return CountedList(record, status.minimumLength, process.minimumLength, record.u8(primaryCountAt));
}

CountedList secondaryProcesses(const Record& record) {
    return CountedList(record, status.minimumLength + primarySpan * record.u8(primaryCountAt),
                       process.minimumLength, record.u8(secondaryCountAt));
}

constexpr View sectionViews[] = {{0x4221, status.minimumLength, contents}};

} // namespace

std::span<const View> HSDPAInformation::views() const {
    return sectionViews;
}

void HSDPAInformation::trace() const {
    logLine(LogPriority::Warning, "HSDPA Info");
}

void HSDPAInformation::unknownCode(std::uint32_t) const {} // without a log line, unlike the other sections

void HSDPAInformation::check(const View& view, const Record& record) const {
    reportMissingEntries(primaryProcesses(record), view.code);
    reportMissingEntries(secondaryProcesses(record), view.code);
}

KeptRecords::Parts HSDPAInformation::partsOf(const View&, const Record& record) const {
    return 1U | (primaryProcesses(record).count() != 0 ? 2U : 0U) |
           (secondaryProcesses(record).count() != 0 ? 4U : 0U);
}

void HSDPAInformation::decode(const View&, const Record& record, FieldVisitor& visitor) const {
    visitor.fields(record, status);
    // Of a kind without processes, what was shown before stays.
    if (const CountedList primary = primaryProcesses(record); primary.count() != 0)
        visitor.rows(primaryList, primary, process);
    if (const CountedList secondary = secondaryProcesses(record); secondary.count() != 0)
        visitor.rows(secondaryList, secondary, process);
}

} // namespace velmora
