// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Model/ModelFixture.h"

#include <chrono>
#include <vector>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::IsEmpty;
using Kind = ConnectionProblem::Kind;

/// Which changes of the connection the observer gets, and when.
class VelmoraModelConnectionTest : public ModelFixture {
protected:
    void connectionChanged() override {
        changes.push_back(model->isConnected() ? "connected" : model->problem().cause);
        exchangesAtChange.push_back(telephony.connectionsAsked());
    }
    void fail(std::int32_t status) {
        getTechnology = [status](const Data&) { return RemotePort::Answer{status, std::nullopt}; };
    }

    std::vector<std::string> changes;
    std::vector<int> exchangesAtChange;
};

TEST_F(VelmoraModelConnectionTest, AConnectionAndItsLossAreReportedOnceEach) {
    model->restartMonitor();
    EXPECT_THAT(changes, ElementsAre("connected"));
    queue.advance(20s); // quiet ticks
    EXPECT_THAT(changes, ElementsAre("connected"));
    telephony.available = false;
    ports.sever(channelName);
    queue.advance(1999ms);
    EXPECT_THAT(changes, ElementsAre("connected"));
    queue.advance(1ms);
    EXPECT_THAT(changes, ElementsAre("connected", "the connection to the telephony service is lost",
                                     "no telephony service answers"));
    EXPECT_EQ(redraws, 0);
    // Attempts that fail for the same reason are no change.
    queue.advance(30s);
    EXPECT_EQ(changes.size(), 3u);
    telephony.available = true;
    queue.advance(5s);
    EXPECT_EQ(changes.size(), 4u);
    EXPECT_EQ(changes.back(), "connected");
    EXPECT_EQ(model->problem(), ConnectionProblem());
}

TEST_F(VelmoraModelConnectionTest, TheLossIsReportedBeforeTheNextExchange) {
    model->restartMonitor();
    ports.sever(channelName);
    queue.advance(2s);
    EXPECT_THAT(changes,
                ElementsAre("connected", "the connection to the telephony service is lost", "connected"));
    EXPECT_THAT(exchangesAtChange, ElementsAre(1, 1, 2));
}

TEST_F(VelmoraModelConnectionTest, AttemptsThatFailHaveTheirCause) {
    auto other = ports.createLocal(localName, [](auto&&...) { return std::nullopt; });
    model->restartMonitor();
    EXPECT_EQ(model->problem().kind, Kind::PortInUse);
    other.port.reset();
    ports.failNextLocal();
    queue.advance(5s);
    EXPECT_EQ(model->problem().kind, Kind::Port);
    telephony.available = false;
    queue.advance(5s);
    EXPECT_EQ(model->problem().kind, Kind::NoService);
    telephony.available = true;
    telephony.error = {2, 3};
    queue.advance(5s);
    EXPECT_EQ(model->problem().kind, Kind::NoChannel);
    telephony.error = {};
    ports.stopServing(channelName);
    queue.advance(5s);
    EXPECT_EQ(model->problem().kind, Kind::ChannelGone);
    EXPECT_THAT(changes,
                ElementsAre("this program's port is in use", "this program's port cannot be opened",
                            "no telephony service answers", "the telephony service opens no log channel",
                            "the telephony service's log channel is not there"));
}

TEST_F(VelmoraModelConnectionTest, ADirectoryThatCannotBeUsedIsTheCauseInItsOwnWords) {
    ports.failNextLocal("port directory /p has mode 0777, wanted 0700");
    model->restartMonitor();
    EXPECT_EQ(model->problem(),
              (ConnectionProblem{Kind::Port, "port directory /p has mode 0777, wanted 0700"}));
}

TEST_F(VelmoraModelConnectionTest, AServiceThatNamesNoTechnologyIsOneProblem) {
    fail(PortStatus::ReceiveTimeout);
    model->restartMonitor();
    EXPECT_THAT(changes, ElementsAre("the telephony service does not name its technology"));
    EXPECT_EQ(model->problem().kind, Kind::NoTechnology);
    EXPECT_EQ(model->technology(), "");
}

TEST_F(VelmoraModelConnectionTest, WithTheEarlierDecoderItIsAProblemOfAConnectedModel) {
    model->restartMonitor();
    fail(PortStatus::ReceiveTimeout);
    model->restartMonitor();
    EXPECT_TRUE(model->isConnected());
    EXPECT_EQ(model->problem().kind, Kind::NoTechnology);
    EXPECT_EQ(model->technology(), kVoxLogChannelTechnology_Ostrel_GSM);
}

