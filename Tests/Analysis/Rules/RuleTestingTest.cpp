// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/RuleTesting.h"

#include "Analysis/Rules/Rule.h"
#include "Tests/Analysis/Rules/RuleFixture.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

/// What the first test of the first rule in the text finds.
std::string outcomeOf(const std::string& test) {
    const RuleSet rules = ruleSet(R"(
[[rule]]
name = "weak"
when = "serving.level < -110"
text = "{serving.level}"
[[rule.test]]
technology = "LTE"
)" + test);
    if (rules.rules().empty() || rules.rules()[0]->tests.empty())
        return "no test";
    return runRuleTest(*rules.rules()[0], rules.rules()[0]->tests[0],
                       ShippedCatalogues::instance().of("Ostrel_LTE"));
}

TEST(RuleTestingTest, ATestThatGetsWhatItExpectsHasNoOutcome) {
    EXPECT_EQ(outcomeOf("values = [{ at = 1, serving.level = -111 }, { at = 4, serving.level = -90 }]\n"
                        "events = [{ begin = 1, end = 4 }]"),
              "");
}

TEST(RuleTestingTest, NamesBothListsWhereTheyDiffer) {
    EXPECT_EQ(outcomeOf("values = [{ at = 1, serving.level = -111 }, { at = 4, serving.level = -90 }]\n"
                        "events = [{ begin = 1, end = 5 }]"),
              "got 1 s to 4 s \"-111 dBm\", wanted 1 s to 5 s");
    EXPECT_EQ(outcomeOf("values = [{ at = 1, serving.level = -111 }]\nevents = []"),
              "got 1 s to an unknown end \"-111 dBm\", wanted no event");
    EXPECT_EQ(outcomeOf("values = []\nevents = [{ begin = 1 }]"),
              "got no event, wanted 1 s to an unknown end");
}

TEST(RuleTestingTest, ComparesTheTextWhereOneIsExpected) {
    const std::string values =
        "values = [{ at = 1, serving.level = -111 }, { at = 4, serving.level = -90 }]\n";
    EXPECT_EQ(outcomeOf(values + "events = [{ begin = 1, end = 4, text = \"-111 dBm\" }]"), "");
    EXPECT_EQ(outcomeOf(values + "events = [{ begin = 1, end = 4, text = \"-112 dBm\" }]"),
              "got 1 s to 4 s \"-111 dBm\", wanted 1 s to 4 s \"-112 dBm\"");
}

TEST(RuleTestingTest, AnInterruptionEndsWhatLastsWithoutAnEnd) {
    EXPECT_EQ(outcomeOf("values = [{ at = 1, serving.level = -111 },\n"
                        "          { at = 50, interruption = true, serving.level = -90 }]\n"
                        "events = [{ begin = 1 }]"),
              "");
}

TEST(RuleTestingTest, AnUnknownValueIsWithdrawn) {
    EXPECT_EQ(
        outcomeOf("values = [{ at = 1, serving.level = -111 }, { at = 2, unknown = [\"serving.level\"] },\n"
                  "          { at = 12 }, { at = 13, serving.level = -90 }]\n"
                  "events = [{ begin = 1 }]"),
        "");
}

} // namespace
} // namespace velmora
