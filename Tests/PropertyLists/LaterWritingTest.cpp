// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/Value.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <iterator>
#include <random>
#include <string>
#include <vector>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::Pair;

int writings = 0;

/// Sets the keys that the table names, each to the byte's number.
struct Keys {
    std::vector<std::string> names;
};
const Keys a{{"A"}};
const Keys b{{"B"}};
const Keys ab{{"A", "B"}};

void setKeys(Dictionary& node, Bytes bytes, const void* table) {
    ++writings;
    for (const std::string& name : static_cast<const Keys*>(table)->names)
        node.setText(name, std::to_string(bytes[0]));
}

void later(Dictionary& node, const Keys& keys, std::uint8_t byte) {
    node.writeLater({setKeys, &keys}, std::vector<std::uint8_t>{byte});
}

void appendBytes(Array& node, Bytes bytes, const void*) {
    ++writings;
    for (const std::uint8_t byte : bytes)
        node.append(std::to_string(byte));
}

void later(Array& node, const std::vector<std::uint8_t>& bytes) {
    node.writeLater({appendBytes, nullptr}, bytes);
}

/// A list under a key, as a node of its own.
void setList(Dictionary& node, Bytes bytes, const void*) {
    const ArrayRef list = makeArray();
    appendBytes(*list, bytes, nullptr);
    node.set("List", list);
}

std::vector<std::pair<std::string, std::string>> textsOf(const Dictionary& node) {
    std::vector<std::pair<std::string, std::string>> texts;
    for (const auto& [key, value] : node)
        texts.emplace_back(key, *value.asString());
    return texts;
}

std::vector<std::string> textsOf(const Array& node) {
    std::vector<std::string> texts;
    for (const Value& value : node)
        texts.push_back(*value.asString());
    return texts;
}

TEST(LaterWritingTest, OnlyTheLastOfManyIsWrittenWhenSomebodyLooks) {
    Dictionary node;
    later(node, ab, 1); // sets the keys
    writings = 0;
    for (std::uint8_t byte = 2; byte < 10; ++byte)
        later(node, ab, byte);
    EXPECT_EQ(writings, 0);
    EXPECT_THAT(textsOf(node), ElementsAre(Pair("A", "9"), Pair("B", "9")));
    EXPECT_EQ(writings, 1);
    EXPECT_THAT(textsOf(node), ElementsAre(Pair("A", "9"), Pair("B", "9")));
    EXPECT_EQ(writings, 1);
}

TEST(LaterWritingTest, KeysAreThereFromTheFirstTime) {
    Dictionary node;
    later(node, b, 1);
    later(node, a, 2);
    later(node, b, 3);
    EXPECT_EQ(node.size(), 2u);
    EXPECT_TRUE(node.contains("A"));
    EXPECT_THAT(textsOf(node), ElementsAre(Pair("B", "3"), Pair("A", "2")));
}

TEST(LaterWritingTest, WhatWasAskedLastIsShown) {
    Dictionary node;
    later(node, ab, 1);
    later(node, b, 2);
    later(node, b, 3);
    later(node, ab, 4);
    EXPECT_THAT(textsOf(node), ElementsAre(Pair("A", "4"), Pair("B", "4")));
    later(node, ab, 5);
    later(node, b, 6);
    EXPECT_THAT(textsOf(node), ElementsAre(Pair("A", "5"), Pair("B", "6")));
    later(node, ab, 7);
    node.setText("A", "set");
    EXPECT_THAT(textsOf(node), ElementsAre(Pair("A", "set"), Pair("B", "7")));
    node.set("B", "set");
    later(node, ab, 8);
    EXPECT_EQ(node["A"], Value("8"));
    EXPECT_EQ(*node.find("B"), Value("8"));
}

TEST(LaterWritingTest, ARemovedKeyComesBackAtTheEnd) {
    Dictionary node;
    later(node, ab, 1);
    later(node, ab, 2);
    EXPECT_FALSE(node.remove("C"));
    EXPECT_TRUE(node.remove("A"));
    EXPECT_THAT(textsOf(node), ElementsAre(Pair("B", "2")));
    later(node, ab, 3);
    EXPECT_THAT(textsOf(node), ElementsAre(Pair("B", "3"), Pair("A", "3")));
}

