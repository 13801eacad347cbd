// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Analysis/Statistics/StatisticsFixture.h"

#include <gmock/gmock.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using By = StatisticsPlan::By;

const std::string state = "/Radio/State";
const std::string level = "/Cell/Level";

/// The groups as "key: messages, samples of the level, states".
std::vector<std::string> groupsOf(By by, const std::vector<TestMessage>& messages) {
    TestStatistics statistics({by, {}});
    std::vector<std::string> lines;
    statistics.leaf(level);
    statistics.leaf(state);
    statistics.complete = [&](const GroupStatistics& group) {
        const TechnologyPart& part = *group.parts.front();
        std::string line = group.key.technology;
        if (group.key.input)
            line += "file " + std::to_string(*group.key.input);
        if (group.key.minute)
            line += " minute " + std::to_string((*group.key.minute - after(0)) / std::chrono::minutes(1));
        line += ": " + std::to_string(part.messages);
        const LeafStatistics* const levels = part.leaves.empty() ? nullptr : part.leaves[0].get();
        line += ", " + std::to_string(levels ? levels->numbers.count() : 0);
        for (const std::string& each : stateLines(group, state))
            line += ", " + each;
        lines.push_back(line);
    };
    for (const TestMessage& message : messages)
        statistics.report(message);
    statistics.finish();
    return lines;
}

const std::vector<TestMessage> crossing{
    {after(50), {{level, -80}}, {{state, "A"}}},
    {after(55), {{level, -81}}, {}},
    {after(65), {{level, -82}}, {{state, "B"}}, {}, {}, 1},
    {after(70), {}, {}, {}, {}, 1},
};

TEST(StatisticsGroups, OneOfAllMessages) {
    EXPECT_THAT(groupsOf(By::Nothing, crossing),
                ElementsAre(": 4, 3, A: 1 samples, 15000 ms, B: 1 samples, 5000 ms, A > B: 1"));
}

TEST(StatisticsGroups, OneATechnology) {
    EXPECT_THAT(groupsOf(By::Technology, crossing),
                ElementsAre("Test: 4, 3, A: 1 samples, 15000 ms, B: 1 samples, 5000 ms, A > B: 1"));
}

TEST(StatisticsGroups, AFileHasTheTimeUpToTheNextOnesFirstMessage) {
    EXPECT_THAT(groupsOf(By::File, crossing),
                ElementsAre("file 0: 2, 2, A: 1 samples, 15000 ms",
                            "file 1: 2, 1, A: 0 samples, 0 ms, B: 1 samples, 5000 ms, A > B: 1"));
}

TEST(StatisticsGroups, AMinuteHasTheTimeUpToItsEnd) {
    EXPECT_THAT(groupsOf(By::Minute, crossing),
                ElementsAre("Test minute 0: 2, 2, A: 1 samples, 10000 ms",
                            "Test minute 1: 2, 1, A: 0 samples, 5000 ms, B: 1 samples, 5000 ms, A > B: 1"));
}

TEST(StatisticsGroups, AMinuteIsPassedOnWhenItIsOver) {
    TestStatistics statistics({By::Minute, {}});
    int groups = 0;
    statistics.complete = [&](const GroupStatistics&) { ++groups; };
    statistics.report({after(59)});
    EXPECT_EQ(groups, 0);
    statistics.report({after(60)});
    EXPECT_EQ(groups, 1);
    statistics.report({after(600)}); // after a silence
    EXPECT_EQ(groups, 2);
    statistics.finish();
    EXPECT_EQ(groups, 3);
}

TEST(StatisticsGroups, FurtherLeavesAreCountedAsOmitted) {
    TestStatistics statistics;
    std::uint64_t omitted = 0;
    statistics.complete = [&](const GroupStatistics& group) { omitted = group.parts.front()->omitted; };
    TestMessage message{after(0)};
    for (std::size_t i = 0; i < StatisticsGroups::mostLeaves + 7; ++i)
        message.numbers["/" + std::to_string(i)] = 1;
    statistics.report(message);
    statistics.finish();
    EXPECT_EQ(omitted, 7u);
}

TEST(StatisticsGroups, ChosenLeavesThatReportNothingAreThere) {
    StatisticsPlan plan;
    plan.leaves.addPath(level, level);
    TestStatistics statistics(plan);
    statistics.leaf(level).kind = ObservedKind::Number;
    statistics.leaf(state);
    std::vector<std::string> paths;
    statistics.complete = [&](const GroupStatistics& group) {
        for (const auto& leaf : group.parts.front()->leaves)
            if (leaf)
                paths.push_back(leaf->leaf.path + (leaf->hasNumbers() ? " numbers" : "") +
                                (leaf->hasStates() ? " states" : ""));
    };
    statistics.report({after(0), {}, {{state, "A"}}});
    statistics.finish();
    EXPECT_THAT(paths, ElementsAre(level + " numbers"));
}

TEST(RoleStatistics, AreOfAllLeavesOfTheRole) {
    TestStatistics statistics;
    for (const char* const path : {"/A", "/B"}) {
        statistics.leaf(path).role = Role::ServingLevel;
        statistics.leaf(path).unit = Unit::DBm;
    }
    std::vector<RoleStatistics> roles;
    statistics.complete = [&](const GroupStatistics& group) { roles = rolesOf(group); };
    for (int i = 0; i < 5; ++i)
        statistics.report({after(i), {{"/A", -100}}});
    for (int i = 60; i < 64; ++i)
        statistics.report({after(i), {{"/A", -90}, {"/B", -110}}});
    statistics.report({after(64), {}, {}, {"/A"}});
    statistics.finish();
    ASSERT_EQ(roles.size(), 1u);
    EXPECT_EQ(roles[0].role, Role::ServingLevel);
    EXPECT_EQ(roles[0].unit, Unit::DBm);
    EXPECT_EQ(roles[0].numbers.count(), 13u);
    EXPECT_EQ(roles[0].absent, 1u);
    // The second minute has 4 of -110 and 4 of -90: the fourth is the median.
    ASSERT_TRUE(roles[0].worst);
    EXPECT_EQ(roles[0].worst->begin, after(60));
    EXPECT_EQ(roles[0].worst->figure, -110);
    EXPECT_EQ(roles[0].worstTechnology, "Test");
}

} // namespace
} // namespace velmora
