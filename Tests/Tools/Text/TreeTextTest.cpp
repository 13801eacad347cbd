// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Text/TreeText.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

std::string textOf(const Value& display) {
    PathDictionary paths;
    return treeText(*VelmoraModelNode::makeTreeFromObject(display, paths));
}

DictionaryRef dictionary(std::initializer_list<Dictionary::Entry> entries) {
    return std::make_shared<Dictionary>(entries);
}

TEST(TreeTextTest, ValuesOfOneParentBeginInOneColumn) {
    const DictionaryRef display = dictionary({
        {"Serving Cell", dictionary({{"ARFCN", "33"}, {"Received Level", "-60 dBm"}, {"BSIC", "56"}})},
        {"Band", "GSM 900"},
        {"Neighbours",
         std::make_shared<Array>(std::initializer_list<Value>{
             dictionary({{"ARFCN", "32"}}), dictionary({{"ARFCN", "40"}, {"RSSI", "-80 dBm"}})})},
        {"Id", "7"},
    });
    EXPECT_EQ(textOf(display), "Serving Cell\n"
                               "  ARFCN           33\n"
                               "  Received Level  -60 dBm\n"
                               "  BSIC            56\n"
                               "Band  GSM 900\n"
                               "Neighbours\n"
                               "  0\n"
                               "    ARFCN  32\n"
                               "  1\n"
                               "    ARFCN  40\n"
                               "    RSSI   -80 dBm\n"
                               "Id    7\n");
}

TEST(TreeTextTest, WidthsAreTerminalColumns) {
    EXPECT_EQ(textOf(dictionary({{"gr\xC3\xBC\xC3\x9F", "a"}, {"12345", "b"}})),
              "gr\xC3\xBC\xC3\x9F   a\n12345  b\n");
}

TEST(TreeTextTest, EmptyValuesAndBranchesHaveNoTrailingBlanks) {
    EXPECT_EQ(
        textOf(dictionary({{"A", ""}, {"B", makeDictionary()}, {"C", makeArray()}, {"", "x"}, {" ", ""}})),
        "A\nB\nC\n   x\n\n");
}

TEST(TreeTextTest, RootThatIsNoBranchHasNoRows) {
    EXPECT_EQ(textOf("text"), "");
    EXPECT_EQ(textOf(Value()), "");
    EXPECT_EQ(textOf(makeDictionary()), "");
}

TEST(TreeTextTest, ControlCharactersAreShown) {
    EXPECT_EQ(textOf(dictionary({{"a\n", "\x1b[H"}})), "a\\n  \\x1B[H\n");
}

TEST(TreeTextTest, RowsKnowBranchesFromLeaves) {
    PathDictionary paths;
    const auto rows = treeRows(
        *VelmoraModelNode::makeTreeFromObject(dictionary({{"A", makeDictionary()}, {"B", "1"}}), paths));
    ASSERT_EQ(rows.size(), 2U);
    EXPECT_TRUE(rows[0].isBranch);
    EXPECT_FALSE(rows[1].isBranch);
}

} // namespace
} // namespace velmora
