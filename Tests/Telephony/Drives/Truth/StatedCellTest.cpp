// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/Truth/StatedCell.h"
#include "Tests/Telephony/Drives/Truth/KeptTruth.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::IsEmpty;

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

TEST_F(StatedCellTest, aCellThatThePhoneIsNotOnIsHiddenAndSoIsItsEnd) {
    on(1s, cell(1));
    unstated(2s, std::nullopt);
    serving.misstate(3s, cell(0));
    on(4s, cell(2));
    on(5s, cell(3));
    EXPECT_THAT(linesOf(truth), ElementsAre("(3 cell-change)", "(4 cell-change)", "5 cell-reselection"));
}

TEST_F(StatedCellTest, aCellThatIsMisstatedInASearchIsTheFirst) {
    on(1s, cell(1));
    on(2s, std::nullopt);
    serving.misstate(3s, cell(0));
    on(4s, std::nullopt);
    on(5s, cell(2));
    EXPECT_THAT(linesOf(truth), IsEmpty());
}

} // namespace
} // namespace velmora
