// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/GSM/MobileAllocation.h"

#include "Platform/SystemLog.h"

namespace velmora {

namespace {

constexpr Field hoppingFields[] = {
    {"HSN", u8At(13), integer("%d")},
};
constexpr Layout hopping = layout(15, hoppingFields); // 0x51F8; the count at 14 and the ARFCNs follow
constexpr std::size_t arfcnLength = 2;

CountedList arfcns(const Record& record) {
    return CountedList(record, hopping.minimumLength, arfcnLength, record.u8(14));
}

void writeARFCNs(Dictionary& node, const Record& record) {
    const CountedList entries = arfcns(record);
    const ArrayRef list = makeArray();
    for (std::size_t i = 0; i < entries.whole(); ++i)
        list->append(NumberText("%d", std::int64_t{entries[i].u16(0)}).text());
    node.set("ARFCNs", list);
}

} // namespace

void MobileAllocation::updateWithData(const Data& data, std::uint32_t logCode) {
    logLine(LogPriority::Warning, "MobileAllocation");
    if (logCode != 0x51F8) {
        unknownLogMessage(logCode);
        return;
    }
    const Record record(data);
    if (!show(record, hopping))
        return;
    reportMissingEntries(arfcns(record), logCode);
    showWith<writeARFCNs>(record);
}

} // namespace velmora
