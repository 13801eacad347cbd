// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Events/EventKind.h"
#include "Analysis/Rules/Rule.h"
#include "Analysis/Rules/RuleTesting.h"
#include "Tests/Analysis/Rules/RuleFixture.h"
#include "Tests/Support/ShippedResources.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <filesystem>
#include <set>

namespace velmora {
namespace {

RuleSet builtInRules() {
    RuleSet rules(ShippedCatalogues::instance().all());
    for (const auto& each : std::filesystem::directory_iterator(VELMORA_SOURCE_DIR "/Resources/rules")) {
        const std::string file = each.path().filename().string();
        const Data content = shippedResource("rules/" + file);
        rules.add({file, std::string(content.bytes().begin(), content.bytes().end()), 0});
    }
    return rules;
}

TEST(BuiltInRulesTest, HaveNoMistake) {
    const RuleSet rules = builtInRules();
    for (const RuleError& each : rules.errors())
        ADD_FAILURE() << each.message();
}

TEST(BuiltInRulesTest, AreTheKindsThatAreListedAsRules) {
    std::set<std::string> listed;
    for (const EventKindRow& each : eventKinds())
        if (each.isOfRule)
            listed.emplace(each.name);
    const RuleSet builtIn = builtInRules();
    std::set<std::string> rules;
    for (const auto& rule : builtIn.rules()) {
        rules.insert(rule->name);
        const EventKindRow* const row = eventKindNamed(rule->name);
        ASSERT_TRUE(row) << rule->name;
        EXPECT_EQ(rule->severity, row->severity) << rule->name;
        EXPECT_EQ(rule->lasts, row->lasts) << rule->name;
    }
    EXPECT_EQ(rules, listed);
}

TEST(BuiltInRulesTest, EachPassesItsOwnTests) {
    const RuleSet rules = builtInRules();
    for (const auto& rule : rules.rules()) {
        EXPECT_FALSE(rule->tests.empty()) << rule->name;
        for (const RuleTest& test : rule->tests)
            EXPECT_EQ(runRuleTest(*rule, test, ShippedCatalogues::instance().of(test.technology)), "")
                << rule->name << ", " << test.name;
    }
}

TEST(BuiltInRulesTest, ConcernTheTechnologiesWhoseRecordsSupportThem) {
    const RuleSet rules = builtInRules();
    const auto namesFor = [&rules](std::string_view technology) {
        std::set<std::string> names;
        for (const auto& rule : rules.rules())
            if (concerns(*rule, ShippedCatalogues::instance().of(technology)))
                names.insert(rule->name);
        return names;
    };
    EXPECT_THAT(namesFor("Ostrel_CDMA"),
                testing::ElementsAre("data-stall", "fer-alarm", "missing-neighbour", "pilot-pollution",
                                     "poor-quality", "weak-coverage"));
    EXPECT_THAT(namesFor("IFX"), testing::ElementsAre("missing-neighbour", "poor-quality", "weak-coverage"));
    EXPECT_THAT(namesFor("Ostrel_LTE"), testing::ElementsAre("missing-neighbour", "pilot-pollution",
                                                             "poor-quality", "weak-coverage"));
}

} // namespace
} // namespace velmora
