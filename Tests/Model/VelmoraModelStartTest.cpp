// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Model/ModelFixture.h"

#include <chrono>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::Contains;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::MatchesRegex;
using testing::UnorderedElementsAre;

using VelmoraModelStartTest = ModelFixture;

TEST_F(VelmoraModelStartTest, OpensNothingBeforeItIsStarted) {
    EXPECT_FALSE(model->isConnected());
    EXPECT_FALSE(ports.isTaken(localName));
    EXPECT_EQ(telephony.connectionsAsked(), 0);
    EXPECT_THAT(log.lines(), IsEmpty());
}

TEST_F(VelmoraModelStartTest, StartsWithEveryLineInItsPlace) {
    model->restartMonitor();
    EXPECT_TRUE(model->isConnected());
    EXPECT_EQ(queue.timerCount(), 1u);
    const auto lines = errors();
    ASSERT_EQ(lines.size(), 6u);
    EXPECT_THAT(lines[0],
                MatchesRegex(R"( \*\*\*\*\* Created ports \(send=0x[0-9a-f]+, recv=0x[0-9a-f]+\))"));
    EXPECT_EQ(lines[1], "Creating Ostrel_GSMLogGenerator object");
    EXPECT_THAT(lines[2], MatchesRegex("Creating OstrelLogGenerator2 object with 0x[0-9a-f]+"));
    EXPECT_EQ(lines[3], "Class Index: 1");
    EXPECT_THAT(lines[4], MatchesRegex("Got log generated: 0x[0-9a-f]+"));
    EXPECT_EQ(lines[5], "Starting the display update timer");
}

TEST_F(VelmoraModelStartTest, AsksForTheChannelByTheLocalPortsNameAndLetsTheConnectionGo) {
    model->restartMonitor();
    EXPECT_THAT(telephony.localPortNames(), ElementsAre(localName));
    EXPECT_EQ(telephony.liveConnections(), 0);
}

TEST_F(VelmoraModelStartTest, SendsGetTechnologyThenTheStartCommand) {
    model->restartMonitor();
    ASSERT_EQ(ports.sent().size(), 2u);

    const auto& question = ports.sent()[0];
    EXPECT_EQ(question.port, channelName);
    EXPECT_EQ(question.id, 0);
    EXPECT_TRUE(question.wantsReply);
    EXPECT_EQ(question.sendTimeout, 1s);
    EXPECT_EQ(question.receiveTimeout, 1s);
    const auto asked = readPropertyList(question.payload.bytes());
    ASSERT_TRUE(asked) << asked.reason();
    EXPECT_EQ(*asked, Value(std::make_shared<Dictionary>(
                          std::initializer_list<Dictionary::Entry>{{"GetTechnology", "GetTechnology"}})));

    const auto& start = ports.sent()[1];
    EXPECT_EQ(start.id, 0);
    EXPECT_FALSE(start.wantsReply);
    EXPECT_EQ(start.sendTimeout, 1s);
    EXPECT_EQ(start.receiveTimeout, 0s);
    const auto command = readPropertyList(start.payload.bytes());
    ASSERT_TRUE(command) << command.reason();
    EXPECT_EQ((*command->asDictionary())["SetState"], Value("Streaming"));
    std::vector<std::int64_t> extra;
    for (const Value& code : *(*command->asDictionary())["SetVoxExtraCodes"].asArray())
        extra.push_back(*code.asInteger());
    EXPECT_THAT(extra, UnorderedElementsAre(0, 1, 2));
}

TEST_F(VelmoraModelStartTest, SecondStartWhileTheTimerRunsDoesNothing) {
    model->restartMonitor();
    log.clear();
    ports.clearSent();
    model->startMonitor();
    EXPECT_THAT(log.lines(), IsEmpty());
    EXPECT_THAT(ports.sent(), IsEmpty());
    EXPECT_EQ(queue.timerCount(), 1u);
}

TEST_F(VelmoraModelStartTest, PortNameThatCannotBeBuiltFailsWithoutALineOfItsOwn) {
    portName = std::nullopt;
    EXPECT_FALSE(model->createPorts());
    EXPECT_THAT(log.lines(), IsEmpty());
    model->startMonitor();
    EXPECT_THAT(errors(), ElementsAre("Could not create the ports necessary"));
}

TEST_F(VelmoraModelStartTest, NoLocalPort) {
    ports.failNextLocal();
    model->restartMonitor();
    EXPECT_THAT(errors(),
                ElementsAre("Could not create local message port", "Could not create the ports necessary"));
    EXPECT_FALSE(model->isConnected());
}

TEST_F(VelmoraModelStartTest, NameThatIsTakenFailsAndIsTriedAgainAfterFiveSeconds) {
    auto other = ports.createLocal(localName, [](auto&&...) { return std::nullopt; });
    ASSERT_TRUE(other.port);
    model->restartMonitor();
    EXPECT_THAT(errors(),
                ElementsAre("Local messsage port already exists", "Could not create the ports necessary"));
    EXPECT_TRUE(ports.isTaken(localName)); // closing the handle leaves the owner's port alone

    other.port.reset();
    queue.advance(4999ms);
    EXPECT_FALSE(model->isConnected());
    queue.advance(1ms);
    EXPECT_TRUE(model->isConnected());
}

