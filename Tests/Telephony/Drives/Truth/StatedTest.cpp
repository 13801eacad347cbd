// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/Truth/StatedCell.h"
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
using testing::IsEmpty;

/// "7 cell-reselection", "7-9 limited-service", "(7 handover)" where it is hidden.
std::vector<std::string> linesOf(const KeptTruth& truth) {
    std::vector<std::string> lines;
    for (const TruthEvent& event : truth.events) {
        std::string line = std::to_string(event.at / 1s);
        if (event.end)
            line += "-" + std::to_string(*event.end / 1s);
        line.append(" ").append(event.kind);
        for (const char* name : {"from", "to", "context"})
            if (const std::string value = fieldOf(event, name); !value.empty())
                line += " " + value;
        lines.push_back(event.isHidden ? "(" + line + ")" : line);
    }
    return lines;
}

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

class StatedCellTest : public testing::Test {
protected:
    static TruthCell cell(int physical, std::string_view radio = "LTE") { return {radio, 1300, physical, 0}; }
    void on(TruthTime at, std::optional<TruthCell> cell, TruthMode mode = TruthMode::Idle) {
        serving.update(at, {cell, true, mode, mode});
    }
    void unstated(TruthTime at, std::optional<TruthCell> cell) { serving.update(at, {cell, false}); }

    KeptTruth truth;
    StatedCell serving{truth};
};

TEST_F(StatedCellTest, theFirstCellIsNoChange) {
    on(1s, std::nullopt);
    on(2s, cell(1));
    EXPECT_THAT(linesOf(truth), IsEmpty());
}

TEST_F(StatedCellTest, theModeDecidesBetweenReselectionAndHandover) {
    on(1s, cell(1));
    on(20s, cell(2), TruthMode::Idle);
    on(40s, cell(3), TruthMode::Connected);
    on(60s, cell(4), TruthMode::Unknown);
    EXPECT_THAT(linesOf(truth), ElementsAre("20 cell-reselection", "40 handover", "60 cell-change"));
}

TEST_F(StatedCellTest, theModeIsThatOfTheMove) {
    on(1s, cell(1));
    serving.update(2s, {cell(2), false, TruthMode::Connected, TruthMode::Connected});
    serving.update(3s, {cell(2), true, TruthMode::Idle, TruthMode::Connected});
    EXPECT_THAT(linesOf(truth), ElementsAre("3 handover"));
}

TEST_F(StatedCellTest, aChangeWhoseModeNoMessageShowsIsHidden) {
    on(1s, cell(1));
    serving.update(2s, {cell(2), true, TruthMode::Connected, TruthMode::Idle});
    EXPECT_THAT(linesOf(truth), ElementsAre("(2 handover)"));
}

TEST_F(StatedCellTest, anotherRadioTechnologyIsToldBesideTheMove) {
    on(1s, cell(1, "GSM"));
    on(2s, cell(1, "UMTS"), TruthMode::Connected);
    EXPECT_THAT(linesOf(truth), ElementsAre("2 handover", "2 technology-change"));
}

TEST_F(StatedCellTest, theReturnWithinTenSecondsIsAPingPong) {
    on(1s, cell(1));
    on(20s, cell(2));
    on(30s, cell(1));
    on(41s, cell(2)); // eleven seconds after it left that one
    EXPECT_THAT(linesOf(truth), ElementsAre("20 cell-reselection", "30 cell-reselection", "30 ping-pong",
                                            "41 cell-reselection"));
}

TEST_F(StatedCellTest, theCellAfterASearchIsNoChange) {
    on(1s, cell(1));
    on(2s, std::nullopt);
    on(3s, cell(2));
    EXPECT_THAT(linesOf(truth), IsEmpty());
}

TEST_F(StatedCellTest, aSearchThatNoMessageStatesLooksLikeAChange) {
    on(1s, cell(1));
    unstated(2s, std::nullopt);
    on(3s, cell(2));
    EXPECT_THAT(linesOf(truth), ElementsAre("(3 cell-change)"));
}

} // namespace
} // namespace velmora
