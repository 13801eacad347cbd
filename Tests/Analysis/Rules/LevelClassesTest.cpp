// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Classes/LevelClasses.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

namespace velmora {
namespace {

using Class = std::optional<LevelClass>;

class LevelClassesTest : public testing::Test {
protected:
    LevelClassesTest() {
        EXPECT_EQ(classes.add({Role::ServingLevel, RadioTechnology::LTE}, {-115, -100, -85}, {"a.toml", 1}),
                  "");
        EXPECT_EQ(classes.add({.path = "/1x/Active Set/*"}, {-13, -10, -7}, {"a.toml", 9}), "");
    }
    [[nodiscard]] Class level(double value) const {
        return classes.of(RadioTechnology::LTE, Role::ServingLevel, value);
    }

    LevelClasses classes;
};

TEST_F(LevelClassesTest, AValueAtALimitIsOfTheBetterClass) {
    EXPECT_EQ(level(-115), LevelClass::Fair);
    EXPECT_EQ(level(-100), LevelClass::Good);
    EXPECT_EQ(level(-85), LevelClass::Excellent);
}

TEST_F(LevelClassesTest, AValueJustBelowALimitIsOfTheWorseClass) {
    const double low = -std::numeric_limits<double>::infinity();
    EXPECT_EQ(level(std::nextafter(-115., low)), LevelClass::Poor);
    EXPECT_EQ(level(std::nextafter(-100., low)), LevelClass::Fair);
    EXPECT_EQ(level(std::nextafter(-85., low)), LevelClass::Good);
}

TEST_F(LevelClassesTest, ValuesBeyondAllLimitsAreOfTheOuterClasses) {
    EXPECT_EQ(level(-200), LevelClass::Poor);
    EXPECT_EQ(level(0), LevelClass::Excellent);
}

TEST_F(LevelClassesTest, WhatIsNoFiniteNumberHasNoClass) {
    EXPECT_EQ(level(std::numeric_limits<double>::quiet_NaN()), std::nullopt);
    EXPECT_EQ(level(std::numeric_limits<double>::infinity()), std::nullopt);
    EXPECT_EQ(level(-std::numeric_limits<double>::infinity()), std::nullopt);
}

TEST_F(LevelClassesTest, WhatHasNoLimitsHasNoClass) {
    EXPECT_EQ(classes.of(std::nullopt, Role::ServingLevel, -90), std::nullopt);
    EXPECT_EQ(classes.of(RadioTechnology::NR, Role::ServingLevel, -90), std::nullopt);
    EXPECT_EQ(classes.of(RadioTechnology::LTE, Role::ServingQuality, -9), std::nullopt);
    EXPECT_EQ(classes.of(RadioTechnology::LTE, Role::None, -90), std::nullopt);
    EXPECT_EQ(classes.of(RadioTechnology::GSM, Role::None, -10), std::nullopt);
    EXPECT_EQ(classes.ofPath("/Link/LTE SINR", 3), std::nullopt);
    EXPECT_EQ(classes.ofPath("", 3), std::nullopt);
}

TEST_F(LevelClassesTest, ANeighboursLevelHasTheServingCellsLimits) {
    EXPECT_EQ(classes.of(RadioTechnology::LTE, Role::NeighbourLevel, -100), LevelClass::Good);
    EXPECT_EQ(classes.of(RadioTechnology::LTE, Role::NeighbourQuality, -10), std::nullopt);
}

TEST_F(LevelClassesTest, APathWithAStarIsForEachRow) {
    EXPECT_EQ(classes.ofPath("/1x/Active Set/12", -10), LevelClass::Good);
    EXPECT_EQ(classes.ofPath("/1x/Active Set/*", -14), LevelClass::Poor);
    EXPECT_EQ(classes.ofPath("/1x/Active Set", -10), std::nullopt);
    EXPECT_EQ(classes.ofPath("/1x/Active Set/12/3", -10), std::nullopt);
    EXPECT_EQ(classes.ofPath("/EV-DO/Active Set/12", -10), std::nullopt);
}

TEST_F(LevelClassesTest, APathThatIsWrittenOutPrecedesOneWithAStar) {
    EXPECT_EQ(classes.add({.path = "/1x/Active Set/4"}, {-3, -2, -1}, {"a.toml", 20}), "");
    EXPECT_EQ(classes.ofPath("/1x/Active Set/4", -10), LevelClass::Poor);
    EXPECT_EQ(classes.ofPath("/1x/Active Set/5", -10), LevelClass::Good);
}

TEST_F(LevelClassesTest, AHigherLayerReplacesALowerOneInAnyOrder) {
    const LevelClasses::Subject subject{Role::ServingLevel, RadioTechnology::LTE};
    EXPECT_EQ(classes.add(subject, {-120, -110, -105}, {"mine.toml", 3, 2}), "");
    EXPECT_EQ(level(-105), LevelClass::Excellent);
    EXPECT_EQ(classes.add(subject, {-50, -40, -30}, {"b.toml", 3, 1}), "");
    EXPECT_EQ(level(-105), LevelClass::Excellent);
    EXPECT_EQ(classes.countFrom("mine.toml"), 1U);
    EXPECT_EQ(classes.countFrom("a.toml"), 1U);
    EXPECT_EQ(classes.size(), 2U);
}

TEST_F(LevelClassesTest, ASecondOneOfALayerIsAMistake) {
    EXPECT_EQ(classes.add({Role::ServingLevel, RadioTechnology::LTE}, {-50, -40, -30}, {"b.toml", 3}),
              "got a second class for serving.level in LTE; the first is at a.toml:1");
    EXPECT_EQ(classes.add({.path = "/1x/Active Set/*"}, {-50, -40, -30}, {"b.toml", 3}),
              "got a second class for /1x/Active Set/*; the first is at a.toml:9");
    EXPECT_EQ(level(-85), LevelClass::Excellent);
}

TEST_F(LevelClassesTest, ClassesHaveNames) {
    EXPECT_EQ(nameOf(LevelClass::Poor), "poor");
    EXPECT_EQ(nameOf(LevelClass::Fair), "fair");
    EXPECT_EQ(nameOf(LevelClass::Good), "good");
    EXPECT_EQ(nameOf(LevelClass::Excellent), "excellent");
}

} // namespace
} // namespace velmora
