// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Analysis/Events/HandMade.h"

#include <gmock/gmock.h>

namespace velmora {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

constexpr std::string_view rrState = "/GSM/GSM RR Info/RR State";
constexpr std::string_view mmState = "/Registration/Process CS/MM State";
constexpr std::string_view mmSubState = "/Registration/Process CS/MM Sub State";
constexpr std::string_view mmStatus = "/Registration/Process CS/LU Reject Cause";
constexpr std::string_view gmmState = "/Registration/Process PS/MM State";
constexpr std::string_view gmmStatus = "/Registration/Process PS/Attach Reject Cause";
constexpr std::string_view serviceType = "/Registration/Serving PLMN/Service Type";
constexpr std::string_view registration = "/Registration/Process CS/MM Service State";
constexpr std::string_view gsmCell = "/GSM/GSM Serving Cell/Cell ID";

class States : public testing::Test {
protected:
    HandMadeEngine gsm{"Ostrel_GSM", {{gsmCell, Role::ServingCell}}};

    void mm(double seconds, std::int64_t state, std::string_view text, std::int64_t status = 0) {
        gsm.send(gsm.at(seconds)
                     .state(mmState, state, text)
                     .state(mmSubState, 8, "NORMAL")
                     .state(mmStatus, status, status == 0 ? "UPDATED" : "NOT_ALLOWED"));
    }
    void rr(double seconds, std::int64_t state, std::string_view text) {
        gsm.send(gsm.at(seconds).state(rrState, state, text));
    }
};

TEST_F(States, AreReportedWithTheTimeInTheOldOneWhereItsBeginningWasSeen) {
    rr(0, 5, "RR_IDLE");
    rr(1, 5, "RR_IDLE");
    rr(2, 6, "RR_CELL_RESELECTION");
    rr(2.5, 5, "RR_IDLE");
    EXPECT_THAT(gsm.lines(), ElementsAre("2.000 radio-state: RR: RR_IDLE to RR_CELL_RESELECTION",
                                         "2.500 radio-state: RR: RR_CELL_RESELECTION to RR_IDLE"));
    EXPECT_EQ(gsm.kept.events[0].field("duration"), nullptr);
    EXPECT_EQ(numberOf(gsm.kept.events[1], "duration"), 0.5);
    EXPECT_EQ(textOf(gsm.kept.events[1], "machine"), "RR");
    EXPECT_EQ(textOf(gsm.kept.events[1], "from"), "RR_CELL_RESELECTION");
    EXPECT_EQ(gsm.kept.events[1].technology, "Ostrel_GSM");
    EXPECT_EQ(gsm.kept.events[1].severity, Severity::Info);
}

TEST_F(States, OfMobilityHaveTheirSubState) {
    gsm.send(gsm.at(0).state(mmState, 19, "MM_IDLE").state(mmSubState, 8, "NORMAL"));
    gsm.send(gsm.at(1).state(mmState, 19, "MM_IDLE").state(mmSubState, 5, "NEEDED"));
    EXPECT_THAT(gsm.lines(), ElementsAre("1.000 mobility-state: MM: MM_IDLE, NORMAL to MM_IDLE, NEEDED"));
}

TEST_F(States, AreFirstSeenAgainAfterAGapOrWhenTheyWereWithdrawn) {
    rr(0, 5, "RR_IDLE");
    rr(31, 6, "RR_CELL_RESELECTION");
    EXPECT_THAT(gsm.linesOf("radio-state"), IsEmpty());
    gsm.send(gsm.at(32).absent(rrState));
    rr(33, 5, "RR_IDLE");
    EXPECT_THAT(gsm.linesOf("radio-state"), IsEmpty());
}

TEST_F(States, OfLTEAreTheMode) {
    LTEEngine lte;
    lte.measureIdle(0, 17, -90);
    lte.measureConnected(1, 17);
    lte.measureConnected(2, 17);
    lte.measureIdle(4, 17, -90);
    EXPECT_THAT(lte.linesOf("radio-state"),
                ElementsAre("1.000 RRC: idle to connected", "4.000 RRC: connected to idle"));
    EXPECT_EQ(numberOf(lte.kept.events[1], "duration"), 3);
}

TEST_F(States, OfLTEHaveNoDurationAfterATimeWithoutMeasurements) {
    LTEEngine lte;
    lte.measureIdle(0, 17, -90);
    lte.measureConnected(1, 17);
    lte.serve(6.5, 17); // the mode is not known any more
    lte.measureIdle(8, 17, -90);
    ASSERT_EQ(lte.kept.events.size(), 2U);
    EXPECT_EQ(lte.kept.events[1].field("duration"), nullptr);
}

TEST_F(States, OfServiceLastUntilAnotherIsStated) {
    gsm.send(gsm.at(0).state(serviceType, 4));
    ASSERT_EQ(gsm.kept.begun.size(), 1U);
    EXPECT_EQ(gsm.kept.begun[0].kind, "limited-service");
    gsm.send(gsm.at(2).state(serviceType, 4));
    EXPECT_THAT(gsm.lines(), IsEmpty());
    gsm.send(gsm.at(5).state(serviceType, 0));
    gsm.send(gsm.at(9).state(serviceType, 3));
    EXPECT_THAT(gsm.lines(), ElementsAre("0.000 limited-service: emergency calls alone",
                                         "5.000 out-of-service: no service"));
    EXPECT_EQ(gsm.kept.events[0].end, gsm.at(5).time());
    EXPECT_EQ(numberOf(gsm.kept.events[1], "duration"), 4);
    EXPECT_EQ(gsm.kept.events[1].severity, Severity::Critical);
    EXPECT_TRUE(gsm.kept.events[1].lasts);
}

TEST_F(States, OfServiceEndWithThePhone) {
    gsm.send(gsm.at(0).state(serviceType, 0));
    gsm.send(gsm.at(3).state(registration, 6, "REG_STATE_OFFLINE"));
    EXPECT_EQ(gsm.only("out-of-service").end, gsm.at(3).time());
}

TEST_F(States, OfServiceHaveNoEndWhereTheInputEndsOrIsInterrupted) {
    gsm.send(gsm.at(0).state(serviceType, 0));
    gsm.send(gsm.at(40).state(serviceType, 0));
    gsm.engine.finish();
    EXPECT_THAT(gsm.lines(),
                ElementsAre("0.000 out-of-service: no service", "0.000 gap: no message for 40.000 s",
                            "40.000 out-of-service: no service"));
    EXPECT_EQ(gsm.kept.events[0].end, std::nullopt);
    EXPECT_EQ(gsm.kept.events[2].end, std::nullopt);
}

TEST_F(States, OfAnUpdateShowItsOutcome) {
    mm(0, 19, "MM_IDLE");
    mm(1, 3, "UPDATING", 1);
    mm(2.5, 9, "WAIT");
    EXPECT_THAT(gsm.linesOf("area-update"), ElementsAre("2.500 location area update: accepted"));
    EXPECT_EQ(numberOf(gsm.only("area-update"), "duration"), 1.5);
    EXPECT_EQ(textOf(gsm.only("area-update"), "type"), "location");
    EXPECT_THAT(gsm.only("area-update").evidence, ElementsAre(MessageNumber{0, 2}, MessageNumber{0, 3}));
}

TEST_F(States, OfAnUpdateThatIsRejectedShowTheStatus) {
    mm(0, 19, "MM_IDLE");
    mm(1, 3, "UPDATING", 1);
    mm(2, 10, "REJECTED", 3);
    const Event& event = gsm.only("area-update");
    EXPECT_EQ(textOf(event, "outcome"), "rejected");
    EXPECT_EQ(textOf(event, "cause"), "NOT_ALLOWED");
    EXPECT_EQ(event.severity, Severity::Warning);
}

TEST_F(States, OfAnUpdateThatSayNothingMakeItsOutcomeUnknown) {
    gsm.send(gsm.at(0).state(gmmState, 5).state(gmmStatus, 1)); // its beginning was not seen
    gsm.send(gsm.at(1).state(gmmState, 1).state(gmmStatus, 1));
    const Event& event = gsm.only("area-update");
    EXPECT_EQ(textOf(event, "type"), "routing");
    EXPECT_EQ(textOf(event, "outcome"), "unknown");
    EXPECT_EQ(event.field("duration"), nullptr);
    EXPECT_EQ(event.severity, Severity::Info);
}

TEST_F(States, OfAConnectionAreACall) {
    mm(0, 19, "MM_IDLE");
    mm(1, 6, "ACTIVE");
    mm(11, 9, "WAIT");
    EXPECT_THAT(gsm.linesOf("call-setup"), ElementsAre("1.000 connection active"));
    EXPECT_THAT(gsm.linesOf("call-end"), ElementsAre("11.000 connection ended"));
    EXPECT_EQ(numberOf(gsm.only("call-end"), "duration"), 10);
    EXPECT_THAT(gsm.linesOf("call-lost"), IsEmpty());
}

TEST_F(States, OfAConnectionThatWasActiveAtTheBeginningAreNoSetup) {
    mm(0, 6, "ACTIVE");
    mm(1, 9, "WAIT");
    EXPECT_THAT(gsm.linesOf("call-setup"), IsEmpty());
    EXPECT_EQ(gsm.only("call-end").field("duration"), nullptr);
}

TEST_F(States, OfReestablishmentThatFailsAreALostCall) {
    mm(0, 19, "MM_IDLE");
    mm(1, 6, "ACTIVE");
    mm(5, 21, "WAIT_REESTABLISHMENT");
    mm(5.5, 17, "REESTABLISHMENT");
    mm(8, 19, "MM_IDLE");
    EXPECT_THAT(gsm.linesOf("re-establishment").size(), 1U);
    EXPECT_THAT(gsm.linesOf("call-lost"), ElementsAre("8.000 connection lost"));
    EXPECT_EQ(numberOf(gsm.only("call-lost"), "duration"), 7);
    EXPECT_EQ(gsm.only("call-lost").severity, Severity::Critical);
    EXPECT_THAT(gsm.linesOf("call-end"), IsEmpty());
}

TEST_F(States, OfReestablishmentThatSucceedsLoseNoCall) {
    mm(0, 19, "MM_IDLE");
    mm(1, 6, "ACTIVE");
    mm(5, 17, "REESTABLISHMENT");
    mm(6, 6, "ACTIVE");
    mm(9, 9, "WAIT");
    EXPECT_THAT(gsm.linesOf("call-lost"), IsEmpty());
    EXPECT_EQ(numberOf(gsm.only("call-end"), "duration"), 8);
}

TEST_F(States, OfAPhoneThatSearchesDuringACallAreALostCall) {
    gsm.send(gsm.at(0).number(gsmCell, 7));
    rr(0.1, 9, "RR_DATA_TRANSFER");
    mm(0.2, 19, "MM_IDLE");
    mm(1, 6, "ACTIVE");
    rr(4, 3, "RR_CELL_SELECTION");
    mm(5, 19, "MM_IDLE");
    EXPECT_EQ(gsm.linesOf("call-lost").size(), 1U);
}

} // namespace
} // namespace velmora