TEST_F(VelmoraModelStartTest, NoServerConnection) {
    telephony.available = false;
    model->restartMonitor();
    EXPECT_THAT(errors(),
                ElementsAre("Could not create VoxServerConnection", "Could not create the ports necessary"));
    EXPECT_FALSE(ports.isTaken(localName)); // the local port was open and has been closed
}

TEST_F(VelmoraModelStartTest, ServiceThatAppearsLaterIsFoundAtTheNextTry) {
    telephony.available = false;
    model->restartMonitor();
    queue.advance(14s); // tries at 5 s and 10 s
    EXPECT_EQ(telephony.connectionsAsked(), 3);
    telephony.available = true;
    queue.advance(1s);
    EXPECT_TRUE(model->isConnected());
    EXPECT_EQ(queue.delayedCount(), 0u);
}

TEST_F(VelmoraModelStartTest, TriesEveryFiveSecondsWithoutLimitOrBackOff) {
    telephony.available = false;
    model->restartMonitor();
    queue.advance(1h);
    EXPECT_EQ(telephony.connectionsAsked(), 1 + 3600 / 5);
    EXPECT_EQ(queue.delayedCount(), 1u);
}

TEST_F(VelmoraModelStartTest, LogChannelError) {
    telephony.error = {1, -7};
    model->restartMonitor();
    EXPECT_THAT(errors(), ElementsAre("_VoxServerConnectionNetworkMonitorCreateLogChannel returns error: -7!",
                                      "Could not create the ports necessary"));
    EXPECT_EQ(telephony.liveConnections(), 0);
}

TEST_F(VelmoraModelStartTest, OnlyTheErrorsCodeCounts) {
    telephony.error = {5, 0};
    model->restartMonitor();
    EXPECT_TRUE(model->isConnected());
}

TEST_F(VelmoraModelStartTest, LogChannelWithoutAPort) {
    telephony.remotePortName = "";
    model->restartMonitor();
    EXPECT_THAT(errors(), ElementsAre("Could not create a log channel (Vox returned null port)!",
                                      "Could not create the ports necessary"));
}

TEST_F(VelmoraModelStartTest, RemotePortThatIsNotThere) {
    ports.stopServing(channelName);
    model->restartMonitor();
    EXPECT_THAT(errors(),
                ElementsAre("Could not create the remote port!", "Could not create the ports necessary"));
}

TEST_F(VelmoraModelStartTest, StartCommandThatIsNotTaken) {
    startCommand = [](const Data&) { return RemotePort::Answer{PortStatus::SendTimeout, std::nullopt}; };
    model->restartMonitor();
    EXPECT_EQ(errors().back(), " ***** Could not send the START command (got error=-1)");
    EXPECT_FALSE(model->isConnected());
    EXPECT_EQ(queue.timerCount(), 0u);
    EXPECT_EQ(queue.delayedCount(), 1u);
}

/// A decoder whose start command has no XML form.
class SpeechlessGenerator final : public LogGenerator {
public:
    using LogGenerator::LogGenerator;
    void updateState(Dictionary&, const Data&) override {}
    Value generateLogUsingState(Dictionary&) override { return {}; }
    DictionaryRef getStartCommand() const override {
        DictionaryRef command = makeDictionary();
        command->set("SetState", Value("\x01"));
        return command;
    }
    ArrayRef getSaveContentsFromState(const Dictionary&) const override { return makeArray(); }
};

class SpeechlessModel final : public VelmoraModel {
public:
    SpeechlessModel(ModelPlatform platform, const Clock& clock)
        : VelmoraModel(std::move(platform), nullptr), _clock(clock) {}

protected:
    std::unique_ptr<LogGenerator> generatorFromTechnology(std::string_view) override {
        return std::make_unique<SpeechlessGenerator>(_clock);
    }

private:
    const Clock& _clock;
};

TEST_F(VelmoraModelStartTest, StartCommandThatCannotBeSerialized) {
    const auto speechless = std::make_shared<SpeechlessModel>(
        ModelPlatform{ports, queue, telephony, clock, [this] { return portName; }}, clock);
    speechless->startMonitor();
    EXPECT_EQ(errors().back(), " Could not generate PLIST");
    EXPECT_EQ(ports.sent().size(), 1u); // the question alone
    EXPECT_EQ(queue.delayedCount(), 1u);
}

TEST_F(VelmoraModelStartTest, RetryThatIsDueKeepsTheModelAlive) {
    telephony.available = false;
    model->startMonitor();
    const std::weak_ptr<VelmoraModel> watched = model;
    model.reset();
    EXPECT_FALSE(watched.expired());
    telephony.available = true;
    queue.advance(5s);
    // It connected, and with nothing more to hold it, it went and closed its ports.
    EXPECT_THAT(errors(), Contains("Starting the display update timer"));
    EXPECT_TRUE(watched.expired());
    EXPECT_FALSE(ports.isTaken(localName));
    EXPECT_EQ(queue.timerCount(), 0u);
}

} // namespace
} // namespace velmora
