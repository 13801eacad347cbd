// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelLogGenerator2.h"

#include "Tests/LogGenerator/OstrelLogGenerator2Fixture.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::MatchesRegex;
using testing::UnorderedElementsAre;
using OstrelLogGenerator2Test = OstrelLogGenerator2Fixture;

TEST_F(OstrelLogGenerator2Test, AnnouncesItsIndexThenItselfThenTheReferences) {
    log.clear();
    const auto other = std::make_shared<ListenerIndex>();
    log.clear();
    { const OstrelLogGenerator2 made("Probe", other, clock); }
    ASSERT_EQ(log.lines().size(), 4u);
    EXPECT_EQ(log.lines()[0].priority, LogPriority::Error);
    EXPECT_THAT(log.lines()[0].text, MatchesRegex("Creating OstrelLogGenerator2 object with 0x[0-9a-f]+"));
    EXPECT_EQ(log.lines()[1].priority, LogPriority::Warning);
    EXPECT_THAT(log.lines()[1].text, MatchesRegex("Creating Log object: 0x[0-9a-f]+"));
    EXPECT_EQ(log.lines()[2],
              (CapturedLog::Line{LogPriority::Error, "Class Index: 2"})); // the test holds one
    EXPECT_EQ(log.lines()[3].priority, LogPriority::Warning);
    EXPECT_THAT(log.lines()[3].text, MatchesRegex("Ostrel_GSMLogGenerator is destructed 0x[0-9a-f]+"));
}

TEST_F(OstrelLogGenerator2Test, FirstCallBuildsTheDisplayAndReturnsNoneTheSecondReturnsIt) {
    EXPECT_TRUE(generator.getDisplayFromState(state).isNone());
    ASSERT_NE(state["Display"].asDictionary(), nullptr);
    EXPECT_NE(state["Template"].asDictionary(), nullptr);
    EXPECT_NE(state["Template"].asDictionary(), state["Display"].asDictionary());
    EXPECT_TRUE(state["ExtraInfo"].asDictionary()->empty());
    EXPECT_EQ(generator.getDisplayFromState(state).asDictionary(), state["Display"].asDictionary());
}

TEST_F(OstrelLogGenerator2Test, SectionsWriteIntoTheirNodesAtAnyDepth) {
    update(record(0xD0E0, "01 02"));
    update(record(0x0002, "", 0xFF));
    const Dictionary& radio = *display()["Radio"].asDictionary();
    EXPECT_EQ((*radio["RRC Info"].asDictionary())["Length"], Value("15"));
    EXPECT_EQ((*display()["SIM Info"].asDictionary())["Length"], Value("13")); // in place of the placeholder
    EXPECT_EQ(display()["Maker"], Value("none"));
    // The template is not what is shown.
    EXPECT_EQ((*(*state["Template"].asDictionary())["SIM Info"].asDictionary())["Length"], Value("not yet"));
}

TEST_F(OstrelLogGenerator2Test, RefreshMovesTheRawMessagesOut) {
    update(hex("AA"));
    update(hex("BB CC"));
    const Value shown = generator.generateLogUsingState(state);
    EXPECT_EQ(shown.asDictionary(), &display());
    EXPECT_EQ(*state["DisplayState"].asData(), hex("AA BB CC"));
    update(hex("DD"));
    EXPECT_EQ(raw(), hex("DD"));
    EXPECT_EQ(raw(), hex(""));
    const Array& history = *state["History"].asArray();
    ASSERT_EQ(history.size(), 3u);
    EXPECT_EQ(*(*history[0].asDictionary())["DisplayState"].asData(), hex("AA BB CC"));
}

TEST_F(OstrelLogGenerator2Test, RefreshBeforeAnyMessageBuildsAndReturnsNone) {
    EXPECT_TRUE(generator.generateLogUsingState(state).isNone());
    EXPECT_EQ(state["History"].asArray()->size(), 1u);
}

TEST_F(OstrelLogGenerator2Test, StartCommandSplitsTheCodes) {
    const DictionaryRef command = generator.getStartCommand();
    std::vector<std::string> keys;
    for (const auto& [key, value] : *command)
        keys.push_back(key);
    EXPECT_THAT(keys, ElementsAre("SetState", "SetOstrelLogCodes", "SetVoxExtraCodes"));
    EXPECT_EQ((*command)["SetState"], Value("Streaming"));
    const auto numbers = [&command](const char* key) {
        std::vector<std::int64_t> result;
        for (const Value& code : *(*command)[key].asArray())
            result.push_back(*code.asInteger());
        return result;
    };
    EXPECT_THAT(numbers("SetOstrelLogCodes"), UnorderedElementsAre(0x1234, 53472));
    EXPECT_THAT(numbers("SetVoxExtraCodes"), UnorderedElementsAre(0, 2));
}

TEST_F(OstrelLogGenerator2Test, NewDecoderContinuesWithTheDisplay) {
    update(record(0xD0E0, "01 02"));
    const Dictionary* shown = &display();
    const auto nextIndex = std::make_shared<ListenerIndex>();
    OstrelLogGenerator2 next("Probe", nextIndex, clock);
    EXPECT_EQ(next.getDisplayFromState(state).asDictionary(), shown);
    next.updateState(state, record(0xD0E0, ""));
    EXPECT_EQ(&display(), shown);
    static_cast<void>(next.display(state));
    EXPECT_EQ((*(*display()["Radio"].asDictionary())["RRC Info"].asDictionary())["Length"], Value("13"));
}

TEST_F(OstrelLogGenerator2Test, NewDecoderFindsItsNodesWithinAnArrayToo) {
    const auto withNode = [](const DictionaryRef& node) {
        return std::make_shared<Dictionary>(Dictionary{
            {"Radios",
             std::make_shared<Array>(Array{std::make_shared<Dictionary>(Dictionary{{"RRC Info", node}})})}});
    };
    const DictionaryRef node = makeDictionary();
    state.set("Template", withNode(makeDictionary()));
    state.set("Display", withNode(node));
    update(record(0xD0E0, "01 02"));
    static_cast<void>(display());
    EXPECT_EQ((*node)["Length"], Value("15")); // a header of 13 bytes and 2
}

} // namespace
} // namespace velmora
