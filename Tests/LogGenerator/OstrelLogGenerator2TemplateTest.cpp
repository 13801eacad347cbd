// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/OstrelLogGenerator2Fixture.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::MatchesRegex;
using testing::UnorderedElementsAre;
using OstrelLogGenerator2TemplateTest = OstrelLogGenerator2Fixture;

TEST_F(OstrelLogGenerator2TemplateTest, BuildingSaysWhichIndexAndWhatKindItIs) {
    log.clear();
    static_cast<void>(generator.getDisplayFromState(state));
    const auto lines = log.textsAt(LogPriority::Warning);
    ASSERT_EQ(lines.size(), 6u);
    EXPECT_THAT(lines[0], MatchesRegex("Initialized class index: 0x[0-9a-f]+, Self: 0x[0-9a-f]+"));
    EXPECT_EQ(lines[1], "Dictionary = 1");
    EXPECT_EQ(lines[2], "String = 0");
    EXPECT_THAT(std::vector(lines.begin() + 3, lines.end()),
                UnorderedElementsAre("RRC Info", "Rows", "SIM Info"));
}

TEST_F(OstrelLogGenerator2TemplateTest, TemplateIsLoadedOnce) {
    static_cast<void>(generator.getDisplayFromState(state));
    resources.put("Probe", "plist", Value(makeDictionary()));
    state.remove("Display");
    static_cast<void>(generator.getDisplayFromState(state));
    EXPECT_TRUE(display().contains("Radio"));
}

struct BadTemplate {
    const char* odd;
    std::optional<const char*> content;
    std::string reason;
};

class MissingTemplateTest : public testing::TestWithParam<BadTemplate> {};

TEST_P(MissingTemplateTest, IsReportedOnEachCallAndNothingIsShown) {
    const FakeClock clock;
    FakeResources resources;
    if (GetParam().content) {
        const std::string_view text = *GetParam().content;
        resources.put("Probe", "plist", Data(std::vector<std::uint8_t>(text.begin(), text.end())));
    }
    const auto index = std::make_shared<ListenerIndex>();
    OstrelLogGenerator2 generator("Probe", index, clock);
    Dictionary state;
    CapturedLog log;
    EXPECT_TRUE(generator.getDisplayFromState(state).isNone());
    ASSERT_EQ(log.lines().size(), 2u);
    EXPECT_THAT(log.lines()[0].text, testing::StartsWith(GetParam().reason));
    EXPECT_EQ(log.lines()[1], (CapturedLog::Line{LogPriority::Error, "Cannot load template for display"}));
    generator.updateState(state, record(0xD0E0, ""));
    EXPECT_EQ(index->baseband.calls.size(), 1u); // routed, into no node
    EXPECT_FALSE(state.contains("Display"));

    // It is asked for again, and the messages since then are there.
    resources.put("Probe", "plist", Value(makeDictionary()));
    EXPECT_TRUE(generator.generateLogUsingState(state).isNone());
    EXPECT_TRUE(state.contains("Display"));
    EXPECT_EQ(state["DisplayState"].asData()->size(), 13u);
}

INSTANTIATE_TEST_SUITE_P(, MissingTemplateTest,
                         testing::Values(BadTemplate{"Absent", std::nullopt, "no resource Probe.plist"},
                                         BadTemplate{"Rubbish", "rubbish", "Probe.plist: "},
                                         BadTemplate{
                                             "NoDictionary", "<plist><array/></plist>",
                                             "Probe.plist: the root is of kind array, wanted a dictionary"}),
                         [](const auto& test) { return std::string(test.param.odd); });

TEST_F(OstrelLogGenerator2TemplateTest, ForeignKindInTheTemplateIsReportedAndLeftOut) {
    log.clear();
    const Value processed = generator.processTemplate(
        std::make_shared<Dictionary>(std::initializer_list<Dictionary::Entry>{{"Number", 7}, {"Text", "x"}}));
    EXPECT_THAT(log.lines(),
                ElementsAre(CapturedLog::Line{LogPriority::Error, "Received an object of unknown type"},
                            CapturedLog::Line{LogPriority::Warning, "Processing the template"}));
    EXPECT_EQ(processed.asDictionary()->size(), 1u);
    EXPECT_EQ((*processed.asDictionary())["Text"], Value("x"));
}

TEST_F(OstrelLogGenerator2TemplateTest, ForeignElementOfAnArrayIsLeftOut) {
    const Value processed =
        generator.processTemplate(std::make_shared<Array>(std::initializer_list<Value>{"a", 7, "b"}));
    EXPECT_EQ(*processed.asArray()->begin(), Value("a"));
    EXPECT_EQ(processed.asArray()->size(), 2u);
}

TEST_F(OstrelLogGenerator2TemplateTest, WalkReportsForeignKindsAtAnyDepthAndNothingElse) {
    log.clear();
    generator.printDict(std::make_shared<Array>(std::initializer_list<Value>{
        "text", std::make_shared<Dictionary>(std::initializer_list<Dictionary::Entry>{{"A", true}}),
        Data()}));
    EXPECT_THAT(log.lines(),
                ElementsAre(CapturedLog::Line{LogPriority::Error, "Received an object of unknown type"},
                            CapturedLog::Line{LogPriority::Error, "Received an object of unknown type"}));
}

} // namespace
} // namespace velmora
