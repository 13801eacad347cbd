// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/GSM/MobileAllocation.h"

#include "Platform/SystemLog.h"

namespace velmora {

namespace {

// 0x51F8: the hopping sequence number (3GPP TS 45.002 6.2.3), then ARFCNs (TS 45.005 2).
constexpr Field hoppingFields[] = {
    {"HSN", u8At(13), integer("%d"), {.clause = "3GPP TS 45.002 6.2.3"}},
};
constexpr Layout hopping = layout(15, hoppingFields); // the count at 14 and the ARFCNs follow
constexpr std::size_t arfcnLength = 2;
constexpr Field arfcn{"", u16At(0), integer("%d"), {.clause = "3GPP TS 45.005 2"}};
static_assert(arfcn.place.end() <= arfcnLength);
constexpr Content arfcnContents[] = {arfcn};
constexpr List arfcnList{"ARFCNs", List::Entries::Values, "", arfcnContents};
constexpr Content contents[] = {hopping, arfcnList};

CountedList arfcns(const Record& record) {
    return CountedList(record, hopping.minimumLength, arfcnLength, record.u8(14));
}

constexpr View sectionViews[] = {{0x51F8, hopping.minimumLength, contents}};

} // namespace

std::span<const View> MobileAllocation::views() const {
    return sectionViews;
}

void MobileAllocation::trace() const {
    logLine(LogPriority::Warning, "MobileAllocation");
}

void MobileAllocation::check(const View& view, const Record& record) const {
    reportMissingEntries(arfcns(record), view.code);
}

void MobileAllocation::decode(const View&, const Record& record, FieldVisitor& visitor) const {
    visitor.fields(record, hopping);
    const CountedList entries = arfcns(record);
    visitor.beginList(arfcnList);
    for (std::size_t i = 0; i < entries.completeCount(); ++i)
        visitor.number(arfcn, arfcn.place.read(entries[i]));
    visitor.endList();
}

} // namespace velmora
