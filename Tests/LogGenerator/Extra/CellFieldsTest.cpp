// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Extra/CellFields.h"

#include "LogGenerator/Fields/DisplayWriter.h"
#include "Tests/LogGenerator/SectionHarness.h"

#include <gtest/gtest.h>

#include <array>
#include <string>
#include <string_view>
#include <utility>

namespace velmora {
namespace {

constexpr std::string_view labels = "abcdefghijklmnopqrstuvwxyz012345";

template <std::size_t... I>
consteval std::array<CellField, sizeof...(I)> rows(std::index_sequence<I...>) {
    return {CellField{I % 2 == 0 ? kVoxCellMonitorMCC : kVoxCellMonitorMNC, CellNumber::Whole,
                      labels.substr(I, 1), integer("%d"), ""}...};
}

/// As many as there may be, of two numbers in turn.
constexpr std::array longestTable = rows(std::make_index_sequence<32>());

Cell cellWith(std::int32_t mcc, std::int32_t mnc) {
    Cell cell;
    cell.setNumber(CellKey(kVoxCellMonitorMCC).index, mcc);
    cell.setNumber(CellKey(kVoxCellMonitorMNC).index, mnc);
    return cell;
}

TEST(CellFieldsTest, LongestTableIsShownCompletely) {
    const DictionaryRef node = makeDictionary();
    std::string expected;
    for (std::size_t i = 0; i < labels.size(); ++i)
        expected += (i == 0 ? "" : ", ") + std::string(1, labels[i]) + (i % 2 == 0 ? " '-2'" : " '70000'");
    const Cell cell = cellWith(-2, 70000);
    DisplayWriter::SpareRows spare;
    DisplayWriter writer(*node, spare);
    visitCell(cell, longestTable, writer);
    EXPECT_EQ(shown(node), "{" + expected + "}");
    EXPECT_EQ(fieldsOf(cell, longestTable), 0xFFFFFFFFU);
}

TEST(CellFieldsTest, FieldsThatTheCellLacksAreLeftOutAndLogged) {
    static constexpr CellField table[] = {
        {kVoxCellMonitorMCC, CellNumber::Whole, "MCC", integer("%d"), "no MCC"},
        {kVoxCellMonitorMNC, CellNumber::SignedLow16, "MNC", integer("%d"), "no MNC"},
        {kVoxCellMonitorLAC, CellNumber::Whole, "LAC", integer("%d"), ""},
    };
    Cell cell;
    cell.setNumber(CellKey(kVoxCellMonitorMNC).index, 0x1FFFF);
    const DictionaryRef node = makeDictionary();
    DisplayWriter::SpareRows spare;
    DisplayWriter writer(*node, spare);
    visitCell(cell, table, writer);
    EXPECT_EQ(shown(node), "{MNC '-1'}");
    EXPECT_EQ(fieldsOf(cell, table), 2U);
    const CapturedLog log;
    logMissingFields(cell, table);
    EXPECT_EQ(log.lines(), (LogLines{{LogPriority::Error, "no MCC"}}));
}

} // namespace
} // namespace velmora
