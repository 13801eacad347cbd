// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Analysis/Rules/RuleFixture.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

std::string withLevel(std::string_view expression, double level) {
    return EvaluatedExpression(expression).set("serving.level", level).value();
}

TEST(EvaluationTest, ComparesNumbers) {
    EXPECT_EQ(withLevel("serving.level < -110", -111), "true");
    EXPECT_EQ(withLevel("serving.level < -110", -110), "false");
    EXPECT_EQ(withLevel("serving.level <= -110", -110), "true");
    EXPECT_EQ(withLevel("serving.level > -110", -110), "false");
    EXPECT_EQ(withLevel("serving.level >= -110", -110), "true");
    EXPECT_EQ(withLevel("serving.level == -110", -110), "true");
    EXPECT_EQ(withLevel("serving.level != -110", -110), "false");
}

TEST(EvaluationTest, BindsProductsTighterThanSumsAndAndTighterThanOr) {
    EXPECT_EQ(withLevel("serving.level - 2 * 3", -100), "-106 dBm");
    EXPECT_EQ(withLevel("-serving.level / 4 + 1", -100), "26 dBm");
    EXPECT_EQ(withLevel("serving.level - 1 - 2", -100), "-103 dBm");
    EXPECT_EQ(withLevel("true or serving.level > 0 and false", -100), "true");
    EXPECT_EQ(withLevel("(true or serving.level > 0) and false", -100), "false");
    EXPECT_EQ(withLevel("not serving.level > 0 and true", -100), "true");
}

TEST(EvaluationTest, ConvertsUnitsOfConstants) {
    EvaluatedExpression rate("data-rate > 1.5 Mbit/s");
    EXPECT_EQ(rate.set("data-rate", 1500).value(), "false");
    EXPECT_EQ(rate.set("data-rate", 1500.5).value(), "true");
}

TEST(EvaluationTest, FindsValuesInListsAndRanges) {
    EXPECT_EQ(withLevel("serving.level in (-100..-90, -80)", -100), "true");
    EXPECT_EQ(withLevel("serving.level in (-100..-90, -80)", -90), "true");
    EXPECT_EQ(withLevel("serving.level in (-100..-90, -80)", -89.5), "false");
    EXPECT_EQ(withLevel("serving.level in (-100..-90, -80)", -80), "true");
    EXPECT_EQ(withLevel("serving.level in -100..-90", -101), "false");
    EXPECT_EQ(
        EvaluatedExpression("radio.technology in ('GSM', 'LTE')").set("radio.technology", "LTE").value(),
        "true");
    EXPECT_EQ(EvaluatedExpression("radio.technology in ('GSM', 'LTE')").set("radio.technology", "NR").value(),
              "false");
}

TEST(EvaluationTest, ComparesATextAgainWhenAnotherIsReported) {
    EvaluatedExpression either("radio.technology == 'NR' or radio.technology in ('GSM', 'LTE')");
    EXPECT_EQ(either.value(), "unknown");
    EXPECT_EQ(either.turn(1).set("radio.technology", "LTE").value(), "true");
    EXPECT_EQ(either.turn(2).value(), "true");
    EXPECT_EQ(either.turn(3).set("radio.technology", "UMTS").value(), "false");
    EXPECT_EQ(either.turn(4).value(), "false");
    EXPECT_EQ(either.turn(5).set("radio.technology", "NR").value(), "true");
    EXPECT_EQ(either.turn(6).remove("radio.technology").value(), "unknown");
    EXPECT_EQ(either.turn(7).value(), "unknown");
    EXPECT_EQ(either.turn(8).set("radio.technology", "GSM").value(), "true");
    EXPECT_EQ(either.turn(9).clear().value(), "unknown");
}

TEST(EvaluationTest, ComparesEnumerationsByTextOrNumber) {
    EvaluatedExpression byNumber("radio.state == 3");
    EXPECT_EQ(byNumber.set("radio.state", 3).value(), "true");
    EXPECT_EQ(byNumber.set("radio.state", 4).value(), "false");
    EvaluatedExpression byText("radio.state != 'Idle'");
    EXPECT_EQ(byText.set("radio.state", "Idle").value(), "false");
    EXPECT_EQ(byText.set("radio.state", "Connected").value(), "true");
}

TEST(EvaluationTest, IsUnknownWhereAValueIs) {
    EXPECT_EQ(EvaluatedExpression("serving.level < -110").value(), "unknown");
    EXPECT_EQ(EvaluatedExpression("not serving.level < -110").value(), "unknown");
    EXPECT_EQ(EvaluatedExpression("serving.level in -100..-90").value(), "unknown");
    EXPECT_EQ(EvaluatedExpression("serving.level + 3").value(), "unknown");
    EXPECT_EQ(EvaluatedExpression("age(serving.level) > 3").value(), "unknown");
    EXPECT_EQ(EvaluatedExpression("changed(serving.level)").value(), "unknown");
    EXPECT_EQ(EvaluatedExpression("any(neighbour.level > -95)").value(), "unknown");
    EXPECT_EQ(EvaluatedExpression("known(serving.level)").value(), "false");
}

