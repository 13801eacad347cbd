// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/UTRAN/GSMNeighbhorMeasurements.h"

#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

namespace velmora {

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

const auto make = inArray<GSMNeighbhorMeasurements>;

const Data full = record(0xD00E, R"(
    FF FF FF
    04                      # four cells
    FF 3F   07 80  FF FF  FF FF     # cell 16383, neither bit; NCC, BCC; ARFCN; RSSI
    00 C0   00 05  00 00  00 80     # cell 0, both bits
    01 40   03 02  3E 00  AB FF     # cell 1, band indicator alone
    75 A7   01 04  1C 02  FF 7F     # cell 10101, BSIC valid alone
)");

constexpr const char* rows[] = {
    "{Cell ID '16383', Band Indicator '0', BSIC Valid '0', NCC '7', BCC '128', ARFCN '65535', RSSI '-1'}",
    "{Cell ID '0', Band Indicator '1', BSIC Valid '1', NCC '0', BCC '5', ARFCN '0', RSSI '-32768'}",
    "{Cell ID '1', Band Indicator '1', BSIC Valid '0', NCC '3', BCC '2', ARFCN '62', RSSI '-85'}",
    "{Cell ID '10101', Band Indicator '0', BSIC Valid '1', NCC '1', BCC '4', ARFCN '540', RSSI '32767'}",
};

TEST(GSMNeighbhorMeasurements, MakesARowOfEachCell) {
    ASSERT_EQ(full.size(), 17u + 4 * 8);
    std::string all;
    for (const char* row : rows) {
        all += all.empty() ? "" : ", ";
        all += row;
    }
    const ArrayRef list = makeArray();
    DisplayWriter::SpareRows spare;
    DisplayWriter writer(*list, spare);
    GSMNeighbhorMeasurements::visitNeighbours(Record(full), writer);
    EXPECT_EQ(shown(list), "[" + all + "]");
}

TEST(GSMNeighbhorMeasurements, TheListIsEmptyAfterEveryRecord) {
    expectPrefixes(make, full, 17, "GSM Neighbor Cell List", "[]");
    SectionHarness section = make();
    const ArrayRef node = section.value().arrayRef();
    section.update(full);
    EXPECT_EQ(section.lines(), (LogLines{{LogPriority::Warning, "GSM Neighbor Cell List"}}));
    EXPECT_TRUE(node->empty());
}

TEST(GSMNeighbhorMeasurements, ACountThatOverrunsIsReported) {
    SectionHarness section = make();
    section.update(prefixOf(full, full.size() - 1));
    EXPECT_THAT(section.errors(), ElementsAre("Record 0xD00E: 3 of 4 entries"));
    section.update(withByte(full, 16, 255));
    EXPECT_THAT(section.errors(), ElementsAre("Record 0xD00E: 4 of 255 entries"));
    section.update(prefixOf(full, 17));
    EXPECT_THAT(section.errors(), ElementsAre("Record 0xD00E: 0 of 4 entries"));
    section.update(withByte(full, 16, 0));
    EXPECT_THAT(section.errors(), IsEmpty());
    EXPECT_EQ(section.node(), "[]");
}

} // namespace

} // namespace velmora
