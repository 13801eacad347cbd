// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/Truth/StatedReselections.h"

#include "Tests/Telephony/Drives/Truth/KeptTruth.h"

#include <gmock/gmock.h>

#include <chrono>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::IsEmpty;

TruthCell cell(std::int64_t physical) {
    return {"LTE", 1300, physical, physical};
}

/// A phone on cell 1 at -90 dBm.
class StatedReselectionsTest : public testing::Test {
protected:
    /// Cell 2 at that level, once a second.
    void measure(TruthTime from, TruthTime to, double level_dBm) {
        for (TruthTime at = from; at <= to; at += 1s)
            measureOnce(at, 2, level_dBm);
    }
    void measureOnce(TruthTime at, std::int64_t neighbour, double level_dBm) {
        reselections.measureServing(at, -90);
        reselections.measureNeighbours(at, {{cell(neighbour), level_dBm}});
        reselections.confirm(at);
    }
    void move(TruthTime at, TruthMode mode = TruthMode::Idle) {
        reselections.move(at, {cell(1), cell(2), mode});
        reselections.confirm(at);
    }

    KeptTruth truth;
    StatedReselections reselections{truth};
};

TEST_F(StatedReselectionsTest, areLateAfterMoreThanTenSeconds) {
    measure(0s, 11s, -84);
    move(11s);
    EXPECT_THAT(linesOf(truth), ElementsAre("11 late-reselection"));
}

TEST_F(StatedReselectionsTest, areInTimeAfterTenSecondsBelowTheMarginOrByTheNetwork) {
    measure(0s, 10s, -84);
    move(10s);
    measure(20s, 40s, -85);
    move(40s);
    measure(50s, 70s, -60);
    move(70s, TruthMode::Connected);
    EXPECT_THAT(linesOf(truth), IsEmpty());
}

TEST_F(StatedReselectionsTest, countFromTheLastReportBelowTheMargin) {
    measure(0s, 11s, -84);
    measure(12s, 12s, -90);
    measure(13s, 20s, -84);
    move(20s);
    EXPECT_THAT(linesOf(truth), IsEmpty());
}

TEST_F(StatedReselectionsTest, areEarlyToACellThatIsNoStrongerBeforeAndAfter) {
    measure(0s, 2s, -92);
    move(3s);
    measureOnce(4s, 1, -88); // the cell that the phone left
    EXPECT_THAT(linesOf(truth), ElementsAre("3 early-reselection"));
}

TEST_F(StatedReselectionsTest, areNotEarlyWhereTheOldCellIsWeakerOrNotReported) {
    measure(0s, 2s, -92);
    move(3s);
    measureOnce(4s, 1, -91);
    measureOnce(5s, 1, -60);
    measure(10s, 12s, -92);
    move(13s);
    reselections.confirm(15100ms); // no report for more than two seconds
    measureOnce(16s, 1, -60);
    EXPECT_THAT(linesOf(truth), IsEmpty());
}

} // namespace
} // namespace velmora
