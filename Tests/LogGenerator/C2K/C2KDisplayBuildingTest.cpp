// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/PropertyList.h"
#include "Tests/LogGenerator/C2K/C2KGeneratorFixture.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using C2KDisplayBuildingTest = C2KGeneratorFixture;

TEST_F(C2KDisplayBuildingTest, FirstCallBuildsTheDisplayAndReturnsIt) {
    const CapturedLog log;
    const Value built = C2KLogGenerator::getDisplayFromState(state);
    ASSERT_NE(built.asDictionary(), nullptr);
    EXPECT_EQ(built.asDictionary(), state["Display"].asDictionary());
    EXPECT_EQ(display(), emptyDisplay);
    EXPECT_EQ(shown(state["ExtraInfo"]), "{}");
    EXPECT_EQ(log.lines(), (LogLines(2, {LogPriority::Warning, "Processing the template"})));
    // The template is not what is shown.
    EXPECT_EQ((*state["Template"].asDictionary())["Fingers"], Value("kFingerC2I"));
}

TEST_F(C2KDisplayBuildingTest, ADisplayThatIsThereIsReturnedAsItIs) {
    state.set("Display", "text");
    const CapturedLog log;
    EXPECT_EQ(C2KLogGenerator::getDisplayFromState(state), Value("text"));
    EXPECT_THAT(log.lines(), IsEmpty());
    EXPECT_FALSE(state.contains("Lookup"));
    EXPECT_FALSE(state.contains("Template"));
}

TEST_F(C2KDisplayBuildingTest, LookupNamesLabelAndScreenOfEveryValueKey) {
    build();
    const Dictionary& lookup = *state["Lookup"].asDictionary();
    std::vector<std::string> keys;
    for (const auto& [key, targets] : lookup)
        keys.push_back(key);
    EXPECT_THAT(keys, ElementsAre("kFingerC2I", "kUnusedKey", "kChannel", "kServingPNOffset"));
    const Array& targets = *lookup["kFingerC2I"].asArray();
    ASSERT_EQ(targets.size(), 2u);
    const Dictionary& root = *state["Display"].asDictionary();
    EXPECT_EQ((*targets[0].asDictionary())["key"], Value("Fingers"));
    EXPECT_EQ((*targets[0].asDictionary())["dict"].asDictionary(), &root);
    EXPECT_EQ((*targets[1].asDictionary())["key"], Value("3;Fingers"));
    EXPECT_EQ((*targets[1].asDictionary())["dict"].asDictionary(), root["EV-DO"].asDictionary());
}

TEST_F(C2KDisplayBuildingTest, LabelsOfAnyLengthShowTheirFields) {
    for (const std::size_t length : {255u, 256u, 2000u}) {
        const std::string label(length, 'L');
        resources.put("C2KTemplate", "plist", dictionary({{label, "kColorCode"}, {"Channel", "kChannel"}}));
        Dictionary itsState;
        // EV-DO status: 50 bytes, all zero after the header.
        generator->updateState(itsState, recordWith(0x1183, 50));
        generator->updateState(itsState, recordWith(0x1183, 50));
        EXPECT_EQ(shown(generator->display(itsState)), "{" + label + " '0', Channel '0'}") << length;
    }
}

TEST_F(C2KDisplayBuildingTest, TemplateIsLoadedOnce) {
    build();
    resources.put("C2KTemplate", "plist", dictionary({}));
    state.remove("Display");
    build();
    EXPECT_EQ(display(), emptyDisplay);
    update(noFingers()); // the lookup is the new display's
    EXPECT_EQ(display(), fingersShown);
}

