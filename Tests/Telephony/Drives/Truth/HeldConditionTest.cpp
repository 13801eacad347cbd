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
    void poor(TruthTime at) { condition.measure(at, true, false); }
    void between(TruthTime at) { condition.measure(at, false, false); }
    void good(TruthTime at) { condition.measure(at, false, true); }

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

TEST_F(HeldConditionTest, aMeasurementCountsUntilTheNextOne) {
    poor(10s);
    good(16s);
    good(19s);
    EXPECT_THAT(linesOf(truth), ElementsAre("10-16 poor-quality"));
}

TEST_F(HeldConditionTest, whatHeldForLessIsNone) {
    poor(10s);
    good(15s); // at the end of the five seconds it is good
    poor(16s);
    between(20s);
    poor(21s);
    condition.finish(25s);
    EXPECT_THAT(linesOf(truth), IsEmpty());
}

TEST_F(HeldConditionTest, whatEndsItHasToHoldToo) {
    poor(10s);
    poor(15s);
    good(20s);
    between(22s);
    good(30s);
    between(34s);
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
    condition.lose(27s);
    good(28s);
    good(40s);
    EXPECT_THAT(linesOf(truth), ElementsAre("10 poor-quality"));
}

TEST_F(HeldConditionTest, whatIsNotMeasuredDoesNotBegin) {
    poor(10s);
    condition.lose(11s);
    condition.finish(18s);
    EXPECT_THAT(linesOf(truth), IsEmpty());
}

TEST_F(HeldConditionTest, whatStillLastsAtTheEndHasNoEnd) {
    poor(10s);
    condition.finish(15s);
    EXPECT_THAT(linesOf(truth), ElementsAre("10 poor-quality"));
}

TEST(RadioConditionsTest, eachTechnologyHasItsLimits) {
    KeptTruth truth;
    RadioConditions conditions(truth);
    conditions.measureLevel(0s, "GSM", -100); // not below the limit
    conditions.measureLevel(10s, "GSM", -101);
    conditions.measureLevel(20s, "UMTS", -107);
    conditions.measureLevel(30s, "UMTS", -111);
    conditions.measureLevel(40s, "LTE", -112);
    conditions.measureLevel(50s, "NR", -115.1);
    conditions.finish(60s);
    EXPECT_THAT(linesOf(truth),
                ElementsAre("10-20 weak-coverage", "30-40 weak-coverage", "50 weak-coverage"));
}

TEST(RadioConditionsTest, threeNeighboursOfNearlyItsLevelPolluteTheServingCell) {
    KeptTruth truth;
    RadioConditions conditions(truth);
    conditions.measureNeighbours(0s, -90, {-94, -94});
    conditions.measureNeighbours(10s, -90, {-80, -94, -94.9, -95});
    conditions.measureNeighbours(20s, -90, {-80, -94, -96.9}); // three within 7 dB
    conditions.measureNeighbours(30s, -90, {-80, -94, -97});
    conditions.measureNeighbours(40s, -90, {});
    EXPECT_THAT(linesOf(truth), ElementsAre("10-30 pilot-pollution"));
}

} // namespace
} // namespace velmora