TEST(EvaluationTest, DecidesAndAndOrWithoutWhatIsUnknown) {
    EXPECT_EQ(EvaluatedExpression("serving.level < 0 and false").value(), "false");
    EXPECT_EQ(EvaluatedExpression("serving.level < 0 and true").value(), "unknown");
    EXPECT_EQ(EvaluatedExpression("serving.level < 0 or true").value(), "true");
    EXPECT_EQ(EvaluatedExpression("serving.level < 0 or false").value(), "unknown");
    EXPECT_EQ(EvaluatedExpression("false and serving.level < 0").value(), "false");
    EXPECT_EQ(EvaluatedExpression("true or serving.level < 0").value(), "true");
}

TEST(EvaluationTest, IsUnknownForAQuotientByZero) {
    EvaluatedExpression quotient("data-rate / (data-rate - data-rate) < 3");
    EXPECT_EQ(quotient.set("data-rate", 5).value(), "unknown");
}

TEST(EvaluationTest, IsUnknownForAValueOfTheOtherKind) {
    // The physical cell is a number or a text, which depends on the technology.
    EvaluatedExpression cell("serving.physical-cell == 17");
    EXPECT_EQ(cell.set("serving.physical-cell", "NCC 2").value(), "unknown");
    EXPECT_EQ(cell.set("serving.physical-cell", 17).value(), "true");
}

TEST(EvaluationTest, ForgetsAValueThatWasRemoved) {
    EvaluatedExpression level("serving.level < -110");
    level.set("serving.level", -111);
    EXPECT_EQ(level.remove("serving.level").value(), "unknown");
}

TEST(EvaluationTest, GoesThroughNeighbours) {
    const std::vector<Neighbour> cells{neighbour(-80, true), neighbour(-90), neighbour(-100)};
    const auto value = [&cells](std::string_view text) {
        return EvaluatedExpression(text).neighbours(cells).value();
    };
    EXPECT_EQ(value("count(neighbour.level > -95)"), "2");
    EXPECT_EQ(value("count(neighbour.level > -95 and not neighbour.detected)"), "1");
    EXPECT_EQ(value("max(neighbour.level)"), "-80 dBm");
    EXPECT_EQ(value("min(neighbour.level)"), "-100 dBm");
    EXPECT_EQ(value("max(neighbour.level + 3) - min(neighbour.level)"), "23 dB");
    EXPECT_EQ(value("any(neighbour.detected and neighbour.level > -85)"), "true");
    EXPECT_EQ(value("any(neighbour.level > -70)"), "false");
    EXPECT_EQ(value("all(neighbour.level > -110)"), "true");
    EXPECT_EQ(value("all(neighbour.level > -95)"), "false");
    EXPECT_EQ(value("neighbour.level"), "-80 dBm"); // the strongest one's
    EXPECT_EQ(value("neighbour.detected"), "true");
}

TEST(EvaluationTest, CountsNeighboursWithoutALevelAsUnknown) {
    const std::vector<Neighbour> cells{neighbour(-80), Neighbour()};
    const auto value = [&cells](std::string_view text) {
        return EvaluatedExpression(text).neighbours(cells).value();
    };
    EXPECT_EQ(value("count(neighbour.level > -95)"), "1");
    EXPECT_EQ(value("any(neighbour.level > -70)"), "unknown");
    EXPECT_EQ(value("any(neighbour.level > -95)"), "true");
    EXPECT_EQ(value("all(neighbour.level > -95)"), "unknown");
    EXPECT_EQ(value("all(neighbour.level > -70)"), "false");
    EXPECT_EQ(value("max(neighbour.level)"), "-80 dBm");
}

TEST(EvaluationTest, GoesThroughTheRowsOfAList) {
    EvaluatedExpression best("max('/UMTS/Active Set/*/RSCP') - min('/UMTS/Active Set/*/RSCP')");
    best.setRow("/UMTS/Active Set/*/RSCP", 0, -90).setRow("/UMTS/Active Set/*/RSCP", 1, -97);
    EXPECT_EQ(best.value(), "7 dB");
    best.remove("/UMTS/Active Set/*/RSCP");
    EXPECT_EQ(best.value(), "unknown");
}

TEST(EvaluationTest, JoinsFieldsOfTheSameRow) {
    EvaluatedExpression bad(
        "count('/UMTS/Active Set/*/RSCP' > -95 and '/UMTS/Active Set/*/Energy Per Chip' < -12)");
    for (const auto& [row, level, quality] :
         {std::tuple{0U, -90.0, -14.0}, {1U, -90.0, -8.0}, {2U, -99.0, -14.0}})
        bad.setRow("/UMTS/Active Set/*/RSCP", row, level)
            .setRow("/UMTS/Active Set/*/Energy Per Chip", row, quality);
    EXPECT_EQ(bad.value(), "1");
}

} // namespace
} // namespace velmora
