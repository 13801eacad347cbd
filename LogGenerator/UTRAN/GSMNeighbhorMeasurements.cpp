// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/UTRAN/GSMNeighbhorMeasurements.h"

#include "Platform/SystemLog.h"

namespace velmora {

namespace {

constexpr std::uint32_t code = 0xD00E;
constexpr std::size_t minimumLength = 17;
constexpr Place count = u8At(16);
static_assert(count.end() <= minimumLength);

// NCC and BCC (3GPP TS 23.003 4.3.2), ARFCN (TS 45.005 2); the rest as the modem reports it.
constexpr Field cellFields[] = {
    {"Cell ID", bitsAt(0, 0, 14), integer("%d")},
    {"Band Indicator", bitsAt(1, 6, 1), integer("%d")},
    {"BSIC Valid", bitsAt(1, 7, 1), integer("%d")},
    {"NCC", u8At(2), integer("%d")},
    {"BCC", u8At(3), integer("%d")},
    {"ARFCN", u16At(4), integer("%d")},
    {"RSSI", i16At(6), integer("%d")},
};
constexpr Layout cell = layout(8, cellFields);

CountedList cells(const Record& record) {
    return CountedList(record, minimumLength, cell.minimumLength,
                       static_cast<std::size_t>(count.read(record)));
}

constexpr List rows{};
constexpr View sectionViews[] = {{code, minimumLength}};

} // namespace

std::span<const View> GSMNeighbhorMeasurements::views() const {
    return sectionViews;
}

void GSMNeighbhorMeasurements::trace() const {
    logLine(LogPriority::Warning, "GSM Neighbor Cell List");
}

void GSMNeighbhorMeasurements::unknownCode(std::uint32_t) const {}

void GSMNeighbhorMeasurements::check(const View& view, const Record& record) const {
    reportMissingEntries(cells(record), view.code);
}

void GSMNeighbhorMeasurements::decode(const View&, const Record&, FieldVisitor& visitor) const {
    // The rows are not shown: see the header.
    visitor.beginList(rows);
    visitor.endList();
}

void GSMNeighbhorMeasurements::visitNeighbours(const Record& record, FieldVisitor& visitor) {
    visitor.rows(rows, cells(record), cell);
}

} // namespace velmora
