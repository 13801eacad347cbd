// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/UTRAN/UTRANNeighbhorMeasurements.h"

#include "Platform/SystemLog.h"

#include <iterator>

namespace velmora {

namespace {

constexpr std::size_t minimumLength = 21; // 0xD00A
constexpr Where count = bitsAt(16, 1, 7);
static_assert(count.end() <= minimumLength);

/// The entries lie far behind the minimum.
constexpr std::size_t firstEntry = 168;
constexpr std::size_t entryLength = 16;

// The fields stand bit by bit behind one another in the entry's first four bytes.
constexpr Field cellFields[] = {
    {"UARFCN", bitsAt(0, 0, 14), integer("%d")},
    {"Cell ID", bitsAt(1, 6, 7), integer("%d")},
    {"Filter RSCP", bitsAt(2, 5, 8), real("%f", 0.00390625)},
};
constexpr Layout cell = layout(entryLength, cellFields);

constexpr Where status = bitsAt(3, 5, 2);
// The last of the four has no text: the label is left out of its row.
constexpr std::string_view statusTexts[] = {"ASET", "MSET", "DSET"};

constexpr Field detectionFields[] = {
    {"inJDCS", bitsAt(3, 7, 1), flag("TRUE", "FALSE")},
};
constexpr Layout detection = layout(entryLength, detectionFields);

CountedList cells(const Record& record) {
    return CountedList(record, firstEntry, entryLength, static_cast<std::size_t>(count.read(record)));
}

void fill(Array& rows, const Record& record) {
    const CountedList entries = cells(record);
    for (std::size_t i = 0; i < entries.whole(); ++i) {
        Dictionary& row = rows.appendRow();
        writeFields(row, entries[i], cell);
        if (const auto set = static_cast<std::size_t>(status.read(entries[i])); set < std::size(statusTexts))
            row.setText("Status", statusTexts[set]);
        writeFields(row, entries[i], detection);
    }
}

} // namespace

void UTRANNeighbhorMeasurements::updateWithData(const Data& data, std::uint32_t logCode) {
    logLine(LogPriority::Warning, "NeighbhorMeasurements List");
    const Record record(data);
    if (logCode != 0xD00A || record.size() < minimumLength)
        return;
    reportMissingEntries(cells(record), logCode);
    showElementsWith<fill>(record);
}

} // namespace velmora
