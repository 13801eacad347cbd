// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Extra/CellFields.h"

#include "Tests/LogGenerator/SectionHarness.h"

#include <gtest/gtest.h>

#include <array>
#include <string>
#include <string_view>
#include <utility>

namespace velmora {
namespace {

constexpr std::string_view labels = "abcdefghijklmnopqrstuvwxyz01234";

template <std::size_t... I>
consteval std::array<CellField, sizeof...(I)> rows(std::index_sequence<I...>) {
    return {CellField{I % 2 == 0 ? kVoxCellMonitorMCC : kVoxCellMonitorMNC, CellNumber::Whole,
                      labels.substr(I, 1), integer("%d"), ""}...};
}

/// As many as there may be, of two numbers by turns.
constexpr std::array longestTable = rows(std::make_index_sequence<31>());

Cell cellWith(std::int32_t mcc, std::int32_t mnc) {
    Cell cell;
    cell.setNumber(CellKey(kVoxCellMonitorMCC).place, mcc);
    cell.setNumber(CellKey(kVoxCellMonitorMNC).place, mnc);
    return cell;
}

TEST(CellFieldsTest, LongestTableIsShownWhole) {
    const DictionaryRef node = makeDictionary();
    std::string expected;
    for (std::size_t i = 0; i < labels.size(); ++i)
        expected += (i == 0 ? "" : ", ") + std::string(1, labels[i]) + (i % 2 == 0 ? " '-2'" : " '70000'");
    for (int i = 0; i < 2; ++i) { // the second time only when somebody looks
        writeCellFields(node.get(), cellWith(-2, 70000), longestTable);
        EXPECT_EQ(shown(node), "{" + expected + "}");
    }
}

} // namespace
} // namespace velmora
