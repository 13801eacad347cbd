// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Analysis/Rules/RuleFixture.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

const std::string limits = "fair = -115\ngood = -100\nexcellent = -85\n";

std::string level(const std::string& technologies, const std::string& theLimits = limits) {
    return "[[class]]\nvalue = \"serving.level\"\nradio-technology = " + technologies + "\n" + theLimits;
}

std::string ofPath(const std::string& path) {
    return "[[class]]\nvalue = \"" + path + "\"\n" + limits;
}

TEST(ClassFileTest, AClassIsForEachOfItsTechnologiesAndPaths) {
    const RuleSet rules = ruleSet("[[class]]\nvalue = [\"serving.level\", \"/Link/LTE RSRP\"]\n"
                                  "radio-technology = [\"LTE\", \"NR\"]\n" +
                                  limits);
    EXPECT_EQ(rules.classes().size(), 3U);
    EXPECT_EQ(rules.classes().of(RadioTechnology::NR, Role::ServingLevel, -101), LevelClass::Fair);
    EXPECT_EQ(rules.classes().ofPath("/Link/LTE RSRP", -84), LevelClass::Excellent);
}

TEST(ClassFileTest, AFileMayHaveBothRulesAndClasses) {
    const RuleSet rules =
        ruleSet(level("\"LTE\"") + "[[rule]]\nname = \"a\"\nwhen = \"serving.level < -110\"\ntext = \"\"\n");
    EXPECT_EQ(rules.rules().size(), 1U);
    EXPECT_EQ(rules.classes().size(), 1U);
}

TEST(ClassFileTest, NamesTheMissingKeys) {
    EXPECT_THAT(mistakesIn("[[class]]\n"),
                ElementsAre("my.toml:1:1: got no value, wanted serving.level, serving.quality or a path",
                            "my.toml:1:1: got no fair, wanted a number",
                            "my.toml:1:1: got no good, wanted a number",
                            "my.toml:1:1: got no excellent, wanted a number"));
    EXPECT_THAT(mistakesIn("[[class]]\nvalue = \"serving.level\"\n" + limits),
                ElementsAre("my.toml:2:9: got serving.level without a radio-technology, wanted the ones that "
                            "it is for"));
}

TEST(ClassFileTest, AnUnknownKeyIsAMistakeAtItsPlace) {
    EXPECT_THAT(mistakesIn(level("\"LTE\"") + "superb = -70\n"),
                ElementsAre(HasSubstr("my.toml:7:1: got the key superb, wanted one like")));
}

TEST(ClassFileTest, OnlyLevelsAndQualitiesHaveClasses) {
    EXPECT_THAT(mistakesIn("[[class]]\nvalue = \"data-rate\"\nradio-technology = \"LTE\"\n" + limits),
                ElementsAre("my.toml:2:9: got data-rate, wanted serving.level, serving.quality or a path"));
    EXPECT_THAT(mistakesIn(ofPath("/Serving Cell/EARFCN")), ElementsAre(HasSubstr("my.toml:2:9: ")));
    EXPECT_THAT(
        mistakesIn(ofPath("/1x/Frame Error Rate")),
        ElementsAre("my.toml:2:9: got '/1x/Frame Error Rate', which is a number in %, wanted a number "
                    "in dBm or dB"));
}

TEST(ClassFileTest, APathThatNoDisplayHasIsAMistake) {
    EXPECT_THAT(
        mistakesIn(ofPath("/Link/LTE RSP")),
        ElementsAre(HasSubstr("my.toml:2:9: got the path '/Link/LTE RSP', wanted one of a display; the "
                              "nearest are '/Link/LTE RSRP'")));
}

TEST(ClassFileTest, ATechnologyIsOneOfTheRadioTechnologies) {
    EXPECT_THAT(
        mistakesIn(level("[\"LTE\", \"Modem\"]")),
        ElementsAre("my.toml:3:28: got Modem, wanted one or an array of GSM, UMTS, TD-SCDMA, LTE, NR, "
                    "CDMA2000 1x, EV-DO"));
    EXPECT_THAT(mistakesIn(level("[]")), ElementsAre(HasSubstr("my.toml:3:20: got an array, wanted one")));
}

TEST(ClassFileTest, LimitsAscend) {
    EXPECT_THAT(mistakesIn(level("\"LTE\"", "fair = -90\ngood = -90\nexcellent = -85\n")),
                ElementsAre("my.toml:5:8: got limits that do not ascend, wanted fair below good"));
    EXPECT_THAT(mistakesIn(level("\"LTE\"", "fair = -90\ngood = -80\nexcellent = nan\n")),
                ElementsAre("my.toml:6:13: got limits that do not ascend, wanted good below excellent"));
    EXPECT_THAT(mistakesIn(level("\"LTE\"", "fair = \"-90 dBm\"\ngood = -80\nexcellent = -70\n")),
                ElementsAre("my.toml:4:8: got a text for fair, wanted a number"));
}

TEST(ClassFileTest, AnythingButTablesIsAMistake) {
    EXPECT_THAT(mistakesIn("class = 3\n"),
                ElementsAre("my.toml:1:9: got a number for class, wanted [[class]] tables"));
    EXPECT_THAT(mistakesIn("class = [3]\n"),
                ElementsAre("my.toml:1:10: got a number, wanted [[class]] tables"));
}

TEST(ClassFileTest, ASecondClassOfALayerIsAMistake) {
    EXPECT_THAT(mistakesIn(level("\"LTE\"") + level("[\"NR\", \"LTE\"]")),
                ElementsAre("my.toml:7:1: got a second class for serving.level in LTE; the first is at "
                            "my.toml:1"));
}

TEST(ClassFileTest, TheUsersClassesReplaceTheBuiltInOnesOfTheirValues) {
    RuleSet rules(ShippedCatalogues::instance().all());
    rules.add({"built-in.toml", level("[\"LTE\", \"NR\"]"), 1, true});
    rules.add({"mine.toml", level("\"LTE\"", "fair = -125\ngood = -120\nexcellent = -117\n"), 2});
    EXPECT_TRUE(rules.errors().empty());
    EXPECT_EQ(rules.classes().of(RadioTechnology::LTE, Role::ServingLevel, -116), LevelClass::Excellent);
    EXPECT_EQ(rules.classes().of(RadioTechnology::NR, Role::ServingLevel, -116), LevelClass::Poor);
}

TEST(ClassFileTest, ABuiltInPathThatTheDisplayLacksIsLeftOutAloneWithoutAMistake) {
    RuleSet rules(ShippedCatalogues::instance().all());
    rules.add(
        {"built-in.toml",
         "[[class]]\nvalue = [\"/Mine/Level\", \"serving.level\"]\nradio-technology = \"LTE\"\n" + limits, 1,
         true});
    EXPECT_TRUE(rules.errors().empty());
    EXPECT_EQ(rules.leftOutClasses().size(), 1U);
    EXPECT_EQ(rules.classes().of(RadioTechnology::LTE, Role::ServingLevel, -116), LevelClass::Poor);
}

} // namespace
} // namespace velmora
