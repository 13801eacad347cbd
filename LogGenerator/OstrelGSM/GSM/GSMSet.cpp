// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/GSM/GSMSet.h"

#include "Platform/SystemLog.h"

namespace velmora {

namespace {

constexpr std::size_t minimumLength = 15; // 0x4005
// "UMTS Set" reads other entries at the same offset: the count that is not zero decides what they are.
constexpr Place count = u8At(14);
static_assert(count.end() <= minimumLength);

// ARFCN (3GPP TS 45.005 2), BSIC (TS 23.003 4.3.2); level and ranking as the modem reports them.
constexpr Field cellFields[] = {
    {"ARFCN", u16At(0), integer("%d"), {.clause = "3GPP TS 45.005 2"}},
    {"BSIC", u16At(2), integer("%d"), {.clause = "3GPP TS 23.003 4.3.2"}},
    {"RSSI", i8At(4), integer("%d dBm")},
    {"Ranking Value", i16At(5), integer("%d")},
};
constexpr Layout cell = layout(7, cellFields);
constexpr Content cellContents[] = {cell};
constexpr std::string_view cellKeys[] = {"ARFCN", "BSIC"};
constexpr List rows{.contents = cellContents, .keys = cellKeys};
constexpr Content contents[] = {rows};

CountedList cells(const Record& record) {
    return CountedList(record, minimumLength, cell.minimumLength,
                       static_cast<std::size_t>(count.read(record)));
}

constexpr View sectionViews[] = {{0x4005, minimumLength, contents}};

} // namespace

std::span<const View> GSMSet::views() const {
    return sectionViews;
}

void GSMSet::trace() const {
    logLine(LogPriority::Warning, "GSMSet");
}

void GSMSet::check(const View& view, const Record& record) const {
    reportMissingEntries(cells(record), view.code);
}

void GSMSet::decode(const View&, const Record& record, FieldVisitor& visitor) const {
    visitor.rows(rows, cells(record), cell);
}

} // namespace velmora