TEST_F(C2KDisplayBuildingTest, BadTemplateIsReportedOnEveryAttemptAndTriedAgain) {
    const Data rubbish = hex("72 75 62");
    const auto xml = writeXMLPropertyList(Value(makeArray()));
    ASSERT_TRUE(xml);
    const Data noDictionary(std::vector<std::uint8_t>(xml->begin(), xml->end()));
    resources.put("Elsewhere", "plist", dictionary({}));
    for (const Data& content : {rubbish, noDictionary}) {
        state = Dictionary();
        resources.put("C2KTemplate", "plist", content);
        CapturedLog log;
        EXPECT_TRUE(C2KLogGenerator::getDisplayFromState(state).isNone());
        EXPECT_THAT(log.textsAt(LogPriority::Error), ElementsAre("Cannot load C2K template for display"));
        EXPECT_TRUE(state.empty());

        log.clear();
        generator->updateState(state, recordWith(0x1192, 241, {{13, 4, 3}}));
        generator->updateState(state, recordWith(0x1183, 50));
        EXPECT_THAT(log.textsAt(LogPriority::Error), ElementsAre("Cannot load C2K template for display",
                                                                 "Cannot load C2K template for display"));
        // Decoded into nothing, but for the running values.
        EXPECT_EQ(shown(std::make_shared<Dictionary>(state)), "{FLDataSeqNum 3, FLDataSent 0}");
        EXPECT_TRUE(generator->generateLogUsingState(state).isNone());
        EXPECT_EQ(state["DisplayState"].asData()->size(), 291u);
    }
    resources.put("C2KTemplate", "plist", dictionary({{"Fingers", "kFingerC2I"}}));
    update(noFingers());
    EXPECT_EQ(display(), "{Fingers '(none)'}");
}

TEST(C2KTemplateLoadingTest, MissingTemplateIsReported) {
    const FakeResources resources;
    Dictionary state;
    const CapturedLog log;
    EXPECT_TRUE(C2KLogGenerator::getDisplayFromState(state).isNone());
    EXPECT_THAT(log.lines(),
                ElementsAre(CapturedLog::Line{LogPriority::Notice, "no resource C2KTemplate.plist in memory"},
                            CapturedLog::Line{LogPriority::Error, "Cannot load C2K template for display"}));
}

TEST(C2KProcessTemplateTest, CopiesMarkersSkipsForeignValuesAndNests) {
    const Value source = dictionary({
        {"Number", 7},
        {"List", makeArray()},
        {"Flag", true},
        {"_sorted", "_sorted"},
        {"Other", "_sorted"},
        {"Empty", ""},
        {"Inner", dictionary({{"Innermost", dictionary({{"C", "kC"}})}, {"C", "kC"}})},
        {"Hollow", dictionary({})},
    });
    const DictionaryRef display = makeDictionary();
    Dictionary lookup;
    const CapturedLog log;
    C2KLogGenerator::processTemplate(*source.asDictionary(), display, lookup);
    EXPECT_EQ(shown(display), "{_sorted '_sorted', Other '_sorted', Empty '', "
                              "Inner {Innermost {C ''}, C ''}, Hollow {}}");
    std::vector<std::string> keys;
    for (const auto& [key, targets] : lookup)
        keys.push_back(key);
    EXPECT_THAT(keys, ElementsAre("", "kC")); // an empty text is a key that no parser publishes
    EXPECT_EQ(lookup["kC"].asArray()->size(), 2u);
    // One a level, and the levels are four: Innermost, Inner, Hollow, the root.
    EXPECT_EQ(log.lines(), LogLines(4, {LogPriority::Warning, "Processing the template"}));
}

TEST(C2KProcessTemplateTest, AnEmptyTemplateIsReportedToo) {
    const DictionaryRef display = makeDictionary();
    Dictionary lookup;
    const CapturedLog log;
    C2KLogGenerator::processTemplate(Dictionary(), display, lookup);
    EXPECT_EQ(log.lines(), (LogLines{{LogPriority::Warning, "Processing the template"}}));
    EXPECT_TRUE(display->empty());
    EXPECT_TRUE(lookup.empty());
}

} // namespace
} // namespace velmora
