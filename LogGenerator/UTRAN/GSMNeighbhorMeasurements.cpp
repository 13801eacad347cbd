// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/UTRAN/GSMNeighbhorMeasurements.h"

#include "Platform/SystemLog.h"

namespace velmora {

namespace {

constexpr std::uint32_t code = 0xD00E;
constexpr std::size_t minimumLength = 17;
constexpr Where count = u8At(16);
static_assert(count.end() <= minimumLength);

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

} // namespace

void GSMNeighbhorMeasurements::updateWithData(const Data& data, std::uint32_t logCode) {
    logLine(LogPriority::Warning, "GSM Neighbor Cell List");
    const Record record(data);
    if (logCode != code || record.size() < minimumLength)
        return;
    clearElements();
    // The rows are not shown, and so not even made: see the header.
    reportMissingEntries(cells(record), code);
}

Array GSMNeighbhorMeasurements::neighbours(const Record& record) {
    return rows(cells(record), cell, code);
}

} // namespace velmora
