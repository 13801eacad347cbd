// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Analysis/Events/HandMade.h"

#include <gmock/gmock.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

TEST(ServingCell, InIdleModeAnotherCellIsAReselection) {
    LTEEngine lte;
    lte.measureIdle(0, 17, -90);
    lte.serve(1, 17);
    lte.serve(2.5, 62, 6300);
    EXPECT_THAT(lte.lines(),
                ElementsAre("2.500 cell-reselection: PCI 17 on EARFCN 1300 to PCI 62 on EARFCN 6300"));
    const Event& event = lte.only("cell-reselection");
    EXPECT_EQ(textOf(event, "mode"), "idle");
    EXPECT_EQ(textOf(event, "from.technology"), "LTE");
    EXPECT_EQ(numberOf(event, "from.channel"), 1300);
    EXPECT_EQ(numberOf(event, "from.physical-cell"), 17);
    EXPECT_EQ(numberOf(event, "from.cell"), 1017);
    EXPECT_EQ(numberOf(event, "to.channel"), 6300);
    EXPECT_EQ(event.field("duration"), nullptr); // when the phone came to the first cell was not seen
    // The last message that reported anything of the old cell, and the one that reported the new one.
    EXPECT_THAT(event.evidence, ElementsAre(MessageNumber{0, 2}, MessageNumber{0, 3}));
}

TEST(ServingCell, InConnectedModeAnotherCellIsAHandover) {
    LTEEngine lte;
    lte.measureConnected(0, 17);
    lte.measureConnected(0.24, 17);
    lte.measureConnected(0.48, 18);
    EXPECT_THAT(lte.linesOf("handover"), ElementsAre("0.480 PCI 17 on EARFCN 1300 to PCI 18 on EARFCN 1300"));
    EXPECT_EQ(textOf(lte.only("handover"), "mode"), "connected");
}

TEST(ServingCell, WithoutAModeItIsACellChange) {
    LTEEngine lte;
    lte.serve(0, 17);
    lte.serve(1, 18);
    EXPECT_THAT(lte.lines(),
                ElementsAre("1.000 cell-change: PCI 17 on EARFCN 1300 to PCI 18 on EARFCN 1300"));
}

TEST(ServingCell, TheModeOfMeasurementsLastsFiveSeconds) {
    LTEEngine lte;
    lte.measureIdle(0, 17, -90);
    lte.serve(3, 17);
    lte.serve(5.5, 18);
    EXPECT_THAT(lte.lines(),
                ElementsAre("5.500 cell-change: PCI 17 on EARFCN 1300 to PCI 18 on EARFCN 1300"));
}

TEST(ServingCell, TheFirstCellIsNoChange) {
    LTEEngine lte;
    lte.serve(0, 17);
    lte.serve(1, 17);
    EXPECT_THAT(lte.lines(), IsEmpty());
}

TEST(ServingCell, ACellThatNoMessageHasReportedForFiveSecondsIsForgotten) {
    LTEEngine lte;
    lte.serve(0, 17);
    lte.measureNeighbours(4, {{20, -80}});
    lte.serve(5.1, 18);
    EXPECT_THAT(lte.lines(), IsEmpty());
}

TEST(ServingCell, AReservedTrackingAreaReportsNoCell) {
    LTEEngine lte;
    lte.serve(0, 17);
    lte.send(lte.at(1).number(servingPCI, 0).number(servingEARFCN, 1300).number(servingTAC, 0));
    lte.send(lte.at(2).number(servingPCI, 1).number(servingEARFCN, 1300).number(servingTAC, 0xFFFE));
    EXPECT_THAT(lte.lines(), IsEmpty());
    EXPECT_EQ(nameOf(lte.picture().serving()), "PCI 17 on EARFCN 1300");
}

TEST(ServingCell, AReservedTrackingAreaDoesNotKeepTheEarlierCell) {
    LTEEngine lte;
    lte.serve(0, 17);
    lte.send(lte.at(4).number(servingPCI, 0).number(servingEARFCN, 1300).number(servingTAC, 0));
    lte.serve(6, 18);
    EXPECT_THAT(lte.lines(), IsEmpty());
}

TEST(ServingCell, OfCDMA2000IsZeroWhereThereIsNone) {
    constexpr std::string_view base = "/System/Base Station ID";
    HandMadeEngine c2k{"Ostrel_CDMA", {{base, Role::ServingCell}}};
    c2k.send(c2k.at(0).state("/Overview/1x State", 4)); // sync
    c2k.send(c2k.at(1).number(base, 0));
    c2k.send(c2k.at(2).number(base, 231));
    c2k.send(c2k.at(2.5).state("/Overview/1x State", 6)); // paging
    c2k.send(c2k.at(3).number(base, 232));
    EXPECT_THAT(c2k.linesOf("cell-reselection"), ElementsAre("3.000 cell 231 to cell 232"));
}

TEST(ServingCell, OfEVDOCountsFromIdleOn) {
    constexpr std::string_view pilot = "/EV-DO/Serving PN Offset";
    HandMadeEngine c2k{"Ostrel_CDMA", {{pilot, Role::ServingPhysicalCell}}};
    c2k.send(c2k.at(0).state("/Overview/EV-DO State", 2).number(pilot, 124)); // sync
    c2k.send(c2k.at(1).state("/Overview/EV-DO State", 3).number(pilot, 145)); // idle
    c2k.send(c2k.at(2).state("/Overview/EV-DO State", 5).number(pilot, 145)); // connected
    c2k.send(c2k.at(3).state("/Overview/EV-DO State", 5).number(pilot, 124));
    EXPECT_THAT(c2k.linesOf("handover"), ElementsAre("3.000 PN 145 to PN 124"));
    EXPECT_THAT(c2k.linesOf("cell-reselection"), IsEmpty());
}

TEST(ServingCell, AReturnWithinTenSecondsIsAPingPong) {
    LTEEngine lte;
    for (const double start : {0.0, 100.0}) {
        lte.measureIdle(start, 17, -90);
        lte.serve(start + 1, 18);
        lte.serve(start + 5, 18);
        lte.serve(start + 9, 18);
        // From the move at 1 s on it is 10 s, and 10.1 s.
        lte.serve(start + (start == 0 ? 11 : 11.1), 17);
    }
    EXPECT_THAT(lte.linesOf("ping-pong"),
                ElementsAre("11.000 back to PCI 17 on EARFCN 1300 from PCI 18 on EARFCN 1300"));
    EXPECT_EQ(numberOf(lte.only("ping-pong"), "duration"), 10);
}

TEST(ServingCell, AReturnFromACellWhoseBeginningWasNotSeenIsNoPingPong) {
    LTEEngine lte;
    lte.serve(0, 18);
    lte.serve(1, 17);
    lte.send(lte.at(32)); // 31 s of silence
    lte.serve(33, 17);
    lte.serve(34, 18);
    EXPECT_THAT(lte.linesOf("ping-pong"), IsEmpty());
}

TEST(ServingCell, TheRestOfACellReportedLaterIsNoChange) {
    LTEEngine lte;
    lte.measureIdle(0, 17, -90);
    lte.send(lte.at(1).number(servingIdentity, 5).number(servingTAC, 7101));
    lte.send(lte.at(1.5).number(servingIdentity, 6).number(servingTAC, 7101));
    lte.measureIdle(2, 18, -90);
    EXPECT_THAT(lte.linesOf("cell-reselection"), ElementsAre("1.500 PCI 17 on EARFCN 1300 to cell 6"));
}

} // namespace
} // namespace velmora
