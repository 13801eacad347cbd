// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/LookupWriter.h"

#include "Tests/LogGenerator/C2K/ParserHarness.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

Value target(Value key, Value dict) {
    return std::make_shared<Dictionary>(Dictionary{{"key", std::move(key)}, {"dict", std::move(dict)}});
}

class LookupWriterTest : public testing::Test {
protected:
    /// Publishes "new" for "kA" to these targets; what `screen` then shows.
    std::string publishTo(std::initializer_list<Value> targets) {
        lookup->set("kA", std::make_shared<Array>(Array(targets)));
        publish("kA", "new");
        return shown(screen);
    }

    void publish(std::string_view valueKey, std::string_view text) {
        const Field field{valueKey, computed, plainText()};
        C2K::LookupWriter(*lookup).text(field, text);
    }

    DictionaryRef screen = makeDictionary();
    DictionaryRef other = makeDictionary();
    DictionaryRef lookup = makeDictionary();
};

TEST_F(LookupWriterTest, WritesEveryTarget) {
    EXPECT_EQ(publishTo({target("One", screen), target("Two", other), target("Three", screen)}),
              "{One 'new', Three 'new'}");
    EXPECT_EQ(shown(other), "{Two 'new'}");
}

TEST_F(LookupWriterTest, AKeyWithoutAnArrayIsNotShown) {
    publish("kA", "new");
    lookup->set("kA", target("One", screen));
    publish("kA", "new");
    EXPECT_EQ(shown(screen), "{}");
}

TEST_F(LookupWriterTest, TheFirstInvalidTargetEndsIt) {
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

TEST_F(LookupWriterTest, AnInvalidTargetEndsNoOtherKey) {
    lookup->set("kB", std::make_shared<Array>(Array{target("B", screen)}));
    publishTo({"text"});
    publish("kB", "+1.00 dB");
    EXPECT_EQ(shown(screen), "{B '+1.00 dB'}");
}

constexpr List numbered{"kA", List::Entries::Numbered, "(none)"};
constexpr Field level{"", computed, real("%.1f dB")};

TEST_F(LookupWriterTest, NumberedListsAreSortedScreensOfTheirOwn) {
    lookup->set("kA", std::make_shared<Array>(Array{target("One", screen), target("Two", screen)}));
    C2K::LookupWriter writer(*lookup);
    writer.beginList(numbered);
    writer.entryNumber(2, 501);
    writer.real(level, -3);
    writer.entryNumber(0, 17);
    writer.real(level, 1.5);
    writer.endList();
    const std::string list = "{_sorted '_sorted', 2;501 '-3.0 dB', 0;17 '1.5 dB'}";
    EXPECT_EQ(shown(screen), "{One " + list + ", Two " + list + "}");
    writer.beginList(numbered);
    writer.endList();
    EXPECT_EQ(shown(screen), "{One '(none)', Two '(none)'}");
}

} // namespace
} // namespace velmora
