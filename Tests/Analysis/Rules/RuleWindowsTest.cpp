// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Analysis/Rules/RuleFixture.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

TEST(RuleWindowsTest, AgeIsTheTimeSinceTheLatestReport) {
    EvaluatedExpression age("age(serving.level)");
    age.turn(10).set("serving.level", -90);
    EXPECT_EQ(age.value(), "0 s");
    EXPECT_EQ(age.turn(12.5).value(), "2.5 s");
    age.turn(13).set("serving.level", -90);
    EXPECT_EQ(age.value(), "0 s");
}

TEST(RuleWindowsTest, ChangedHoldsForTheMessageThatReportsAnotherValue) {
    EvaluatedExpression changed("changed(serving.cell)");
    changed.set("serving.cell", 1);
    EXPECT_EQ(changed.value(), "false"); // there was none before
    changed.turn(1).set("serving.cell", 1);
    EXPECT_EQ(changed.value(), "false");
    changed.turn(2).set("serving.cell", 2);
    EXPECT_EQ(changed.value(), "true");
    EXPECT_EQ(changed.turn(3).value(), "false");
}

TEST(RuleWindowsTest, ChangedComparesWithTheValueBeforeAnUnknownOne) {
    EvaluatedExpression changed("changed(serving.cell)");
    changed.set("serving.cell", 1);
    changed.turn(1).remove("serving.cell");
    EXPECT_EQ(changed.value(), "unknown");
    changed.turn(2).set("serving.cell", 1);
    EXPECT_EQ(changed.value(), "false");
    changed.turn(3).remove("serving.cell");
    changed.turn(4).set("serving.cell", 2);
    EXPECT_EQ(changed.value(), "true");
}

TEST(RuleWindowsTest, DeltaComparesTheLatestReportWithTheValueAtTheWindowsStart) {
    EvaluatedExpression delta("delta(serving.level, 5 s)");
    delta.set("serving.level", -80);
    EXPECT_EQ(delta.value(), "unknown"); // five seconds ago nothing was known
    delta.turn(2).set("serving.level", -85);
    EXPECT_EQ(delta.value(), "unknown");
    delta.turn(5).set("serving.level", -90);
    EXPECT_EQ(delta.value(), "-10 dB"); // from -80
    EXPECT_EQ(delta.turn(6.5).value(), "-10 dB");
    delta.turn(7).set("serving.level", -92);
    EXPECT_EQ(delta.value(), "-7 dB"); // from -85, which was reported five seconds before
    EXPECT_EQ(delta.turn(11.9).value(), "-7 dB");
    EXPECT_EQ(delta.turn(12).value(), "0 dB"); // no report for five seconds
    EXPECT_EQ(delta.turn(20).value(), "0 dB");
    delta.turn(21).set("serving.level", -95);
    EXPECT_EQ(delta.value(), "-3 dB");
}

TEST(RuleWindowsTest, CountCountsReportsThatFulfilTheCondition) {
    EvaluatedExpression count("count(serving.level < -100, 10 s)");
    EXPECT_EQ(count.value(), "0");
    count.turn(1).set("serving.level", -101);
    EXPECT_EQ(count.value(), "1");
    EXPECT_EQ(count.turn(2).value(), "1"); // a message that does not report the level
    count.turn(3).set("serving.level", -99);
    EXPECT_EQ(count.value(), "1");
    count.turn(4).set("serving.level", -105);
    EXPECT_EQ(count.value(), "2");
    EXPECT_EQ(count.turn(10.9).value(), "2");
    EXPECT_EQ(count.turn(11).value(), "1");
    EXPECT_EQ(count.turn(14).value(), "0");
}

TEST(RuleWindowsTest, CountsChanges) {
    EvaluatedExpression count("count(changed(serving.cell), 60 s) >= 2");
    count.set("serving.cell", 1);
    count.turn(1).set("serving.cell", 2);
    EXPECT_EQ(count.value(), "false");
    count.turn(2).set("serving.cell", 1);
    EXPECT_EQ(count.value(), "true");
}

TEST(RuleWindowsTest, ANestedWindowIsUpToDate) {
    EvaluatedExpression count("count(delta(serving.level, 1 s) < -5 dB, 10 s)");
    for (int second = 0; second < 5; ++second)
        count.turn(second).set("serving.level", -80.0 - 10 * second);
    EXPECT_EQ(count.value(), "4"); // of the five levels the first has nothing to compare with
}

TEST(RuleWindowsTest, KeepsABoundedNumberOfSamples) {
    EvaluatedExpression both("count(serving.level < 0, 1 h) + delta(serving.level, 1 h) / 1 dB * 0");
    for (int i = 0; i < 5000; ++i)
        both.turn(i).set("serving.level", -80);
    EXPECT_EQ(both.value(), "1024"); // at most, of the 3600 in the window
}

} // namespace
} // namespace velmora
