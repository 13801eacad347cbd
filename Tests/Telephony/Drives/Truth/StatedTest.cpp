// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/Truth/StatedCondition.h"
#include "Telephony/Drives/Truth/StatedContexts.h"
#include "Telephony/Drives/Truth/StatedState.h"
#include "Tests/Telephony/Drives/Truth/KeptTruth.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;

TEST(StatedStateTest, aChangeIsTheDifferenceBetweenTwoStatements) {
    KeptTruth truth;
    StatedState state(truth, "radio-state", "RR");
    state.update(1s, "idle", true);
    state.update(2s, "connected", false);
    state.update(3s, "connected", true);
    state.update(4s, "connected", true);
    EXPECT_THAT(linesOf(truth), ElementsAre("3 radio-state idle connected"));
}

TEST(StatedStateTest, aStateThatEndsUnstatedIsHidden) {
    KeptTruth truth;
    StatedState state(truth, "radio-state", "RR");
    state.update(1s, "idle", true);
    state.update(2s, "pending", false);
    state.update(3s, "connected", true);
    EXPECT_THAT(linesOf(truth), ElementsAre("(2 radio-state idle pending)", "3 radio-state idle connected"));
}

TEST(StatedStateTest, aReturnToTheStatedStateIsNoChange) {
    KeptTruth truth;
    StatedState state(truth, "radio-state", "RR");
    state.update(1s, "idle", true);
    state.update(2s, "pending", false);
    state.update(3s, "idle", true);
    EXPECT_THAT(linesOf(truth), ElementsAre("(2 radio-state idle pending)"));
}

TEST(StatedStateTest, aStateThatThePhoneIsNotInIsHiddenAndSoIsItsEnd) {
    KeptTruth truth;
    StatedState state(truth, "radio-state", "mode");
    state.update(1s, "idle", true);
    state.misstate(2s, "connected");
    state.update(3s, "idle", false);
    state.update(4s, "idle", true);
    state.update(5s, "connected", true);
    EXPECT_THAT(linesOf(truth),
                ElementsAre("(2 radio-state idle connected)", "(4 radio-state connected idle)",
                            "5 radio-state idle connected"));
}

TEST(StatedConditionTest, itLastsFromStatementToStatement) {
    KeptTruth truth;
    StatedCondition condition(truth, "limited-service");
    condition.update(1s, false, true);
    condition.update(2s, true, false);
    condition.update(3s, true, true);
    condition.update(4s, false, false);
    condition.update(5s, false, true);
    EXPECT_THAT(linesOf(truth), ElementsAre("3-5 limited-service"));
}

TEST(StatedConditionTest, whatEndsUnstatedIsHidden) {
    KeptTruth truth;
    StatedCondition condition(truth, "limited-service");
    condition.update(2s, true, false);
    condition.update(3s, false, false);
    condition.update(4s, false, true);
    EXPECT_THAT(linesOf(truth), ElementsAre("(2-3 limited-service)"));
}

TEST(StatedConditionTest, whatStillLastsAtTheEndHasNoEnd) {
    KeptTruth truth;
    StatedCondition condition(truth, "limited-service");
    condition.update(2s, true, true);
    condition.finish();
    EXPECT_THAT(linesOf(truth), ElementsAre("2 limited-service"));
}

TEST(StatedContextsTest, eachContextComesAndGoesByItself) {
    KeptTruth truth;
    StatedContexts contexts(truth);
    contexts.state(1s, 0);
    contexts.state(2s, 2);
    contexts.state(3s, {2, 3});
    contexts.state(4s, 0);
    EXPECT_THAT(linesOf(truth), ElementsAre("2 context-up 1", "2 context-up 2", "3 context-down 1",
                                            "3 context-up 3", "4 context-down 2", "4 context-down 3"));
}

} // namespace
} // namespace velmora
