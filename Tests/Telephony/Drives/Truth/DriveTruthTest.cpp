// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/ScenarioRegistry.h"
#include "Tests/Telephony/Drives/Truth/KeptTruth.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

/// The truth of the drives, worked out from the rounds of Documentation/scenarios.md. Times are those of the
/// document, and a few seconds later: a phase ends with a measurement, and not before its procedure.

namespace velmora {
namespace {

using testing::AllOf;
using testing::ElementsAre;
using testing::Ge;
using testing::Le;

constexpr double delay_s = 8;

/// The fields of those events, each joined.
std::vector<std::string> fieldsOf(const std::vector<TruthEvent>& events, std::vector<const char*> names) {
    std::vector<std::string> texts;
    for (const TruthEvent& event : events) {
        std::string text;
        for (const char* name : names)
            text += (text.empty() ? "" : " to ") + fieldOf(event, name);
        texts.push_back(text);
    }
    return texts;
}

std::vector<double> timesOf(const std::vector<TruthEvent>& events) {
    std::vector<double> times;
    for (const TruthEvent& event : events)
        times.push_back(secondsOf(event.at));
    return times;
}

testing::Matcher<double> soonAfter(double time_s) {
    return AllOf(Ge(time_s), Le(time_s + delay_s));
}

class DriveTruthTest : public testing::TestWithParam<const char*> {};

TEST_P(DriveTruthTest, theTruthChangesNoMessage) {
    const auto plain = scenarioKindNamed(GetParam())->make(3);
    const auto told = scenarioKindNamed(GetParam())->make(3);
    KeptTruth truth;
    told->tellTruth(truth);
    for (int i = 0; i < 20000; ++i) {
        const ScenarioEvent expected = plain->next();
        const ScenarioEvent event = told->next();
        ASSERT_EQ(event.offset, expected.offset) << "message " << i;
        ASSERT_EQ(event.message, expected.message) << "message " << i;
    }
    EXPECT_GT(truth.events.size(), 100U);
}

INSTANTIATE_TEST_SUITE_P(Drives, DriveTruthTest,
                         testing::Values("gsm", "c2k", "lte", "utran", "ifx", "modem"),
                         [](const auto& scenario) { return std::string(scenario.param); });

TEST(GSMTruthTest, theCallIsHandedOverToUMTS) {
    const KeptTruth truth = truthOf("gsm", 1, 360);
    EXPECT_THAT(timesOf(truth.of("call-setup")), ElementsAre(soonAfter(131)));
    EXPECT_THAT(timesOf(truth.of("call-end")), ElementsAre(soonAfter(176)));
    EXPECT_THAT(fieldsOf(truth.of("technology-change"), {"from.radio", "to.radio"}),
                ElementsAre("GSM to UMTS", "UMTS to GSM", "GSM to UMTS", "UMTS to GSM"));
    EXPECT_THAT(timesOf(truth.of("technology-change")),
                ElementsAre(soonAfter(156), soonAfter(291), soonAfter(311), soonAfter(331)));
    bool isHandover = false;
    for (const TruthEvent& event : truth.of("handover"))
        isHandover |= event.at == truth.of("technology-change").front().at;
    EXPECT_TRUE(isHandover);
}

TEST(GSMTruthTest, contextsComeAndGoWithTheSessions) {
    const KeptTruth truth = truthOf("gsm", 2, 360);
    EXPECT_THAT(fieldsOf(truth.of("context-up"), {"context"}), ElementsAre("1", "1", "2"));
    EXPECT_THAT(timesOf(truth.of("context-up")), ElementsAre(soonAfter(61), soonAfter(206), soonAfter(206)));
    EXPECT_THAT(timesOf(truth.of("context-down")),
                ElementsAre(soonAfter(101), soonAfter(271), soonAfter(271)));
}

TEST(GSMTruthTest, mobilityManagementAttachesInProtocolOrder) {
    const KeptTruth truth = truthOf("gsm", 3, 15.5);
    EXPECT_THAT(fieldsOf(truth.of("mobility-state"), {"machine", "to"}),
                ElementsAre("MM to idle, PLMN search", "GMM to deregistered, PLMN search",
                            "MM to idle, location update needed", "GMM to deregistered, attach needed",
                            "MM to wait for RR connection LU, attempting to update",
                            "MM to location update initiated, attempting to update",
                            "MM to wait for network command, normal service", "MM to idle, normal service",
                            "GMM to registered initiated, attempting to attach",
                            "GMM to registered, normal service"));
    EXPECT_THAT(fieldsOf(truth.of("area-update"), {"type"}), ElementsAre("location"));
}

TEST(LTETruthTest, thePhoneWalksOverAllCarriers) {
    const KeptTruth truth = truthOf("lte", 1, 147);
    std::vector<std::string> carriers;
    std::vector<TruthEvent> changes;
    for (const TruthEvent& event : truth.of("cell-reselection"))
        if (fieldOf(event, "from.channel") != fieldOf(event, "to.channel")) {
            carriers.push_back(fieldOf(event, "to.channel"));
            changes.push_back(event);
        }
    EXPECT_THAT(carriers, ElementsAre("3175", "6300", "9310", "3625", "2410", "1300"));
    EXPECT_THAT(timesOf(changes), ElementsAre(soonAfter(56), soonAfter(71), soonAfter(86), soonAfter(101),
                                              soonAfter(116), soonAfter(131)));
    // The registration's context at 0:07, its end at the power-off.
    EXPECT_THAT(timesOf(truth.of("context-up")).front(), soonAfter(7));
    EXPECT_THAT(timesOf(truth.of("context-down")).back(), soonAfter(141));
}

TEST(UTRANTruthTest, serviceIsLimitedUntilTheRegistration) {
    const KeptTruth truth = truthOf("utran", 1, 200);
    const std::vector<TruthEvent> limited = truth.of("limited-service");
    ASSERT_EQ(limited.size(), 1U);
    EXPECT_NEAR(secondsOf(limited[0].at), 5, 0.5);
    EXPECT_THAT(secondsOf(limited[0].end.value()), soonAfter(10));
    EXPECT_THAT(timesOf(truth.of("context-up")), ElementsAre(soonAfter(39), soonAfter(144), soonAfter(144)));
    EXPECT_THAT(timesOf(truth.of("context-down")),
                ElementsAre(soonAfter(79), soonAfter(184), soonAfter(184)));
}

TEST(C2KTruthTest, theSessionIsNegotiatedAndClosed) {
    const KeptTruth truth = truthOf("c2k", 1, 240);
    EXPECT_THAT(fieldsOf(truth.of("evdo-session"), {"to"}),
                ElementsAre("AMP setup", "AT-initiated", "Initiated", "Open", "Closed"));
    EXPECT_THAT(timesOf(truth.of("evdo-session")).back(), soonAfter(230));
    EXPECT_THAT(timesOf(truth.of("call-setup")), ElementsAre(soonAfter(115)));
    EXPECT_THAT(timesOf(truth.of("call-end")), ElementsAre(soonAfter(160)));
}

TEST(IFXTruthTest, theRoundIsExactToTheSecond) {
    const KeptTruth truth = truthOf("ifx", 1, 149);
    EXPECT_THAT(timesOf(truth.of("out-of-service")), ElementsAre(0));
    EXPECT_EQ(secondsOf(truth.of("out-of-service").front().end.value()), 6);
    EXPECT_THAT(timesOf(truth.of("limited-service")), ElementsAre(6));
    EXPECT_EQ(secondsOf(truth.of("limited-service").front().end.value()), 9);
    EXPECT_THAT(timesOf(truth.of("call-setup")), ElementsAre(42));
    EXPECT_THAT(timesOf(truth.of("call-end")), ElementsAre(72));
    EXPECT_THAT(timesOf(truth.of("context-up")), ElementsAre(82, 117, 117));
    EXPECT_THAT(timesOf(truth.of("context-down")), ElementsAre(107, 142, 142));
}

TEST(ModemTruthTest, theTechnologyAndTheSIMChange) {
    const KeptTruth truth = truthOf("modem", 1, 262);
    EXPECT_THAT(fieldsOf(truth.of("technology-change"), {"from.radio", "to.radio"}),
                ElementsAre("GSM to UMTS", "UMTS to LTE", "LTE to NR"));
    EXPECT_THAT(timesOf(truth.of("technology-change")),
                ElementsAre(soonAfter(63), soonAfter(89), soonAfter(155)));
    EXPECT_THAT(fieldsOf(truth.of("sim-change"), {"from", "to"}), ElementsAre("1 to 2", "2 to 1"));
    EXPECT_THAT(timesOf(truth.of("sim-change")), ElementsAre(soonAfter(218), soonAfter(249)));
    const std::vector<TruthEvent> limited = truth.of("limited-service");
    ASSERT_EQ(limited.size(), 1U);
    EXPECT_THAT(secondsOf(limited[0].at), soonAfter(208));
    EXPECT_THAT(secondsOf(limited[0].end.value()), soonAfter(218));
}

} // namespace
} // namespace velmora