TEST_F(VelmoraModelConnectionTest, ATechnologyWithoutADecoderIsNamed) {
    getTechnology = [](const Data&) { return answers("kVoxLogChannelTechnology_Ostrel_NR"); };
    model->restartMonitor();
    EXPECT_EQ(model->problem().kind, Kind::NoDecoder);
    EXPECT_EQ(model->problem().cause.find("the telephony service's technology Ostrel_NR has no decoder here, "
                                          "wanted one of IFX, Ostrel_GSM"),
              0u);
}

TEST_F(VelmoraModelConnectionTest, AStartCommandThatIsNotTakenIsAProblem) {
    startCommand = [](const Data&) { return RemotePort::Answer{PortStatus::SendTimeout, std::nullopt}; };
    model->restartMonitor();
    EXPECT_THAT(changes, ElementsAre("the telephony service does not take the start command"));
}

/// What of the state each technology's display is.
class DisplayTechnologyTest : public ModelFixture {
protected:
    void connectTo(std::string_view technology) {
        getTechnology = [technology](const Data&) { return answers(technology); };
        model->restartMonitor();
        ASSERT_TRUE(model->isConnected());
    }
    void receive(const Data& message) {
        deliver(message);
        static_cast<void>(model->topLevelNodes());
    }
    static Data display(const char* band) {
        const DictionaryRef shown = makeDictionary();
        shown->set("Band", band);
        return list(shown);
    }
};

TEST_F(DisplayTechnologyTest, ThereIsNoneBeforeADisplay) {
    EXPECT_EQ(model->technology(), "");
    connectTo(kVoxLogChannelTechnology_Ostrel_GSM);
    EXPECT_EQ(model->technology(), kVoxLogChannelTechnology_Ostrel_GSM);
    EXPECT_EQ(model->displayTechnology(), "");
    connectTo(kVoxLogChannelTechnology_Ostrel_LTE);
    EXPECT_EQ(model->displayTechnology(), "");
}

TEST_F(DisplayTechnologyTest, ADecoderWithATemplateWritesIntoTheDisplayThatIsThere) {
    connectTo(kVoxLogChannelTechnology_Ostrel_GSM);
    receive(idleRecord());
    EXPECT_EQ(model->displayTechnology(), kVoxLogChannelTechnology_Ostrel_GSM);
    connectTo(kVoxLogChannelTechnology_Ostrel_LTE);
    receive(idleRecord());
    EXPECT_EQ(model->technology(), kVoxLogChannelTechnology_Ostrel_LTE);
    EXPECT_EQ(model->displayTechnology(), kVoxLogChannelTechnology_Ostrel_GSM);
    // And a third time.
    connectTo(kVoxLogChannelTechnology_Ostrel_CDMA);
    EXPECT_EQ(model->displayTechnology(), kVoxLogChannelTechnology_Ostrel_GSM);
    connectTo(kVoxLogChannelTechnology_Ostrel_GSM);
    EXPECT_EQ(model->displayTechnology(), model->technology());
}

TEST_F(DisplayTechnologyTest, ADecoderOfWholeDisplaysReplacesItWithTheFirstMessage) {
    connectTo(kVoxLogChannelTechnology_Ostrel_GSM);
    receive(idleRecord());
    connectTo(kVoxLogChannelTechnology_IFX);
    EXPECT_EQ(model->displayTechnology(), kVoxLogChannelTechnology_Ostrel_GSM);
    receive(display("GSM 900"));
    EXPECT_EQ(model->displayTechnology(), kVoxLogChannelTechnology_IFX);
    connectTo(kVoxLogChannelTechnology_Ostrel_LTE);
    receive(idleRecord());
    EXPECT_EQ(model->displayTechnology(), kVoxLogChannelTechnology_IFX);
}

TEST_F(DisplayTechnologyTest, AReconnectionToTheSameTechnologyChangesNothing) {
    connectTo(kVoxLogChannelTechnology_Ostrel_GSM);
    receive(idleRecord());
    connectTo(kVoxLogChannelTechnology_Ostrel_GSM);
    receive(idleRecord());
    EXPECT_EQ(model->displayTechnology(), kVoxLogChannelTechnology_Ostrel_GSM);
}

} // namespace
} // namespace velmora
