// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Analysis/Rules/RuleFixture.h"
#include "Tests/Support/ShippedResources.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

RuleSet builtInClasses() {
    RuleSet rules(ShippedCatalogues::instance().all());
    const Data content = shippedResource("rules/classes.toml");
    rules.add({"classes.toml", std::string(content.bytes().begin(), content.bytes().end()), 0});
    for (const RuleError& each : rules.errors())
        ADD_FAILURE() << each.message();
    return rules;
}

TEST(BuiltInClassesTest, EachRadioTechnologyHasClassesOfItsLevel) {
    const RuleSet rules = builtInClasses();
    for (std::size_t i = 0; i < radioTechnologies; ++i) {
        const auto technology = static_cast<RadioTechnology>(i);
        EXPECT_TRUE(rules.classes().limits(technology, Role::ServingLevel)) << nameOf(technology);
    }
}

TEST(BuiltInClassesTest, EachRadioTechnologyWithAQualityHasClassesOfIt) {
    const RuleSet rules = builtInClasses();
    for (const RadioTechnology each : {RadioTechnology::UMTS, RadioTechnology::LTE, RadioTechnology::NR,
                                       RadioTechnology::CDMA1x, RadioTechnology::EVDO})
        EXPECT_TRUE(rules.classes().limits(each, Role::ServingQuality)) << nameOf(each);
    EXPECT_FALSE(rules.classes().limits(RadioTechnology::GSM, Role::ServingQuality));
}

TEST(BuiltInClassesTest, PoorIsWhatTheRulesOfWeakCoverageAndPoorQualityBeginAt) {
    const LevelClasses classes = builtInClasses().classes();
    const auto poorBelow = [&classes](RadioTechnology technology, Role role) {
        const LevelLimits* const limits = classes.limits(technology, role);
        return limits ? limits->fair : 0;
    };
    // The figures of coverage.toml
    EXPECT_EQ(poorBelow(RadioTechnology::GSM, Role::ServingLevel), -100);
    EXPECT_EQ(poorBelow(RadioTechnology::UMTS, Role::ServingLevel), -110);
    EXPECT_EQ(poorBelow(RadioTechnology::TDSCDMA, Role::ServingLevel), -110);
    EXPECT_EQ(poorBelow(RadioTechnology::LTE, Role::ServingLevel), -115);
    EXPECT_EQ(poorBelow(RadioTechnology::NR, Role::ServingLevel), -115);
    EXPECT_EQ(poorBelow(RadioTechnology::CDMA1x, Role::ServingLevel), -100);
    EXPECT_EQ(poorBelow(RadioTechnology::EVDO, Role::ServingLevel), -100);
    EXPECT_EQ(poorBelow(RadioTechnology::UMTS, Role::ServingQuality), -14);
    EXPECT_EQ(poorBelow(RadioTechnology::LTE, Role::ServingQuality), -15);
    EXPECT_EQ(poorBelow(RadioTechnology::NR, Role::ServingQuality), -15);
    EXPECT_EQ(poorBelow(RadioTechnology::CDMA1x, Role::ServingQuality), -13);
    EXPECT_EQ(classes.ofPath("/1x/Active Set/60", -13), LevelClass::Fair);
}

} // namespace
} // namespace velmora
