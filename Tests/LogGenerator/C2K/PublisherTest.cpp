// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/Publisher.h"

#include "Tests/LogGenerator/C2K/ParserHarness.h"
#include "Tests/Support/NotedEffects.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

Value target(Value key, Value dict) {
    return std::make_shared<Dictionary>(Dictionary{{"key", std::move(key)}, {"dict", std::move(dict)}});
}

class PublisherTest : public testing::Test {
protected:
    /// Publishes "new" for "kA" to these targets; what `screen` then shows.
    std::string publishTo(std::initializer_list<Value> targets) {
        lookup->set("kA", std::make_shared<Array>(Array(targets)));
        publish("kA", "new");
        return shown(screen);
    }

    void publish(std::string_view valueKey, std::string_view text) {
        C2K::Targets targets;
        targets.use(lookup);
        C2K::Publisher(targets).publish(valueKey, text);
    }

    DictionaryRef screen = makeDictionary();
    DictionaryRef other = makeDictionary();
    DictionaryRef lookup = makeDictionary();
};

TEST_F(PublisherTest, WritesEveryTarget) {
    EXPECT_EQ(publishTo({target("One", screen), target("Two", other), target("Three", screen)}),
              "{One 'new', Three 'new'}");
    EXPECT_EQ(shown(other), "{Two 'new'}");
}

TEST_F(PublisherTest, AKeyWithoutAnArrayIsNotShown) {
    publish("kA", "new");
    lookup->set("kA", target("One", screen));
    publish("kA", "new");
    lookup = nullptr;
    publish("kA", "new");
    EXPECT_EQ(shown(screen), "{}");
}

TEST_F(PublisherTest, TheFirstOddTargetEndsIt) {
    const Value frozen = Value(makeDictionary()).copy();
    const Value missingDict = std::make_shared<Dictionary>(Dictionary{{"key", "Odd"}});
    const Value missingKey = std::make_shared<Dictionary>(Dictionary{{"dict", other}});
    for (const Value& odd :
         {target("Odd", frozen), target("Odd", "text"), target("Odd", makeArray()), target(7, other),
          target(makeDictionary(), other), missingDict, missingKey, Value("text"), Value(7)}) {
        screen = makeDictionary();
        EXPECT_EQ(publishTo({target("One", screen), odd, target("Two", screen)}), "{One 'new'}")
            << shown(odd);
        EXPECT_EQ(shown(other), "{}");
        EXPECT_EQ(shown(frozen), "{}");
    }
}

TEST_F(PublisherTest, AnOddTargetEndsNoOtherKey) {
    lookup->set("kB", std::make_shared<Array>(Array{target("B", screen)}));
    publishTo({"text"});
    publish("kB", "+1.00 dB");
    EXPECT_EQ(shown(screen), "{B '+1.00 dB'}");
}

TEST_F(PublisherTest, AKeyIsFoundByItsTextWhereverThatStandsInMemory) {
    lookup->set("kA", std::make_shared<Array>(Array{target("One", screen)}));
    lookup->set("kB", std::make_shared<Array>(Array{target("Two", screen)}));
    C2K::Targets targets;
    targets.use(lookup);
    std::string key = "kA";
    C2K::Publisher(targets).publish(key, "a");
    key.back() = 'B';
    C2K::Publisher(targets).publish(key, "b");
    EXPECT_EQ(shown(screen), "{One 'a', Two 'b'}");
}

TEST_F(PublisherTest, ThousandsOfKeysAreKeptApart) {
    std::vector<std::string> keys;
    for (int i = 0; i < 3000; ++i) {
        keys.push_back("k" + std::to_string(i));
        lookup->set(keys.back(), std::make_shared<Array>(Array{target(std::to_string(i), screen)}));
    }
    C2K::Targets targets;
    targets.use(lookup);
    for (const char* round : {"first", "second"})
        for (const std::string& key : keys)
            C2K::Publisher(targets).publish(key, key + round);
    ASSERT_EQ(screen->size(), keys.size());
    for (int i = 0; i < 3000; ++i)
        EXPECT_EQ((*screen)[std::to_string(i)], Value(keys[static_cast<std::size_t>(i)] + "second"));
}

TEST_F(PublisherTest, EffectsAreToldOfEveryValueShownOrNot) {
    const std::vector<std::pair<std::string, Value>> told = {{"kA", Value("new")}, {"kB", Value("+1.00 dB")}};
    lookup->set("kA", std::make_shared<Array>(Array{target("One", screen)}));
    NotedEffects effects;
    C2K::Targets targets;
    targets.use(lookup);
    const C2K::Publisher publisher(targets, &effects);
    publisher.publish("kA", "new");
    publisher.publish("kB", "+1.00 dB");
    EXPECT_EQ(effects.members, told);
    EXPECT_EQ(shown(screen), "{One 'new'}");
}

} // namespace
} // namespace velmora
