// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Model/VelmoraModelNode.h"

#include "LogGenerator/ArrayLock.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <thread>

namespace velmora {

/// Inspects the lock's mutex from another thread, and releases what the lock keeps by design.
class ArrayLockProbe {
public:
    static bool isHeldElsewhere() {
        bool held = false;
        std::thread([&held] {
            std::recursive_mutex& mutex = ArrayLock::initialize().mutex;
            held = !mutex.try_lock();
            if (!held)
                mutex.unlock();
        }).join();
        return held;
    }
    static void giveBack(int times) {
        for (int i = 0; i < times; ++i)
            ArrayLock::initialize().mutex.unlock();
    }
};

namespace {

using testing::ElementsAre;
using testing::Pair;
using testing::UnorderedElementsAre;

DictionaryRef dictionary(std::initializer_list<Dictionary::Entry> entries) {
    return std::make_shared<Dictionary>(entries);
}

ArrayRef array(std::initializer_list<Value> values) {
    return std::make_shared<Array>(values);
}

std::vector<std::string> childNames(const VelmoraModelNode& node) {
    std::vector<std::string> names;
    for (const NodeRef& child : *node.childNodes())
        names.push_back(child->displayName());
    return names;
}

std::vector<std::string> paths(const PathDictionary& dictionary) {
    std::vector<std::string> result;
    for (const auto& [path, node] : dictionary)
        result.push_back(path);
    return result;
}

TEST(VelmoraModelNodeTest, EmptyDisplayGivesAnInnerRootWithoutChildren) {
    PathDictionary byPath;
    const NodeRef root = VelmoraModelNode::makeTreeFromObject(makeDictionary(), byPath);
    EXPECT_EQ(root->displayName(), "Velmora");
    EXPECT_EQ(root->value(), nullptr);
    ASSERT_NE(root->childNodes(), nullptr);
    EXPECT_TRUE(root->childNodes()->empty());
    EXPECT_THAT(byPath, UnorderedElementsAre(Pair("/", root)));
}

TEST(VelmoraModelNodeTest, DisplayOfOnlyTheSortedMarkerGivesTheSame) {
    PathDictionary byPath;
    const NodeRef root = VelmoraModelNode::makeTreeFromObject(dictionary({{"_sorted", "_sorted"}}), byPath);
    ASSERT_NE(root->childNodes(), nullptr);
    EXPECT_TRUE(root->childNodes()->empty());
    EXPECT_THAT(paths(byPath), ElementsAre("/"));
}

TEST(VelmoraModelNodeTest, StringIsALeafWithItsValue) {
    PathDictionary byPath;
    static_cast<void>(VelmoraModelNode::makeTreeFromObject(dictionary({{"RSSI", "-80 dBm"}}), byPath));
    const NodeRef leaf = byPath.at("/RSSI");
    EXPECT_EQ(leaf->displayName(), "RSSI");
    EXPECT_EQ(leaf->childNodes(), nullptr);
    ASSERT_NE(leaf->value(), nullptr);
    EXPECT_EQ(*leaf->value(), "-80 dBm");
}

TEST(VelmoraModelNodeTest, EveryOtherKindIsALeafThatSaysUnknown) {
    const Value kinds[] = {Value(7), Value(0.5), Value(true), Value(Date()),
                           Value(Data(std::vector<std::uint8_t>{1}))};
    for (const Value& kind : kinds) {
        PathDictionary byPath;
        static_cast<void>(VelmoraModelNode::makeTreeFromObject(dictionary({{"Odd", kind}}), byPath));
        const NodeRef leaf = byPath.at("/Odd");
        EXPECT_EQ(leaf->childNodes(), nullptr) << nameOf(kind.kind());
        EXPECT_EQ(*leaf->value(), "(unknown)") << nameOf(kind.kind());
    }
}

TEST(VelmoraModelNodeTest, NoDisplayIsALeafThatSaysUnknown) {
    PathDictionary byPath;
    const NodeRef root = VelmoraModelNode::makeTreeFromObject(Value(), byPath);
    EXPECT_EQ(root->childNodes(), nullptr);
    EXPECT_EQ(*root->value(), "(unknown)");
}

TEST(VelmoraModelNodeTest, ArrayElementsAreNamedByTheirPlace) {
    PathDictionary byPath;
    const NodeRef root =
        VelmoraModelNode::makeTreeFromObject(dictionary({{"Cells", array({"a", "b", "c"})}}), byPath);
    EXPECT_THAT(childNames(*root->childNodes()->front()), ElementsAre("0", "1", "2"));
    EXPECT_THAT(paths(byPath), UnorderedElementsAre("/", "/Cells", "/Cells/0", "/Cells/1", "/Cells/2"));
    EXPECT_EQ(*byPath.at("/Cells/2")->value(), "c");
}

TEST(VelmoraModelNodeTest, UnsortedDictionaryKeepsItsOrderAndItsKeys) {
    PathDictionary byPath;
    const NodeRef root = VelmoraModelNode::makeTreeFromObject(
        dictionary({{"Z", "1"}, {"A", "2"}, {"3;120", "3"}, {"None", Value()}}), byPath);
    EXPECT_THAT(childNames(*root), ElementsAre("Z", "A", "3;120")); // the key without a value is skipped
}

TEST(VelmoraModelNodeTest, SortedDictionaryOrdersByBytesAndShowsWhatFollowsTheSemicolon) {
    PathDictionary byPath;
    const NodeRef root = VelmoraModelNode::makeTreeFromObject(dictionary({{"2;7", "third"},
                                                                          {"plain", "sixth"},
                                                                          {"10;7", "first"},
                                                                          {"1;2;3", "whole key"},
                                                                          {"Z", "fifth"},
                                                                          {"3;120", "fourth"},
                                                                          {"_sorted", false}}),
                                                              byPath);
    // 10;7 < 1;2;3 < 2;7 < 3;120 < Z < plain: ';' is above the digits, capitals are below small letters.
    EXPECT_THAT(childNames(*root), ElementsAre("7", "1;2;3", "7", "120", "Z", "plain"));
    EXPECT_EQ(*root->childNodes()->front()->value(), "first");
}

TEST(VelmoraModelNodeTest, TheLastSiblingOfANameHasThePath) {
    PathDictionary byPath;
    const NodeRef root = VelmoraModelNode::makeTreeFromObject(
        dictionary({{"_sorted", ""}, {"2;40", "later"}, {"1;40", "earlier"}}), byPath);
    EXPECT_THAT(childNames(*root), ElementsAre("40", "40"));
    EXPECT_EQ(*byPath.at("/40")->value(), "later");
    EXPECT_EQ(byPath.at("/40"), root->childNodes()->back());
}

TEST(VelmoraModelNodeTest, NodesOutliveTheirTree) {
    NodeRef leaf;
    {
        PathDictionary byPath;
        const NodeRef root = VelmoraModelNode::makeTreeFromObject(dictionary({{"A", "1"}}), byPath);
        leaf = byPath.at("/A");
    }
    EXPECT_EQ(*leaf->value(), "1");
}

TEST(ArrayLockTest, NestedPairKeepsTheMutexUntilTheOutermostUnlockAndOneHoldBeyond) {
    ASSERT_EQ(ArrayLock::depth(), 0);
    ArrayLock::lockArray();
    ArrayLock::lockArray();
    EXPECT_EQ(ArrayLock::depth(), 2);
    ArrayLock::unlockArray();
    EXPECT_EQ(ArrayLock::depth(), 1);
    EXPECT_TRUE(ArrayLockProbe::isHeldElsewhere());
    ArrayLock::unlockArray();
    EXPECT_EQ(ArrayLock::depth(), 0);
    // Released once for two takes: one hold is left on this thread.
    EXPECT_TRUE(ArrayLockProbe::isHeldElsewhere());
    ArrayLockProbe::giveBack(1);
    EXPECT_FALSE(ArrayLockProbe::isHeldElsewhere());
}

TEST(ArrayLockTest, SinglePairReleasesTheMutex) {
    ArrayLock::lockArray();
    EXPECT_TRUE(ArrayLockProbe::isHeldElsewhere());
    ArrayLock::unlockArray();
    EXPECT_FALSE(ArrayLockProbe::isHeldElsewhere());
}

TEST(ArrayLockTest, TwoHundredAndFiftySixTakesWrapTheCount) {
    for (int i = 0; i < 256; ++i)
        ArrayLock::lockArray();
    EXPECT_EQ(ArrayLock::depth(), 0);
    ArrayLockProbe::giveBack(256);
    EXPECT_FALSE(ArrayLockProbe::isHeldElsewhere());
}

TEST(ArrayLockTest, BuildingATreeHoldsItForNestedArraysAndBalancesTheCount) {
    PathDictionary byPath;
    static_cast<void>(VelmoraModelNode::makeTreeFromObject(array({array({"x"})}), byPath));
    EXPECT_EQ(ArrayLock::depth(), 0);
    EXPECT_TRUE(ArrayLockProbe::isHeldElsewhere()); // the nested take, kept as above
    ArrayLockProbe::giveBack(1);
    EXPECT_FALSE(ArrayLockProbe::isHeldElsewhere());
}

} // namespace
} // namespace velmora
