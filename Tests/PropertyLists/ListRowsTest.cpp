// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/Value.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <algorithm>
#include <iterator>
#include <random>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

namespace velmora {
namespace {

using testing::ElementsAre;

using Row = std::vector<std::pair<std::string, std::string>>;

/// What row `number` shows that a byte stands for: its bits choose the keys and their order.
Row rowOf(std::uint8_t byte, std::size_t number) {
    Row row;
    for (int bit = 0; bit < 6; ++bit)
        if ((byte >> bit & 1) != 0)
            row.emplace_back(std::string("A key that is long, number ").append(std::to_string(bit)),
                             std::to_string(byte) + " in " + std::to_string(number));
    if ((byte & 0x80) != 0)
        std::reverse(row.begin(), row.end());
    return row;
}

/// One row for each byte.
void appendRows(Array& list, Bytes bytes, const void*) {
    for (const std::uint8_t byte : bytes) {
        const std::size_t number = list.size();
        Dictionary& row = list.appendRow();
        for (const auto& [key, text] : rowOf(byte, number))
            row.setText(key, text);
    }
}

void later(Array& list, const std::vector<std::uint8_t>& bytes) {
    list.writeLater({appendRows, nullptr}, bytes);
}

Row textsOf(const Value& row) {
    Row texts;
    for (const auto& [key, value] : *row.asDictionary())
        texts.emplace_back(key, *value.asString());
    return texts;
}

std::vector<Row> textsOf(const Array& list) {
    std::vector<Row> texts;
    for (const Value& row : list)
        texts.push_back(textsOf(row));
    return texts;
}

std::vector<Row> rowsOf(const std::vector<std::uint8_t>& bytes) {
    std::vector<Row> rows;
    for (const std::uint8_t byte : bytes)
        rows.push_back(rowOf(byte, rows.size()));
    return rows;
}

Value valueOf(const Array& list) {
    return std::make_shared<Array>(list);
}

Value valueOf(const Dictionary& node) {
    return std::make_shared<Dictionary>(node);
}

std::vector<const Dictionary*> nodesOf(const Array& list) {
    std::vector<const Dictionary*> nodes;
    for (const Value& row : list)
        nodes.push_back(row.asDictionary());
    return nodes;
}

TEST(ListRowsTest, AListThatIsWrittenAnewHasItsRowsAgain) {
    Array list;
    later(list, {1, 2, 3});
    const auto nodes = nodesOf(list);
    later(list, {0x31});
    EXPECT_THAT(nodesOf(list), ElementsAre(nodes[0]));
    EXPECT_EQ(textsOf(list), rowsOf({0x31}));
    later(list, {4, 0xFF, 0, 6});
    EXPECT_THAT(nodesOf(list), ElementsAre(nodes[0], nodes[1], nodes[2], testing::_));
    EXPECT_EQ(textsOf(list), rowsOf({4, 0xFF, 0, 6}));
}

TEST(ListRowsTest, ARowThatSomebodyHoldsStaysAsItIs) {
    Array list;
    later(list, {1, 2});
    const Value held = list[1];
    later(list, {3, 4});
    EXPECT_EQ(textsOf(list), rowsOf({3, 4}));
    EXPECT_NE(list[1].asDictionary(), held.asDictionary());
    EXPECT_EQ(textsOf(held), rowOf(2, 1));
}

TEST(ListRowsTest, ARowThatIsAppendedAtAnyTimeIsNew) {
    Array list;
    later(list, {1});
    ASSERT_EQ(list.size(), 1u);
    list.clear();
    Dictionary& first = list.appendRow();
    EXPECT_TRUE(first.empty());
    first.set("key", 1);
    EXPECT_TRUE(list.appendRow().empty());
    EXPECT_EQ(valueOf(list), valueOf(Array{valueOf(Dictionary{{"key", 1}}), makeDictionary()}));
}

TEST(ListRowsTest, WhatIsNoRowIsNotUsedAgain) {
    constexpr auto appendTexts = [](Array& list, Bytes bytes, const void*) {
        for (const std::uint8_t byte : bytes)
            list.append(std::to_string(byte));
    };
    Array list;
    list.writeLater({appendTexts, nullptr}, std::vector<std::uint8_t>{7, 8});
    EXPECT_EQ(valueOf(list), valueOf(Array{"7", "8"}));
    later(list, {5, 6, 7});
    EXPECT_EQ(textsOf(list), rowsOf({5, 6, 7}));
    list.writeLater({appendTexts, nullptr}, std::vector<std::uint8_t>{9});
    EXPECT_EQ(valueOf(list), valueOf(Array{"9"}));
}

TEST(ListRowsTest, ACopiedListHasRowsOfItsOwn) {
    Array list;
    later(list, {1, 2});
    ASSERT_EQ(list.size(), 2u);
    later(list, {3});
    ASSERT_EQ(list.size(), 1u); // one row is left over
    Array copy = list;
    later(list, {4, 5});
    EXPECT_EQ(textsOf(list), rowsOf({4, 5}));
    EXPECT_EQ(textsOf(copy), rowsOf({3}));
    later(copy, {6, 7});
    EXPECT_EQ(textsOf(copy), rowsOf({6, 7}));
    EXPECT_EQ(textsOf(list), rowsOf({4, 5}));
}

TEST(ListRowsTest, FrozenListsHaveFrozenRowsAndNoneMore) {
    const ArrayRef list = makeArray();
    later(*list, {1, 2});
    const Value due = Value(list).copy(); // written when it is looked at
    EXPECT_EQ(textsOf(*due.asArray()), rowsOf({1, 2}));
    EXPECT_TRUE((*due.asArray())[0].asDictionary()->isFrozen());
    EXPECT_THROW(due.asArray()->appendRow(), std::logic_error);
}

/// Lists that come and go, are copied and looked at, or not, show what they were last given.
TEST(ListRowsTest, NobodyCanTellThemFromNewRows) {
    for (unsigned seed = 0; seed < 300; ++seed) {
        SCOPED_TRACE(seed);
        std::mt19937 random(seed);
        const ArrayRef list = makeArray();
        std::vector<std::uint8_t> shown;
        std::vector<std::pair<Value, std::vector<Row>>> held;
        for (int step = 0; step < 60; ++step) {
            switch (random() % 6) {
            case 0: held.emplace_back(Value(list).copy(), rowsOf(shown)); break;
            case 1: EXPECT_EQ(textsOf(*list), rowsOf(shown)); break;
            case 2:
                if (!list->empty())
                    held.emplace_back(std::make_shared<Array>(Array{(*list)[0]}),
                                      std::vector<Row>{rowOf(shown[0], 0)});
                break;
            default:
                shown.resize(random() % 5);
                for (std::uint8_t& byte : shown)
                    byte = static_cast<std::uint8_t>(random());
                later(*list, shown);
            }
            if (held.size() > 3) {
                EXPECT_EQ(textsOf(*held.front().first.asArray()), held.front().second);
                held.erase(held.begin());
            }
        }
        EXPECT_EQ(textsOf(*list), rowsOf(shown));
        for (const auto& [value, rows] : held)
            EXPECT_EQ(textsOf(*value.asArray()), rows);
    }
}

TEST(DictionaryClearTest, NothingOfWhatWasThereIsSeen) {
    Dictionary node{{"A", 1}, {"B", 2}, {"C", 3}};
    node.clear();
    EXPECT_TRUE(node.empty());
    EXPECT_EQ(node.size(), 0u);
    EXPECT_EQ(node.begin(), node.end());
    EXPECT_EQ(node.find("A"), nullptr);
    EXPECT_FALSE(node.remove("B"));
    EXPECT_EQ(valueOf(node), Value(makeDictionary()));
    node.setText("B", "two");
    node.addText("A", "one");
    EXPECT_EQ(textsOf(valueOf(node)), (Row{{"B", "two"}, {"A", "one"}}));
    EXPECT_EQ(node.find("C"), nullptr);
    EXPECT_TRUE(node.remove("B"));
    EXPECT_EQ(textsOf(valueOf(node)), (Row{{"A", "one"}}));
}

TEST(DictionaryClearTest, KeysThatAreHashedAreGoneToo) {
    Dictionary node;
    for (int i = 0; i < 40; ++i)
        node.set(std::to_string(i), i);
    node.clear();
    for (int i = 0; i < 40; ++i)
        EXPECT_EQ(node.find(std::to_string(i)), nullptr);
    for (int i = 39; i >= 0; --i)
        node.set(std::to_string(i), -i);
    EXPECT_EQ(node.size(), 40u);
    for (int i = 0; i < 40; ++i)
        EXPECT_EQ(node[std::to_string(i)], Value(-i));
}

TEST(DictionaryClearTest, CopiesShowWhatWasThereAndThenNothing) {
    const auto node = std::make_shared<Dictionary>(Dictionary{{"A", 1}, {"B", 2}});
    const Value before = Value(node).copy();
    node->clear();
    const Value empty = Value(node).copy();
    node->set("C", 3);
    const Value after = Value(node).copy();
    EXPECT_EQ(before, valueOf(Dictionary{{"A", 1}, {"B", 2}}));
    EXPECT_EQ(empty, Value(makeDictionary()));
    EXPECT_EQ(after, valueOf(Dictionary{{"C", 3}}));
    EXPECT_THROW(after.asDictionary()->clear(), std::logic_error);
}

TEST(DictionaryClearTest, WhatWasToBeWrittenLaterIsNot) {
    constexpr auto write = [](Dictionary& node, Bytes bytes, const void*) {
        node.setText("Byte", std::to_string(bytes[0]));
    };
    const std::vector<std::uint8_t> one{1};
    const std::vector<std::uint8_t> two{2};
    Dictionary node;
    node.writeLater({write, nullptr}, one);
    node.writeLater({write, nullptr}, two);
    node.clear();
    EXPECT_TRUE(node.empty());
    node.set("First", 1);
    node.writeLater({write, nullptr}, one);
    EXPECT_EQ(valueOf(node), valueOf(Dictionary{{"First", 1}, {"Byte", "1"}}));
}

} // namespace
} // namespace velmora
