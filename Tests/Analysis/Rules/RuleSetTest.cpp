// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Rule.h"
#include "Tests/Analysis/Rules/RuleFixture.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using testing::ElementsAre;

std::string rule(const std::string& name, const std::string& text, const std::string& more = "") {
    return "[[rule]]\nname = \"" + name + "\"\nwhen = \"serving.level < -110\"\ntext = \"" + text + "\"\n" +
           more;
}

std::vector<std::string> texts(const RuleSet& rules) {
    std::vector<std::string> all;
    for (const RuleSet::Summary& each : rules.summaries())
        all.push_back(std::string(each.name) + " " + std::string(each.text));
    return all;
}

class RuleSetTest : public testing::Test {
protected:
    RuleSet rules{ShippedCatalogues::instance().all()};
};

TEST_F(RuleSetTest, ARuleOfAHigherLayerReplacesThoseOfItsName) {
    rules.add(
        {"built-in.toml",
         rule("b", "1", "technology = \"GSM\"\n") + rule("b", "2", "technology = \"LTE\"\n") + rule("a", "3"),
         1});
    rules.add({"mine.toml", rule("b", "4"), 2});
    EXPECT_TRUE(rules.errors().empty());
    EXPECT_THAT(texts(rules), ElementsAre("a 3", "b 4"));
}

TEST_F(RuleSetTest, RulesOfOneNameHaveOneSummary) {
    rules.add({"built-in.toml",
               rule("b", "1", "technology = \"GSM\"\n") + rule("b", "2", "technology = \"LTE\"\n"), 1});
    EXPECT_EQ(rules.rules().size(), 2U);
    EXPECT_THAT(texts(rules), ElementsAre("b 1"));
}

TEST_F(RuleSetTest, TheOrderOfFilesDoesNotMatter) {
    rules.add({"mine.toml", rule("b", "4"), 2});
    rules.add({"built-in.toml", rule("b", "1") + rule("a", "3"), 1});
    EXPECT_TRUE(rules.errors().empty());
    EXPECT_THAT(texts(rules), ElementsAre("a 3", "b 4"));
}

TEST_F(RuleSetTest, ASecondRuleOfTheSameNameAndTechnologyIsAMistake) {
    rules.add({"one.toml", rule("a", "1"), 1});
    rules.add({"two.toml", rule("b", "1") + rule("a", "2", "technology = \"LTE\"\n"), 1});
    ASSERT_EQ(rules.errors().size(), 1U);
    EXPECT_EQ(rules.errors()[0].message(),
              "two.toml:5:1: got a second rule a for the same technology; the first is at one.toml:1");
    EXPECT_THAT(texts(rules), ElementsAre("a 1", "b 1"));
}

TEST_F(RuleSetTest, ARuleWithAMistakeLeavesTheOthers) {
    rules.add({"one.toml", rule("a", "{x}") + rule("b", "2"), 1});
    EXPECT_EQ(rules.errors().size(), 1U);
    EXPECT_THAT(texts(rules), ElementsAre("b 2"));
}

TEST_F(RuleSetTest, ABoundedNumberOfRulesIsTaken) {
    std::string text;
    for (int i = 0; i < 2100; ++i)
        text += rule("r" + std::to_string(i), "");
    rules.add({"one.toml", text, 1});
    for (std::size_t at = 0; (at = text.find("name = \"r", at)) != text.npos;)
        text.replace(at, 9, "name = \"s");
    rules.add({"two.toml", text, 1});
    EXPECT_EQ(rules.rules().size(), RuleSet::mostRules);
    EXPECT_EQ(rules.errors().front().text, "got more than 4096 rules");
}

TEST_F(RuleSetTest, ABuiltInRuleWhosePathsTheDisplayLacksIsLeftOutWithoutAMistake) {
    const std::string other = "[[rule]]\nname = \"c\"\nwhen = \"'/Mine/Level' < 3\"\ntext = \"\"\n";
    rules.add({"built-in.toml", other + rule("a", "1"), 1, true});
    EXPECT_TRUE(rules.errors().empty());
    ASSERT_EQ(rules.leftOut().size(), 1U);
    EXPECT_EQ(rules.leftOut()[0].line, 3U);
    EXPECT_THAT(texts(rules), ElementsAre("a 1"));
    rules.add({"mine.toml", other, 2});
    EXPECT_EQ(rules.errors().size(), 1U);
}

TEST_F(RuleSetTest, ABoundedNumberOfWindowsIsTaken) {
    std::string text;
    for (int i = 0; i < 1025; ++i)
        text += rule("r" + std::to_string(i), "",
                     "clear = \"delta(serving.level, 5 s) > 3 or delta(serving.level, 9 s) > 3\"\n");
    rules.add({"one.toml", text, 1});
    EXPECT_EQ(rules.rules().size(), 1024U); // of two windows each
    ASSERT_EQ(rules.errors().size(), 1U);
    EXPECT_EQ(rules.errors()[0].text, "got more than 2048 windows of time in all rules");
}

TEST_F(RuleSetTest, ALongFileIsNotRead) {
    rules.add({"one.toml", std::string(RuleSet::mostBytes + 1, '#'), 1});
    ASSERT_EQ(rules.errors().size(), 1U);
    EXPECT_EQ(rules.errors()[0].message(), "one.toml: got 1048577 bytes, wanted at most 1048576");
}

TEST_F(RuleSetTest, RulesThatTheTechnologyCannotSupportAreLeftOut) {
    rules.add({"one.toml",
               rule("level", "") + rule("other", "", "technology = \"CDMA\"\n") +
                   "[[rule]]\nname = \"path\"\nwhen = \"'/1x/Frame Error Rate' > 3 %\"\ntext = \"\"\n"
                   "[[rule]]\nname = \"role\"\nwhen = \"data-rate == 0\"\ntext = \"\"\n",
               1});
    const auto concerned = [this](std::string_view technology) {
        std::vector<std::string> names;
        for (const auto& each : rules.rules())
            if (concerns(*each, ShippedCatalogues::instance().of(technology)))
                names.push_back(each->name);
        return names;
    };
    EXPECT_THAT(concerned("Ostrel_LTE"), ElementsAre("level"));
    EXPECT_THAT(concerned("Ostrel_CDMA"), ElementsAre("level", "other", "path", "role"));
}

} // namespace
} // namespace velmora
