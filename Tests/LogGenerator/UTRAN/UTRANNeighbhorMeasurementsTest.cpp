// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/UTRAN/UTRANNeighbhorMeasurements.h"

#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

namespace velmora {

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

const auto make = inArray<UTRANNeighbhorMeasurements>;

/// A 0xD00A record: its byte 16, and the entries from offset 168 on, each its first four bytes.
Data measurements(std::uint8_t countByte, const std::vector<std::string>& entries) {
    std::vector<std::uint8_t> payload(168 - 13, 0xFF); // what lies between is not read
    payload[16 - 13] = countByte;
    for (const std::string& entry : entries) {
        const Data fields = hex(entry);
        payload.insert(payload.end(), fields.bytes().begin(), fields.bytes().end());
        payload.insert(payload.end(), 12, 0xFF);
    }
    return recordOf(0xD00A, payload);
}

struct Entry {
    const char* bytes;
    const char* row;
};

/// From the lowest bit up: 14 of the channel, 7 of the cell, 8 of the level, 2 of the set, 1.
const Entry entries[] = {
    // Each field is the opposite of its neighbours.
    {"FF 3F E0 9F", "{UARFCN '16383', Cell ID '0', Filter RSCP '0.996094', Status 'ASET', inJDCS 'TRUE'}"},
    {"00 C0 1F 60", "{UARFCN '0', Cell ID '127', Filter RSCP '0.000000', inJDCS 'FALSE'}"},
    // 10054 = 0x2746; 85 = 10101 01; 91 = 01011 011, 91/256 = 0.35546875
    {"46 67 75 2B", "{UARFCN '10054', Cell ID '85', Filter RSCP '0.355469', Status 'MSET', inJDCS 'FALSE'}"},
    // 10121 = 0x2789; 42 = 01010 10; 164 = 10100 100, 164/256 = 0.640625
    {"89 A7 8A D4", "{UARFCN '10121', Cell ID '42', Filter RSCP '0.640625', Status 'DSET', inJDCS 'TRUE'}"},
    // The channel's bit 8, the cell's lowest and highest bit, the level's bits 2 and 3.
    {"00 41 90 61", "{UARFCN '256', Cell ID '65', Filter RSCP '0.046875', inJDCS 'FALSE'}"},
};

std::string rows(std::size_t count) {
    std::string result;
    for (std::size_t i = 0; i < count; ++i) {
        result += i == 0 ? "" : ", ";
        result += entries[i].row;
    }
    return "[" + result + "]";
}

Data five(std::uint8_t countByte) {
    std::vector<std::string> bytes;
    for (const Entry& entry : entries)
        bytes.emplace_back(entry.bytes);
    return measurements(countByte, bytes);
}

TEST(UTRANNeighbhorMeasurements, ShowsThePackedFields) {
    for (const Entry& entry : entries) {
        SectionHarness section = make();
        section.update(measurements(1 << 1, {entry.bytes}));
        EXPECT_EQ(section.node(), std::string("[") + entry.row + "]") << entry.bytes;
        EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, "NeighbhorMeasurements List"}}));
    }
}

TEST(UTRANNeighbhorMeasurements, ShowsTheEntriesThatLieWhollyInside) {
    const Data full = five(5 << 1);
    ASSERT_EQ(full.size(), 168u + 5 * 16);
    expectPrefixes(make, full, 21, "NeighbhorMeasurements List",
                   [](std::size_t length) { return rows(length < 168 ? 0 : (length - 168) / 16); });
    SectionHarness section = make();
    section.update(full);
    EXPECT_EQ(section.node(), rows(5));
    EXPECT_THAT(section.errors(), IsEmpty());
    section.update(prefixOf(full, full.size() - 1));
    EXPECT_THAT(section.errors(), ElementsAre("Record 0xD00A: 4 of 5 entries"));
    section.update(prefixOf(full, 183)); // the first entry's fields are there, its last byte is not
    EXPECT_EQ(section.node(), "[]");
    EXPECT_THAT(section.errors(), ElementsAre("Record 0xD00A: 0 of 5 entries"));
    section.update(prefixOf(full, 21));
    EXPECT_THAT(section.errors(), ElementsAre("Record 0xD00A: 0 of 5 entries"));
}

TEST(UTRANNeighbhorMeasurements, TheCountIsTheUpperSevenBits) {
    SectionHarness section = make();
    section.update(five(2 << 1 | 1));
    EXPECT_EQ(section.node(), rows(2));
    EXPECT_THAT(section.errors(), IsEmpty());
    section.update(five(1)); // bit 0 alone: none
    EXPECT_EQ(section.node(), "[]");
    EXPECT_THAT(section.errors(), IsEmpty());
    section.update(five(0xFF));
    EXPECT_EQ(section.node(), rows(5));
    EXPECT_THAT(section.errors(), ElementsAre("Record 0xD00A: 5 of 127 entries"));
}

TEST(UTRANNeighbhorMeasurements, NoCellsEmptyTheListThatStaysTheSame) {
    SectionHarness section = make();
    const ArrayRef node = section.value().arrayRef();
    section.update(recordWith(0xD00A, 21));
    EXPECT_EQ(section.node(), "[]");
    EXPECT_THAT(section.errors(), IsEmpty());
    section.update(five(5 << 1));
    EXPECT_EQ(section.value().asArray()->size(), 5u);
    EXPECT_EQ(section.value().asArray(), node.get());
}

} // namespace

} // namespace velmora