TEST(LaterWritingTest, AKeyThatIsRemovedLaterIsGoneWhenSomebodyLooks) {
    Dictionary node;
    later(node, ab, 1);
    later(node, a, 1);
    writings = 0;
    later(node, ab, 2);
    node.removeLater("B");
    later(node, a, 3);
    EXPECT_EQ(writings, 0);
    EXPECT_FALSE(node.contains("B"));
    EXPECT_EQ(node.size(), 1u);
    EXPECT_THAT(textsOf(node), ElementsAre(Pair("A", "3")));
    node.removeLater("B");
    later(node, ab, 4);
    EXPECT_THAT(textsOf(node), ElementsAre(Pair("A", "4"), Pair("B", "4")));
    node.removeLater("A"); // a second one goes at once
    EXPECT_THAT(textsOf(node), ElementsAre(Pair("B", "4")));
    later(node, ab, 5);
    EXPECT_THAT(textsOf(node), ElementsAre(Pair("B", "5"), Pair("A", "5")));
    EXPECT_THROW(Value(std::make_shared<Dictionary>(node)).copy().asDictionary()->removeLater("B"),
                 std::logic_error);
}

/// What writing later must look like: the same done at once.
class AtOnce {
public:
    void write(const Keys& keys, std::uint8_t byte) {
        const std::vector<std::uint8_t> bytes{byte};
        setKeys(node, bytes, &keys);
    }

    Dictionary node;
};

TEST(LaterWritingTest, NobodyCanTellItFromWritingAtOnce) {
    const Keys bc{{"B", "C"}};
    const Keys* const keys[] = {&a, &b, &ab, &bc};
    for (unsigned seed = 0; seed < 300; ++seed) {
        SCOPED_TRACE(seed);
        std::mt19937 random(seed);
        const DictionaryRef node = makeDictionary();
        AtOnce wanted;
        std::vector<std::pair<Value, Dictionary>> copies;
        for (int step = 0; step < 60; ++step) {
            const auto byte = static_cast<std::uint8_t>(step);
            switch (random() % 9) {
            case 0:
                node->removeLater("B");
                wanted.node.remove("B");
                break;
            case 1:
                node->setText("D", std::to_string(step));
                wanted.node.setText("D", std::to_string(step));
                break;
            case 2: EXPECT_EQ(node->remove("A"), wanted.node.remove("A")); break;
            case 3: EXPECT_EQ(textsOf(*node), textsOf(wanted.node)); break;
            case 4: copies.emplace_back(Value(node).copy(), wanted.node); break;
            default: {
                const Keys& chosen = *keys[random() % std::size(keys)];
                later(*node, chosen, byte);
                wanted.write(chosen, byte);
            }
            }
            if (copies.size() > 3) { // so that they are used again
                const auto& [copy, shown] = copies.front();
                EXPECT_EQ(textsOf(*copy.asDictionary()), textsOf(shown));
                copies.erase(copies.begin());
            }
        }
        EXPECT_EQ(textsOf(*node), textsOf(wanted.node));
        for (const auto& [copy, shown] : copies)
            EXPECT_EQ(textsOf(*copy.asDictionary()), textsOf(shown));
    }
}

TEST(LaterWritingTest, AnArrayIsMadeAnew) {
    Array node{"old"};
    later(node, {1, 2});
    EXPECT_EQ(node.size(), 2u);
    EXPECT_EQ(node[1], Value("2"));
    later(node, {});
    EXPECT_TRUE(node.empty());
    later(node, {3, 4, 5});
    node.append("more");
    node.removeFirst(1);
    EXPECT_THAT(textsOf(node), ElementsAre("4", "5", "more"));
    later(node, {6});
    node.clear();
    EXPECT_TRUE(node.empty());
}

TEST(LaterWritingTest, NodesAreEqualByWhatTheyShow) {
    const DictionaryRef node = makeDictionary();
    later(*node, a, 1);
    later(*node, a, 2);
    EXPECT_EQ(Value(node), Value(std::make_shared<Dictionary>(Dictionary{{"A", "2"}})));
    const ArrayRef list = makeArray();
    later(*list, {7});
    EXPECT_EQ(Value(list), Value(std::make_shared<Array>(Array{"7"})));
}

