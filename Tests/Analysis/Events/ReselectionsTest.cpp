// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Analysis/Events/HandMade.h"

#include <gmock/gmock.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

/// An idle phone on PCI 17 at -90 dBm, with PCI 18 as its neighbour, measured once a second until `end`.
void measure(LTEEngine& lte, double end, double neighbour_dBm) {
    for (double seconds = 0; seconds <= end; ++seconds) {
        lte.measureIdle(seconds, 17, -90);
        lte.measureNeighbours(seconds + 0.1, {{18, neighbour_dBm}});
    }
}

TEST(Reselections, AreLateAfterANeighbourWasSixDecibelsStrongerForMoreThanTenSeconds) {
    LTEEngine lte;
    measure(lte, 11, -84);
    lte.measureIdle(11.5, 18, -84); // 11.4 s after the first report
    EXPECT_THAT(lte.linesOf("late-reselection"),
                ElementsAre("11.500 PCI 17 on EARFCN 1300 to PCI 18 on EARFCN 1300, 6.0 dB stronger"));
    const Event& event = lte.only("late-reselection");
    EXPECT_DOUBLE_EQ(numberOf(event, "duration"), 11.4);
    EXPECT_EQ(numberOf(event, "margin"), 6);
    EXPECT_EQ(event.severity, Severity::Warning);
    // The first report in which it was stronger, the last one, and that of the new cell.
    EXPECT_THAT(event.evidence, ElementsAre(MessageNumber{0, 2}, MessageNumber{0, 24}, MessageNumber{0, 25}));
}

TEST(Reselections, AreInTimeBeforeThat) {
    LTEEngine lte;
    measure(lte, 10, -84);
    lte.measureIdle(10.1, 18, -84); // 10 s
    EXPECT_THAT(lte.linesOf("late-reselection"), IsEmpty());
    EXPECT_THAT(lte.linesOf("cell-reselection").size(), 1U);
}

TEST(Reselections, AreNotLateBelowTheMargin) {
    LTEEngine lte;
    measure(lte, 20, -84.5);
    lte.measureIdle(20.5, 18, -84);
    EXPECT_THAT(lte.linesOf("late-reselection"), IsEmpty());
}

TEST(Reselections, CountFromTheLastReportInWhichTheNeighbourWasWeaker) {
    LTEEngine lte;
    measure(lte, 11, -84);
    lte.measureNeighbours(11.2, {{18, -90}});
    lte.measureNeighbours(12, {{18, -84}});
    lte.measureIdle(12.5, 18, -84);
    EXPECT_THAT(lte.linesOf("late-reselection"), IsEmpty());
}

TEST(Reselections, ToAnotherCarrierAreNotCompared) {
    LTEEngine lte;
    for (double seconds = 0; seconds <= 20; ++seconds) {
        lte.measureIdle(seconds, 17, -90);
        lte.measureNeighbours(seconds + 0.1, {{18, -60}}, 6300);
    }
    lte.measureIdle(20.5, 18, -60, 6300);
    EXPECT_THAT(lte.linesOf("cell-reselection").size(), 1U);
    EXPECT_THAT(lte.linesOf("late-reselection"), IsEmpty());
}

TEST(Reselections, AreEarlyWhereTheOldCellIsNotWeakerBeforeAndAfter) {
    LTEEngine lte;
    measure(lte, 2, -92);
    lte.measureIdle(2.5, 18, -92);
    EXPECT_THAT(lte.linesOf("early-reselection"), IsEmpty()); // not known yet
    lte.measureNeighbours(2.7, {{17, -90}});
    EXPECT_THAT(lte.linesOf("early-reselection"),
                ElementsAre("2.500 PCI 17 on EARFCN 1300 to PCI 18 on EARFCN 1300, 2.0 dB weaker"));
    EXPECT_EQ(numberOf(lte.only("early-reselection"), "margin"), -2);
}

TEST(Reselections, AreNotEarlyWhereTheOldCellIsWeakerAfterwards) {
    LTEEngine lte;
    measure(lte, 2, -92);
    lte.measureIdle(2.5, 18, -88); // fading
    lte.measureNeighbours(2.7, {{17, -90}});
    lte.measureNeighbours(2.9, {{17, -80}});
    EXPECT_THAT(lte.linesOf("early-reselection"), IsEmpty());
}

TEST(Reselections, AreNotEarlyWithoutAReportAfterwards) {
    LTEEngine lte;
    measure(lte, 2, -92);
    lte.measureIdle(2.5, 18, -92);
    lte.measureIdle(4.6, 18, -92);
    lte.measureNeighbours(4.7, {{17, -80}});
    EXPECT_THAT(lte.linesOf("early-reselection"), IsEmpty());
}

TEST(Reselections, OfGSMAreLateThoughSomeReportsHaveNoBSIC) {
    constexpr std::string_view list = "/GSM/Neighboring Cells";
    HandMadeEngine gsm("Ostrel_GSM", {{"/GSM/GSM Serving Cell/ARFCN", Role::ServingChannel},
                                      {"/GSM/GSM Serving Cell/RSSI", Role::ServingLevel},
                                      {"/GSM/Neighboring Cells/*/ARFCN", Role::NeighbourChannel},
                                      {"/GSM/Neighboring Cells/*/BSIC", Role::NeighbourPhysicalCell},
                                      {"/GSM/Neighboring Cells/*/RSSI", Role::NeighbourLevel}});
    for (int second = 0; second <= 12; ++second) {
        HandMadeMessage message = gsm.at(second);
        message.state("/GSM/GSM RR Info/RR State", 5)
            .number("/GSM/GSM Serving Cell/ARFCN", 20)
            .number("/GSM/GSM Serving Cell/RSSI", -90)
            .list(list, 1)
            .row(0)
            .number("/GSM/Neighboring Cells/*/ARFCN", 30)
            .number("/GSM/Neighboring Cells/*/RSSI", -80);
        if (second % 3 != 0)
            message.number("/GSM/Neighboring Cells/*/BSIC", 12);
        gsm.send(message);
    }
    gsm.send(gsm.at(12.5).number("/GSM/GSM Serving Cell/ARFCN", 30));
    EXPECT_THAT(gsm.linesOf("late-reselection"),
                ElementsAre("12.500 ARFCN 20 to ARFCN 30, 10.0 dB stronger"));
}

TEST(Reselections, AreComparedWithEachReportOfTheirCarrier) {
    LTEEngine lte;
    for (double seconds = 0; seconds <= 11; ++seconds) {
        lte.measureNeighbours(seconds, {{40, -50}}, 6300); // the strongest one is of another carrier
        lte.measureIdle(seconds + 0.1, 17, -90);
        lte.measureNeighbours(seconds + 0.2, {{18, seconds < 1 ? -92 : -84}});
    }
    // 10.1 s after the report of second 1, and 9.2 s after the next of the serving cell.
    lte.measureIdle(11.3, 18, -84);
    EXPECT_DOUBLE_EQ(numberOf(lte.only("late-reselection"), "duration"), 10.1);
}

TEST(Reselections, ByTheNetworkAreNotJudged) {
    LTEEngine lte;
    measure(lte, 20, -60);
    lte.measureConnected(20.2, 17);
    lte.measureConnected(20.5, 18);
    EXPECT_EQ(lte.linesOf("handover").size(), 1U);
    EXPECT_THAT(lte.linesOf("late-reselection"), IsEmpty());
}

} // namespace
} // namespace velmora
