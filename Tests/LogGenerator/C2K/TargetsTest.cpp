// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/Targets.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdint>
#include <memory>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace velmora {
namespace {

using C2K::LabelledFields;
using C2K::Targets;

class TargetsTest : public testing::Test {
protected:
    TargetsTest() {
        for (int i = 0; i < 300; ++i)
            keys.push_back("k" + std::to_string(100 + i));
        fill();
    }

    /// Has the screen show every key under a label.
    void fill() {
        for (const std::string& key : keys)
            show(key, key + " label");
    }

    void show(const std::string& key, const std::string& label) {
        const Value target = std::make_shared<Dictionary>(Dictionary{{"key", label}, {"dict", screen}});
        lookup->set(key, std::make_shared<Array>(Array{target}));
    }

    /// Expects that these keys, from the first on and before the last, have as many targets each.
    void expectTargets(std::size_t first, std::size_t last, std::size_t count) {
        for (std::size_t i = first; i < last; ++i)
            ASSERT_EQ(targets.of(keys[i]).size(), count) << keys[i];
    }

    Targets targets;
    DictionaryRef screen = makeDictionary();
    DictionaryRef lookup = makeDictionary();
    std::vector<std::string> keys; ///< all in places of their own
};

TEST_F(TargetsTest, WhatHasBeenFoundIsKeptUntilThereIsAnotherLookup) {
    targets.use(lookup);
    expectTargets(0, 127, 1);
    EXPECT_EQ(targets.of(keys[7])[0].display, screen.get());
    EXPECT_EQ(*targets.of(keys[7])[0].label, "k107 label");
    lookup->clear();
    targets.use(lookup);
    expectTargets(0, 127, 1);
    lookup = makeDictionary();
    targets.use(lookup);
    expectTargets(0, 127, 0);
    targets.use(nullptr);
    expectTargets(0, 127, 0);
}

TEST_F(TargetsTest, ALookupInThePlaceOfAnEarlierOneIsAnother) {
    const auto storage = std::make_shared<Dictionary>();
    // Two owners of one place in memory.
    const DictionaryRef first(std::make_shared<int>(1), storage.get());
    const DictionaryRef second(std::make_shared<int>(2), storage.get());
    targets.use(first);
    expectTargets(0, 1, 0);
    *storage = *lookup;
    targets.use(first);
    expectTargets(0, 1, 0);
    targets.use(second);
    expectTargets(0, 1, 1);
}

TEST_F(TargetsTest, SoManyKeysAreKeptAndThenAllAreForgotten) {
    targets.use(lookup);
    expectTargets(0, 128, 1);
    lookup->clear();
    expectTargets(128, 129, 0);
    expectTargets(0, 1, 0);
    // As many are kept afterwards, two of them being those.
    fill();
    expectTargets(1, 126, 1);
    expectTargets(0, 1, 0);
    lookup->clear();
    expectTargets(1, 126, 1);
}

TEST_F(TargetsTest, KeysThatAreSoFarApartAreKeptSideBySide) {
    constexpr std::size_t distance = 0x10000; // addresses that differ in no bit that is looked at
    std::string text(3 * distance, ' ');
    std::vector<std::string_view> apart;
    for (std::size_t i = 0; i < 3; ++i) {
        text.replace(i * distance, keys[i].size(), keys[i]);
        apart.push_back(std::string_view(text).substr(i * distance, keys[i].size()));
    }
    targets.use(lookup);
    for (const std::string_view key : apart)
        EXPECT_EQ(*targets.of(key)[0].label, std::string(key) + " label");
    lookup->clear();
    for (const std::string_view key : apart)
        EXPECT_EQ(targets.of(key).size(), 1U) << key;
}

TEST_F(TargetsTest, AKeyWhoseBytesBecomeAnotherTakesNoMoreRoom) {
    targets.use(lookup);
    expectTargets(0, 1, 1);
    std::string changing = "k100";
    for (const std::string& key : keys) {
        std::copy(key.begin(), key.end(), changing.begin());
        ASSERT_EQ(*targets.of(changing)[0].label, key + " label");
    }
    lookup->clear();
    expectTargets(0, 1, 1);
}

constexpr C2K::ValueField fields[] = {
    {"k100", u8At(0), integer("%d")},
    {"other", u8At(1), integer("%d")},
    {"k101", u8At(2), integer("%d")},
};

TEST_F(TargetsTest, ATableIsKeptScreenByScreen) {
    targets.use(lookup);
    const Targets::Screens& screens = targets.of(fields);
    ASSERT_TRUE(screens);
    ASSERT_EQ(screens->size(), 1U);
    EXPECT_EQ(screens->front().display, screen.get());
    LabelledFields labels(screens->front().labels);
    const LabelledFields::Entry first = labels.next();
    EXPECT_EQ(first.place, 0U);
    EXPECT_EQ(first.label, "k100 label");
    const LabelledFields::Entry second = labels.next();
    EXPECT_EQ(second.place, 2U);
    EXPECT_EQ(second.label, "k101 label");
    EXPECT_TRUE(labels.atEnd());
    lookup->clear();
    EXPECT_EQ(&targets.of(fields), &screens);
    EXPECT_EQ(screens->size(), 1U);
}

TEST_F(TargetsTest, ATableWhoseLabelsAreTooLongIsNotKeptSo) {
    show("k101", std::string(255, 'l'));
    targets.use(lookup);
    EXPECT_TRUE(targets.of(fields));
    show("k101", std::string(256, 'l'));
    Targets others;
    others.use(lookup);
    EXPECT_FALSE(others.of(fields));
}

TEST(LabelledFieldsTest, TakeWhatAByteCanSayAndAKibibyteCanHold) {
    std::vector<std::uint8_t> bytes;
    EXPECT_FALSE(LabelledFields::append(bytes, 256, "label"));
    EXPECT_FALSE(LabelledFields::append(bytes, 0, std::string(256, 'l')));
    EXPECT_TRUE(bytes.empty());
    EXPECT_TRUE(LabelledFields::append(bytes, 255, std::string(255, 'a'))); // 257 bytes
    EXPECT_TRUE(LabelledFields::append(bytes, 254, std::string(255, 'b'))); // 514
    EXPECT_TRUE(LabelledFields::append(bytes, 0, std::string(255, 'c')));   // 771
    EXPECT_FALSE(LabelledFields::append(bytes, 1, std::string(252, 'd')));  // 1025
    EXPECT_TRUE(LabelledFields::append(bytes, 1, std::string(251, 'd')));   // 1024
    EXPECT_FALSE(LabelledFields::append(bytes, 2, ""));
    LabelledFields labels(bytes);
    const std::pair<std::size_t, std::string> wanted[] = {{255, std::string(255, 'a')},
                                                          {254, std::string(255, 'b')},
                                                          {0, std::string(255, 'c')},
                                                          {1, std::string(251, 'd')}};
    for (const auto& [place, label] : wanted) {
        ASSERT_FALSE(labels.atEnd());
        const LabelledFields::Entry entry = labels.next();
        EXPECT_EQ(entry.place, place);
        EXPECT_EQ(entry.label, label);
    }
    EXPECT_TRUE(labels.atEnd());
}

} // namespace
} // namespace velmora
