// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/UTRAN/UTRANNeighbhorMeasurements.h"

#include "Platform/SystemLog.h"

namespace velmora {

namespace {

constexpr std::size_t minimumLength = 21; // 0xD00A
constexpr Place count = bitsAt(16, 1, 7);
static_assert(count.end() <= minimumLength);

/// The entries lie far past the minimum.
constexpr std::size_t firstEntry = 168;
constexpr std::size_t entryLength = 16;

// UARFCN (3GPP TS 25.102 5.4.3), cell parameter ID (TS 25.223), P-CCPCH RSCP (a quantity of TS 25.225) in the
// modem's own steps of 1/256. The fields are packed into the entry's first four bytes.
constexpr Field cellFields[] = {
    {"UARFCN",
     bitsAt(0, 0, 14),
     integer("%d"),
     {.role = Role::NeighbourChannel, .clause = "3GPP TS 25.102 5.4.3"}},
    {"Cell ID",
     bitsAt(1, 6, 7),
     integer("%d"),
     {.role = Role::NeighbourPhysicalCell, .clause = "3GPP TS 25.223"}},
    {"Filter RSCP", bitsAt(2, 5, 8), real("%f", 0.00390625)},
};
constexpr Layout cell = layout(entryLength, cellFields);

constexpr EnumText statusRows[] = {{0, "ASET"}, {1, "MSET"}, {2, "DSET"}};
constexpr EnumTexts statuses(statusRows, "");
constexpr Field status{"Status", bitsAt(3, 5, 2), text(statuses)};
static_assert(status.place.end() <= entryLength);
/// The last of the four has no text: its row lacks the label.
constexpr std::int64_t noSet = 3;

constexpr Field detectionFields[] = {
    {"inJDCS", bitsAt(3, 7, 1), flag("TRUE", "FALSE")},
};
constexpr Layout detection = layout(entryLength, detectionFields);

constexpr Content cellContents[] = {cell, status, detection};
constexpr std::string_view cellKeys[] = {"UARFCN", "Cell ID"};
constexpr List rows{.contents = cellContents, .keys = cellKeys};
constexpr Content contents[] = {rows};

CountedList cells(const Record& record) {
    return CountedList(record, firstEntry, entryLength, static_cast<std::size_t>(count.read(record)));
}

constexpr View sectionViews[] = {{0xD00A, minimumLength, contents}};

} // namespace

std::span<const View> UTRANNeighbhorMeasurements::views() const {
    return sectionViews;
}

void UTRANNeighbhorMeasurements::trace() const {
    logLine(LogPriority::Warning, "NeighbhorMeasurements List");
}

void UTRANNeighbhorMeasurements::unknownCode(std::uint32_t) const {}

void UTRANNeighbhorMeasurements::check(const View& view, const Record& record) const {
    reportMissingEntries(cells(record), view.code);
}

void UTRANNeighbhorMeasurements::decode(const View&, const Record& record, FieldVisitor& visitor) const {
    const CountedList entries = cells(record);
    visitor.beginList(rows);
    for (std::size_t i = 0; i < entries.completeCount(); ++i) {
        visitor.beginRow();
        visitor.fields(entries[i], cell);
        if (const std::int64_t set = status.place.read(entries[i]); set != noSet)
            visitor.number(status, set);
        visitor.fields(entries[i], detection);
        visitor.endRow();
    }
    visitor.endList();
}

} // namespace velmora
