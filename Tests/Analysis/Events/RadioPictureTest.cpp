// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Analysis/Events/HandMade.h"

#include <gmock/gmock.h>

namespace velmora {
namespace {

using testing::IsEmpty;

constexpr std::string_view gsmCell = "/GSM/GSM Serving Cell/Cell ID";
constexpr std::string_view gsmChannel = "/GSM/GSM Serving Cell/ARFCN";
constexpr std::string_view gsmLevel = "/GSM/GSM Serving Cell/RSSI";
constexpr std::string_view rrState = "/GSM/GSM RR Info/RR State";
constexpr std::string_view umtsChannel = "/UMTS/UMTS RR Info/Downlink Frequency";
constexpr std::string_view rrcState = "/UMTS/UMTS RR Info/RRC State";
constexpr std::string_view activeSet = "/UMTS/Active Set";
constexpr std::string_view activePSC = "/UMTS/Active Set/*/Scrambling Code";
constexpr std::string_view activeRSCP = "/UMTS/Active Set/*/RSCP";
constexpr std::string_view registration = "/Registration/Process CS/MM Service State";
constexpr std::string_view area = "/Registration/Serving PLMN/Location Area Code";

class GSMPicture : public testing::Test {
protected:
    HandMadeEngine gsm{"Ostrel_GSM",
                       {{gsmCell, Role::ServingCell},
                        {gsmChannel, Role::ServingChannel},
                        {gsmLevel, Role::ServingLevel},
                        {rrState, Role::RadioState},
                        {umtsChannel, Role::ServingChannel},
                        {rrcState, Role::RadioState},
                        {activePSC, Role::ServingPhysicalCell},
                        {activeRSCP, Role::ServingLevel},
                        {registration, Role::RegistrationState},
                        {area, Role::ServingArea}}};
    const RadioPicture& picture = gsm.picture();

