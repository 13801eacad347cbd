// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/Truth/HeldCondition.h"
#include "Telephony/Drives/Truth/RadioConditions.h"
#include "Tests/Telephony/Drives/Truth/KeptTruth.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::IsEmpty;

class HeldConditionTest : public testing::Test {
protected:
    void poor(TruthTime at) { measure(at, true, false); }
    void between(TruthTime at) { measure(at, false, false); }
    void good(TruthTime at) { measure(at, false, true); }

    void measure(TruthTime at, bool isSo, bool isEnd) {
        condition.measure(at, isSo, isEnd);
        condition.confirm(at);
    }

    KeptTruth truth;
    HeldCondition condition{truth, "poor-quality", 5s, 3s}; ///< begins after five seconds, ends after three
};

TEST_F(HeldConditionTest, itBeginsWhereItHasHeldForLongEnough) {
    poor(10s);
    poor(15s);
    good(20s);
    good(23s);
    EXPECT_THAT(linesOf(truth), ElementsAre("10-20 poor-quality"));
}

TEST_F(HeldConditionTest, aMessageHasToConfirmIt) {
    poor(10s);
    good(16s); // what was at fifteen seconds, no message says
    poor(20s);
    condition.confirm(25s);
    good(26s);
    good(29s);
    EXPECT_THAT(linesOf(truth), ElementsAre("20-26 poor-quality"));
}

TEST_F(HeldConditionTest, whatHeldForLessIsNone) {
    poor(10s);
    good(15s); // at the end of the five seconds it is good
    poor(16s);
    between(20s);
    poor(21s);
    condition.finish();
    EXPECT_THAT(linesOf(truth), IsEmpty());
}

TEST_F(HeldConditionTest, whatEndsItHasToHoldToo) {
    poor(10s);
    poor(15s);
    good(20s);
    between(22s);
    good(30s);
    condition.confirm(33s);
    EXPECT_THAT(linesOf(truth), ElementsAre("10-30 poor-quality"));
}

TEST_F(HeldConditionTest, itHoldsOverAShortTimeWithoutMeasurements) {
    poor(10s);
    condition.lose(11s);
    poor(20s);
    good(21s);
    good(25s);
    EXPECT_THAT(linesOf(truth), ElementsAre("10-21 poor-quality"));
}

TEST_F(HeldConditionTest, itHasNoEndWhereNothingIsMeasuredForTenSeconds) {
    poor(10s);
    poor(16s);
    condition.lose(17s);
    condition.confirm(27s);
    good(28s);
    good(40s);
    EXPECT_THAT(linesOf(truth), ElementsAre("10 poor-quality"));
}

TEST_F(HeldConditionTest, whatHasOnlyToHoldAtTheEndHasOne) {
    poor(10s);
    poor(15s);
    good(18s);
    condition.finish();
    EXPECT_THAT(linesOf(truth), ElementsAre("10-18 poor-quality"));
}

TEST_F(HeldConditionTest, whatIsNotMeasuredDoesNotBegin) {
    poor(10s);
    condition.lose(11s);
    condition.confirm(18s);
    EXPECT_THAT(linesOf(truth), IsEmpty());
}

TEST_F(HeldConditionTest, whatStillLastsAtTheEndHasNoEnd) {
    poor(10s);
    poor(15s);
    condition.finish();
    EXPECT_THAT(linesOf(truth), ElementsAre("10 poor-quality"));
}

TEST(RadioConditionsTest, eachTechnologyHasItsLimits) {
    KeptTruth truth;
    RadioConditions conditions(truth);
    const auto measure = [&](TruthTime at, const char* radio, double level_dBm) {
        conditions.measureLevel(at, radio, level_dBm);
        conditions.confirm(at + 5s);
    };
    measure(0s, "GSM", -100); // not below the limit
    measure(10s, "GSM", -101);
    measure(20s, "UMTS", -107);
    measure(30s, "UMTS", -111);
    measure(40s, "LTE", -112);
    measure(50s, "NR", -115.1);
    conditions.finish();
    EXPECT_THAT(linesOf(truth),
                ElementsAre("10-20 weak-coverage", "30-40 weak-coverage", "50 weak-coverage"));
}

TEST(RadioConditionsTest, threeNeighboursOfNearlyItsLevelPolluteTheServingCell) {
    KeptTruth truth;
    RadioConditions conditions(truth);
    const auto measure = [&](TruthTime at, const std::vector<double>& neighbours_dBm) {
        for (TruthTime each = at; each <= at + 5s; each += 1s) {
            conditions.compareServing(each, -90);
            conditions.compareNeighbours(each, neighbours_dBm, true);
            conditions.confirm(each);
        }
    };
    measure(0s, {-94, -94});
    measure(10s, {-80, -94, -94.9, -95});
    measure(20s, {-80, -94, -96.9}); // three within 7 dB
    measure(30s, {-80, -94, -97});
    EXPECT_THAT(linesOf(truth), ElementsAre("10-30 pilot-pollution"));
}

TEST(RadioConditionsTest, anOldLevelOfTheServingCellIsNotCompared) {
    KeptTruth truth;
    RadioConditions conditions(truth);
    conditions.compareServing(0s, -90);
    for (TruthTime at{0}; at <= 20s; at += 1s) {
        conditions.compareNeighbours(at, {-90, -90, -90}, true);
        conditions.confirm(at);
    }
    conditions.finish();
    EXPECT_THAT(linesOf(truth), IsEmpty());
}

TEST(RadioConditionsTest, whatOneCellHadIsNotKnownOfTheNext) {
    KeptTruth truth;
    RadioConditions conditions(truth);
    conditions.measureLevel(0s, "LTE", -116);
    conditions.confirm(0s);
    conditions.changeCell(4s);
    conditions.confirm(5s);
    conditions.measureLevel(6s, "LTE", -90);
    conditions.confirm(6s);
    conditions.finish();
    EXPECT_THAT(linesOf(truth), IsEmpty());
}

} // namespace
} // namespace velmora
