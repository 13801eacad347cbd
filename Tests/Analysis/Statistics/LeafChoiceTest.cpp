// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Analysis/Statistics/StatisticsFixture.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

class LeafChoiceTest : public testing::Test {
protected:
    LeafChoiceTest() { statistics.leaf("/Cell/Level").role = Role::ServingLevel; }

    TestStatistics statistics;
    const CatalogueField& level = statistics.leaf("/Cell/Level");
    const CatalogueField& channel = statistics.leaf("/Cells/*/Channel");
    LeafChoice choice;
};

TEST_F(LeafChoiceTest, IsEverythingByDefault) {
    EXPECT_TRUE(choice.isEverything());
    EXPECT_TRUE(choice.choose(level) && choice.choose(channel));
}

TEST_F(LeafChoiceTest, IsByPathAndRoleTogether) {
    choice.addRole(Role::ServingLevel);
    EXPECT_TRUE(choice.choose(level));
    EXPECT_FALSE(choice.choose(channel));
    choice.addPath("/Cells", "/Cells");
    EXPECT_FALSE(choice.choose(level));
    EXPECT_FALSE(choice.choose(channel));
}

TEST_F(LeafChoiceTest, HasTheNameOfThePathThatSelectsItFirst) {
    choice.addPath("/Cell", "/Cell");
    choice.addPath("level", "/Cell/Level");
    choice.addPath("third", "/Cells/2/Channel");
    EXPECT_EQ(choice.choose(level)->name, "");
    const auto chosen = choice.choose(channel);
    ASSERT_TRUE(chosen);
    EXPECT_EQ(chosen->name, "third");
    ASSERT_EQ(chosen->rows.size(), 1u);
    EXPECT_EQ(chosen->rows[0][0], 2u);
}

TEST(ChosenRows, AreThoseOfAnyPath) {
    StatisticsPlan plan;
    plan.leaves.addPath("/Cells/2", "/Cells/2");
    plan.leaves.addPath("/Cells/0/Level", "/Cells/0/Level");
    TestStatistics first(plan); // whose rows are all the first one
    std::uint64_t samples = 0;
    first.complete = [&](const GroupStatistics& group) {
        samples = group.parts.front()->find(first.leaf("/Cells/*/Level"))->numbers.count();
    };
    first.leaf("/Cells/*/Other");
    first.report({after(0), {{"/Cells/*/Level", -80}, {"/Cells/*/Other", 1}}});
    first.finish();
    EXPECT_EQ(samples, 1u);
}

} // namespace
} // namespace velmora
