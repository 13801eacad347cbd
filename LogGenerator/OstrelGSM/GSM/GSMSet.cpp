// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/GSM/GSMSet.h"

#include "Platform/SystemLog.h"

namespace velmora {

namespace {

constexpr std::size_t minimumLength = 15; // 0x4005
// "UMTS Set" reads other entries at the same place: which of the two counts is not zero tells what they are.
constexpr Where count = u8At(14);
static_assert(count.end() <= minimumLength);

constexpr Field cellFields[] = {
    {"ARFCN", u16At(0), integer("%d")},
    {"BSIC", u16At(2), integer("%d")},
    {"RSSI", i8At(4), integer("%d dBm")},
    {"Ranking Value", i16At(5), integer("%d")},
};
constexpr Layout cell = layout(7, cellFields);

} // namespace

void GSMSet::updateWithData(const Data& data, std::uint32_t logCode) {
    logLine(LogPriority::Warning, "GSMSet");
    if (logCode != 0x4005) {
        unknownLogMessage(logCode);
        return;
    }
    const Record record(data);
    if (record.size() < minimumLength)
        return;
    const CountedList entries(record, minimumLength, cell.minimumLength,
                              static_cast<std::size_t>(count.read(record)));
    showRows(entries, cell, logCode);
}

} // namespace velmora