    [[nodiscard]] double level() const { return picture.find(Role::ServingLevel)->number; }
};

TEST_F(GSMPicture, HasTheValuesOfTheServingCellsTechnology) {
    gsm.send(gsm.at(0).number(gsmCell, 7).number(gsmChannel, 33));
    gsm.send(gsm.at(0.1).number(gsmLevel, -71));
    EXPECT_EQ(picture.technology(), RadioTechnology::GSM);
    EXPECT_EQ(level(), -71);
    gsm.send(gsm.at(1).number(umtsChannel, 10588));
    EXPECT_EQ(picture.technology(), RadioTechnology::UMTS);
    EXPECT_EQ(picture.find(Role::ServingLevel), nullptr);
    gsm.send(gsm.at(1.1).list(activeSet, 1).row(0).number(activePSC, 205).number(activeRSCP, -80));
    EXPECT_EQ(level(), -80);
    EXPECT_EQ(picture.find(Role::ServingLevel, RadioTechnology::GSM),
              nullptr); // it was of the cell that it left
}

TEST_F(GSMPicture, ForgetsWhatWasOfTheEarlierCell) {
    gsm.send(gsm.at(0).number(gsmCell, 7).number(gsmChannel, 33));
    gsm.send(gsm.at(0.1).number(gsmLevel, -71));
    gsm.send(gsm.at(0.2).number(area, 4101));
    gsm.send(gsm.at(1).number(gsmCell, 8));
    EXPECT_EQ(picture.find(Role::ServingLevel), nullptr);
    EXPECT_EQ(picture.find(Role::ServingChannel), nullptr);
    EXPECT_EQ(picture.find(Role::ServingArea), nullptr);
    EXPECT_EQ(picture.find(Role::ServingCell)->number, 8);
}

TEST_F(GSMPicture, KeepsSinceWhenAValueHasBeenTheSame) {
    gsm.send(gsm.at(0).number(gsmCell, 7).number(gsmLevel, -71));
    gsm.send(gsm.at(1).number(gsmLevel, -71));
    const Reading& reading = *picture.find(Role::ServingLevel);
    EXPECT_EQ(reading.since, gsm.at(0).time());
    EXPECT_EQ(reading.time, gsm.at(1).time());
    EXPECT_EQ(reading.message, (MessageNumber{0, 2}));
    gsm.send(gsm.at(2).number(gsmLevel, -72));
    EXPECT_EQ(picture.find(Role::ServingLevel)->since, gsm.at(2).time());
}

TEST_F(GSMPicture, KeepsTheServingCellOfAnActiveSetWhileItIsAMember) {
    gsm.send(gsm.at(0).number(umtsChannel, 10588));
    gsm.send(gsm.at(1).list(activeSet, 1).row(0).number(activePSC, 1).number(activeRSCP, -80));
    gsm.send(gsm.at(2)
                 .list(activeSet, 2)
                 .row(0)
                 .number(activePSC, 2)
                 .number(activeRSCP, -70)
                 .row(1)
                 .number(activePSC, 1)
                 .number(activeRSCP, -81));
    EXPECT_EQ(level(), -81);
    EXPECT_EQ(picture.servingChange(), nullptr);
    gsm.send(gsm.at(3).list(activeSet, 1).row(0).number(activePSC, 2).number(activeRSCP, -70));
    EXPECT_NE(picture.servingChange(), nullptr);
    EXPECT_EQ(level(), -70);
}

TEST_F(GSMPicture, ForgetsTheCellsOfAnActiveSetThatIsEmpty) {
    gsm.send(gsm.at(0).number(umtsChannel, 10588));
    gsm.send(gsm.at(1).list(activeSet, 1).row(0).number(activePSC, 1).number(activeRSCP, -80));
    gsm.send(gsm.at(2).list(activeSet, 0));
    EXPECT_EQ(picture.find(Role::ServingLevel), nullptr);
    EXPECT_EQ(picture.find(Role::ServingChannel)->number, 10588);
}

TEST_F(GSMPicture, HasTheModeOfTheTechnologyInUse) {
    EXPECT_EQ(picture.mode(), std::nullopt);
    gsm.send(gsm.at(0).state(rrState, 4)); // looks for networks
    gsm.send(gsm.at(0.1).state(rrcState, 0));
    EXPECT_EQ(picture.mode(), RadioMode::Searching);
    gsm.send(gsm.at(1).number(gsmCell, 7));
    gsm.send(gsm.at(1.1).state(rrState, 5));
    EXPECT_EQ(picture.mode(), RadioMode::Idle);
    gsm.send(gsm.at(2).state(rrState, 9));
    EXPECT_EQ(picture.mode(), RadioMode::Connected);
    gsm.send(gsm.at(3).number(umtsChannel, 10588));
    EXPECT_EQ(picture.mode(), std::nullopt); // the state of RRC is of the time before
    gsm.send(gsm.at(3.1).state(rrcState, 3));
    EXPECT_EQ(picture.mode(), RadioMode::Connected);
}

TEST_F(GSMPicture, HasNoServingCellWhileThePhoneIsOff) {
    gsm.send(gsm.at(0).number(gsmCell, 7).number(gsmLevel, -71));
    gsm.send(gsm.at(1).state(registration, 6));
    EXPECT_EQ(picture.mode(), RadioMode::Off);
    EXPECT_EQ(picture.technology(), std::nullopt);
    EXPECT_EQ(picture.find(Role::ServingLevel), nullptr);
    EXPECT_NE(picture.find(Role::RegistrationState), nullptr);
}

TEST_F(GSMPicture, ForgetsWithdrawnValues) {
    gsm.send(gsm.at(0).number(gsmCell, 7).number(gsmChannel, 33).number(gsmLevel, -71));
    gsm.send(gsm.at(1).absent(gsmLevel));
    EXPECT_EQ(picture.find(Role::ServingLevel), nullptr);
    gsm.send(gsm.at(2).removed(gsmChannel));
    EXPECT_EQ(picture.find(Role::ServingChannel), nullptr);
    EXPECT_NE(picture.find(Role::ServingCell), nullptr);
}

TEST_F(GSMPicture, IsNotChangedByADamagedMessage) {
    gsm.send(gsm.at(0).number(gsmCell, 7));
    gsm.send(gsm.at(1).number(gsmCell, 8).damaged(Damage::MissingEntries, 0x5134));
    EXPECT_EQ(picture.find(Role::ServingCell)->number, 7);
}

TEST_F(GSMPicture, IsEmptyAfterItWasCleared) {
    gsm.send(gsm.at(0).number(gsmCell, 7).state(rrState, 5).state(registration, 1));
    gsm.send(gsm.at(31));
    EXPECT_EQ(picture.find(Role::ServingCell), nullptr);
    EXPECT_EQ(picture.find(Role::RegistrationState), nullptr);
    EXPECT_EQ(picture.mode(), std::nullopt);
    EXPECT_EQ(picture.technology(), std::nullopt);
}

TEST(LTENeighbours, AreReplacedCarrierByCarrier) {
    LTEEngine lte;
    lte.measureIdle(0, 17, -90);
    lte.measureNeighbours(0.1, {{20, -95}, {21, -80}});
    lte.measureNeighbours(0.2, {{30, -70}}, 6300);
    const auto cells = lte.picture().neighbours();
    ASSERT_EQ(cells.size(), 3U);
    EXPECT_EQ(cells[0].physicalCell, 30);
    EXPECT_EQ(cells[0].channel, 6300);
    EXPECT_EQ(cells[0].technology, RadioTechnology::LTE);
    EXPECT_EQ(cells[1].physicalCell, 21);
    EXPECT_EQ(cells[2].level_dBm, -95);
    EXPECT_EQ(lte.picture().find(Role::NeighbourLevel)->number, -70);
    lte.measureNeighbours(0.3, {{22, -99}});
    ASSERT_EQ(lte.picture().neighbours().size(), 2U);
    EXPECT_EQ(lte.picture().neighbours()[1].physicalCell, 22);
}

TEST(LTENeighbours, WithoutALevelAreLastAndMayBeDetected) {
    LTEEngine lte;
    lte.measureNeighbours(0, {{21, -110}}, 6300);
    lte.send(lte.at(0.1)
                 .number(connectedEARFCN, 1300)
                 .number(connectedPCI, 17)
                 .list(detectedList, 1)
                 .row(0)
                 .number(detectedPCI, 40));
    const auto cells = lte.picture().neighbours();
    ASSERT_EQ(cells.size(), 2U);
    EXPECT_EQ(cells[0].physicalCell, 21);
    EXPECT_FALSE(cells[0].isDetected);
    EXPECT_EQ(cells[1].physicalCell, 40);
    EXPECT_EQ(cells[1].channel, 1300);
    EXPECT_TRUE(cells[1].isDetected);
}

TEST(LTENeighbours, OfACarrierAreThoseOfItsLatestReportInEitherMode) {
    LTEEngine lte;
    lte.measureNeighbours(0, {{20, -95}, {21, -80}});
    lte.measureNeighbours(0.1, {{30, -70}}, 6300);
    lte.send(lte.at(0.2)
                 .number(connectedEARFCN, 1300)
                 .number(connectedPCI, 17)
                 .list(detectedList, 1)
                 .row(0)
                 .number(detectedPCI, 21));
    const auto cells = lte.picture().neighbours();
    ASSERT_EQ(cells.size(), 2U);
    EXPECT_EQ(cells[0].physicalCell, 30);
    EXPECT_EQ(cells[1].physicalCell, 21);
    EXPECT_TRUE(cells[1].isDetected);
}

TEST(LTENeighbours, AreListedOnceWhereAReportHasThemTwice) {
    LTEEngine lte;
    lte.measureNeighbours(0, {{20, -95}, {21, -80}, {20, -94}});
    const auto cells = lte.picture().neighbours();
    ASSERT_EQ(cells.size(), 2U);
    EXPECT_EQ(cells[0].physicalCell, 21);
    EXPECT_EQ(cells[1].physicalCell, 20);
    EXPECT_EQ(cells[1].level_dBm, -94);
}

TEST(LTENeighbours, AreForgottenWithTheServingCellAndAfterTenSeconds) {
    LTEEngine lte;
    lte.serve(0, 17);
    lte.measureNeighbours(0, {{21, -80}});
    lte.serve(4, 18);
    EXPECT_THAT(lte.picture().neighbours(), IsEmpty());
    lte.measureNeighbours(5, {{21, -80}});
    lte.serve(15, 18);
    EXPECT_EQ(lte.picture().neighbours().size(), 1U);
    lte.serve(15.1, 18);
    EXPECT_THAT(lte.picture().neighbours(), IsEmpty());
}

} // namespace
} // namespace velmora