TEST(FrozenCopiesTest, ACopyShowsWhatWasThereWheneverItIsLookedAt) {
    const DictionaryRef node = makeDictionary();
    const ArrayRef list = makeArray();
    later(*node, a, 0);
    node->set("List", list);
    std::vector<Value> copies;
    for (std::uint8_t i = 1; i <= 20; ++i) { // more than are used again
        later(*node, a, i);
        later(*list, {i});
        copies.push_back(Value(node).copy());
        if (i % 3 == 0) {
            EXPECT_EQ((*node)["A"], Value(std::to_string(i))); // looking at the node changes no copy
        }
    }
    for (std::size_t i = 0; i < copies.size(); ++i) {
        const Dictionary& copy = *copies[i].asDictionary();
        EXPECT_TRUE(copy.isFrozen());
        EXPECT_EQ(copy["A"], Value(std::to_string(i + 1)));
        EXPECT_THAT(textsOf(*copy["List"].asArray()), ElementsAre(std::to_string(i + 1)));
        EXPECT_TRUE(copy["List"].asArray()->isFrozen());
    }
}

TEST(FrozenCopiesTest, CopiesThatNobodyHoldsAreUsedAgainAndSoShowTheLatest) {
    const DictionaryRef node = makeDictionary();
    const DictionaryRef inner = makeDictionary();
    node->set("Inner", inner);
    node->set("Text", "");
    Value held;
    for (int i = 0; i < 30; ++i) {
        inner->set("Number", i);
        if (i == 10)
            inner->set("New", "key");
        if (i == 20)
            inner->remove("Number");
        node->setText("Text", std::to_string(i));
        const Value copy = Value(node).copy();
        EXPECT_EQ(copy, Value(node)) << i;
        if (i == 15)
            held = copy;
    }
    EXPECT_EQ((*held.asDictionary())["Text"], Value("15"));
    const Dictionary& heldInner = *(*held.asDictionary())["Inner"].asDictionary();
    EXPECT_EQ(heldInner["Number"], Value(15));
    EXPECT_EQ(heldInner["New"], Value("key"));
}

TEST(FrozenCopiesTest, WhatHasNotChangedIsTheSameCopy) {
    const DictionaryRef node = makeDictionary();
    const DictionaryRef left = makeDictionary();
    const ArrayRef right = makeArray();
    later(*left, a, 1);
    node->set("Left", left);
    node->set("Right", right);
    const Value first = Value(node).copy();
    EXPECT_EQ(Value(node).copy().asDictionary(), first.asDictionary());
    EXPECT_EQ((*left)["A"], Value("1"));
    EXPECT_EQ(Value(node).copy().asDictionary(), first.asDictionary());
    right->append("new");
    const Value second = Value(node).copy();
    EXPECT_NE(second.asDictionary(), first.asDictionary());
    EXPECT_EQ((*second.asDictionary())["Left"].asDictionary(),
              (*first.asDictionary())["Left"].asDictionary());
    EXPECT_TRUE((*first.asDictionary())["Right"].asArray()->empty());
    EXPECT_THAT(textsOf(*(*second.asDictionary())["Right"].asArray()), ElementsAre("new"));
}

TEST(FrozenCopiesTest, AListThatAFrozenCopyMakesIsFrozenToo) {
    const DictionaryRef node = makeDictionary();
    const std::vector<std::uint8_t> bytes{1, 2};
    node->writeLater({setList, nullptr}, bytes);
    node->writeLater({setList, nullptr}, bytes);
    const Value copy = Value(node).copy();
    const Array* list = (*copy.asDictionary())["List"].asArray();
    EXPECT_TRUE(list->isFrozen());
    EXPECT_THAT(textsOf(*list), ElementsAre("1", "2"));
    EXPECT_FALSE((*node)["List"].asArray()->isFrozen());
    EXPECT_THROW(copy.asDictionary()->writeLater({setList, nullptr}, bytes), std::logic_error);
}

TEST(FrozenCopiesTest, ACopiedNodeHasCopiesOfItsOwn) {
    const DictionaryRef node = makeDictionary();
    later(*node, a, 1);
    const Value first = Value(node).copy();
    const auto other = std::make_shared<Dictionary>(*node);
    other->setText("A", "other");
    EXPECT_EQ((*Value(other).copy().asDictionary())["A"], Value("other"));
    EXPECT_EQ((*Value(node).copy().asDictionary())["A"], Value("1"));
}

} // namespace
} // namespace velmora
