// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/LogServerFixture.h"

#include "Telephony/Drives/GSM/GSMScenario.h"
#include "Telephony/Sources/ScenarioSource.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

#include <algorithm>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using ::testing::ElementsAre;
using ::testing::IsEmpty;

using LogServerClientsTest = LogServerTest;

TEST_F(LogServerClientsTest, EveryClientIsToldThatTheSourceHasEnded) {
    listen();
    const auto ends = [this](const std::string& application) {
        return std::count_if(ports.sent().begin(), ports.sent().end(), [&](const auto& sent) {
            return sent.port == application && sent.id == 1 && sent.payload.size() == 0;
        });
    };
    const std::string first = createChannel("com.velmora.first");
    const std::string idle = createChannel("com.velmora.idle");
    stream(first);
    source.sink->receive(hex("01 02"));
    EXPECT_EQ(ends("com.velmora.first"), 0);
    source.sink->sourceEnded();
    EXPECT_EQ(ends("com.velmora.first"), 1);
    EXPECT_EQ(ends("com.velmora.idle"), 0) << "it gets no messages";
    const std::string late = createChannel("com.velmora.late");
    stream(late);
    EXPECT_EQ(ends("com.velmora.late"), 1) << "there is nothing to wait for";
    EXPECT_EQ(ends("com.velmora.first"), 1);
}

TEST_F(LogServerClientsTest, closesTheChannelOfAClosedClient) {
    listen();
    const std::string channel = createChannel("app");
    stream(channel);
    ports.sever("app");
    EXPECT_FALSE(ports.isTaken(channel));
    queue.runPending();
    EXPECT_EQ(server.channelCount(), 0U);
    EXPECT_EQ(source.stops, 1);
    EXPECT_TRUE(log.contains(LogPriority::Notice, channel + ": closed, app has gone"));
    EXPECT_TRUE(ports.isTaken(serverName)) << "the service goes on";
}

TEST_F(LogServerClientsTest, closesAChannelWhosePortWasClosed) {
    listen();
    const std::string channel = createChannel("app");
    stream(channel);
    ASSERT_TRUE(ports.closeLocal(channel));
    queue.runPending();
    EXPECT_EQ(server.channelCount(), 0U);
    EXPECT_EQ(ports.connectionCount("app"), 0U);
    EXPECT_EQ(source.stops, 1);
}

TEST_F(LogServerClientsTest, aClosedClientDoesNotAffectOthers) {
    listen();
    stream(createChannel("one"));
    stream(createChannel("two"));
    EXPECT_EQ(source.starts, 1);
    source.sink->receive(record(1, "00"));
    ports.sever("one");
    queue.runPending();
    EXPECT_EQ(source.stops, 0);
    source.sink->receive(record(2, "00"));
    EXPECT_THAT(sentTo("one"), ElementsAre(record(1, "00")));
    EXPECT_THAT(sentTo("two"), ElementsAre(record(1, "00"), record(2, "00")));
}

TEST_F(LogServerClientsTest, aClientMayGoWhileAMessageIsSent) {
    listen();
    ports.serve("one", [this](std::int32_t, const Data&, bool) {
        ports.sever("one");
        return RemotePort::Answer{};
    });
    const Value reply = request(serverName, plist({{"CreateLogChannel", "one"}}));
    stream(*(*reply.asDictionary())["Port"].asString());
    stream(createChannel("two"));
    source.sink->receive(record(1, "00"));
    queue.runPending();
    EXPECT_EQ(server.channelCount(), 1U);
    EXPECT_THAT(sentTo("two"), ElementsAre(record(1, "00")));
    EXPECT_EQ(source.stops, 0);
}

TEST_F(LogServerClientsTest, aChannelThatDoesNotStreamKeepsNoSourceRunning) {
    listen();
    createChannel("quiet");
    stream(createChannel("app"));
    ports.sever("app");
    queue.runPending();
    EXPECT_EQ(source.stops, 1);
    EXPECT_EQ(server.channelCount(), 1U);
}

TEST_F(LogServerClientsTest, aLateClientFirstGetsTheLatestOfEachState) {
    listen();
    stream(createChannel("one"));
    const Data simBefore = record(0x0000, "01", 0xFF);
    const Data sim = record(0x0000, "02", 0xFF);
    const Data contexts = record(0x0002, "03", 0xFF);
    for (const Data& each : {simBefore, record(0x5137, "00"), contexts, sim})
        source.sink->receive(each);

    const std::string late = createChannel("two");
    const Value extra(std::make_shared<Array>(Array{0, 1, 2}));
    ASSERT_TRUE(ports.deliver(late, 0, plist({{"SetState", "Streaming"}, {"SetVoxExtraCodes", extra}})));
    EXPECT_THAT(sentTo("two"), ElementsAre(sim, contexts));

    const std::string choosy = createChannel("three");
    const Value contextsOnly(std::make_shared<Array>(Array{2}));
    ASSERT_TRUE(
        ports.deliver(choosy, 0, plist({{"SetState", "Streaming"}, {"SetVoxExtraCodes", contextsOnly}})));
    EXPECT_THAT(sentTo("three"), ElementsAre(contexts)) << "the filter holds for them too";
    EXPECT_EQ(source.starts, 1);
}

TEST_F(LogServerClientsTest, statesOfAnEarlierRunAreForgotten) {
    listen();
    stream(createChannel("one"));
    source.sink->receive(record(0x0000, "01", 0xFF));
    ports.sever("one");
    queue.runPending();
    stream(createChannel("two"));
    EXPECT_THAT(sentTo("two"), IsEmpty());
    EXPECT_EQ(source.starts, 2);
}

TEST_F(LogServerClientsTest, aNewRunStartsRightAfterTheLastClientHasClosed) {
    listen();
    stream(createChannel("one"));
    ports.sever("one"); // what follows comes before the queue has had its turn
    stream(createChannel("two"));
    EXPECT_EQ(source.stops, 1);
    EXPECT_EQ(source.starts, 2);
    queue.runPending();
    EXPECT_EQ(source.stops, 1);
}

TEST_F(LogServerClientsTest, aNewChannelForTheSamePortReplacesTheOld) {
    listen();
    const std::string old = createChannel("app");
    stream(old);
    const std::string fresh = createChannel("app");
    EXPECT_FALSE(ports.isTaken(old));
    stream(fresh);
    EXPECT_EQ(source.starts, 2);
    source.sink->receive(record(1, "00"));
    EXPECT_THAT(sentTo("app"), ElementsAre(record(1, "00"))) << "once";
}

TEST_F(LogServerClientsTest, rememberedStatesAreBounded) {
    listen();
    stream(createChannel("one"));
    for (int code = 0; code < 100; ++code)
        source.sink->receive(record(static_cast<std::uint16_t>(code), "00", 0xFF));
    source.sink->receive(record(3, "07", 0xFF));
    stream(createChannel("two"));
    const auto states = sentTo("two");
    ASSERT_EQ(states.size(), LogServer::maximumCachedExtra);
    EXPECT_EQ(states[3], record(3, "07", 0xFF));
}

TEST_F(LogServerClientsTest, stopClosesEverything) {
    listen();
    const std::string channel = createChannel("app");
    stream(channel);
    server.stop();
    EXPECT_FALSE(ports.isTaken(serverName));
    EXPECT_FALSE(ports.isTaken(channel));
    EXPECT_EQ(ports.connectionCount("app"), 0U);
    EXPECT_EQ(source.stops, 1);
    EXPECT_FALSE(lost) << "nothing was lost: it was closed";
    server.stop();
    EXPECT_EQ(source.stops, 1);
}

TEST_F(LogServerClientsTest, reportsALostPort) {
    listen();
    ASSERT_TRUE(ports.closeLocal(serverName));
    EXPECT_TRUE(lost);
    EXPECT_THAT(errors(), ElementsAre("the port com.velmora.vox.server was closed"));
}

TEST_F(LogServerClientsTest, aSecondServiceIsRefused) {
    listen();
    ManualSource otherSource;
    LogServer second(ports, queue, otherSource);
    const auto listening = second.listen([] {});
    ASSERT_FALSE(listening);
    EXPECT_EQ(listening.reason(),
              "the port com.velmora.vox.server is taken, wanted to be the only telephony service");
    second.stop();
    EXPECT_TRUE(ports.isTaken(serverName));
}

TEST_F(LogServerClientsTest, saysWhenItCannotListen) {
    ports.failNextLocal();
    const auto listening = server.listen([] {});
    ASSERT_FALSE(listening);
    EXPECT_EQ(listening.reason(), "cannot make the port com.velmora.vox.server");
}

TEST_F(LogServerClientsTest, everyLoneClientSeesTheSameDrive) {
    ScenarioSource drive(
        queue, clock, [] { return std::make_unique<GSMScenario>(5); }, 1);
    LogServer driving(ports, queue, drive);
    ASSERT_TRUE(driving.listen([] {}));
    stream(createChannel("one"));
    queue.advance(20s);
    const auto first = sentTo("one");
    ASSERT_GT(first.size(), 200U);
    ports.sever("one");
    queue.advance(7s);
    EXPECT_EQ(sentTo("one").size(), first.size());

    stream(createChannel("two"));
    queue.advance(20s);
    EXPECT_EQ(sentTo("two"), first);
}

/// Remote ports whose queue is as full as the test says; everything else is the fake ports'.
class QueueingPorts final : public MessagePorts {
public:
    class Port final : public RemotePort {
    public:
        std::size_t waiting = 0;
        [[nodiscard]] const std::string& name() const override { return _name; }
        [[nodiscard]] bool isValid() const override { return true; }
        void setInvalidationCallback(std::function<void(RemotePort&)>) override {}
        void invalidate() override {}
        Answer sendRequest(std::int32_t, const Data&, std::chrono::nanoseconds, std::chrono::nanoseconds,
                           bool) override {
            return {};
        }
        void post(std::int32_t, const Data&) override {}
        [[nodiscard]] std::uint64_t droppedMessages() const override { return 0; }
        [[nodiscard]] std::size_t waitingMessages() const override { return waiting; }

    private:
        std::string _name = "slow";
    };

    FakeMessagePorts local;
    std::shared_ptr<Port> port = std::make_shared<Port>();

    [[nodiscard]] Created createLocal(const std::string& name, MessageCallback callback) override {
        return local.createLocal(name, std::move(callback));
    }
    [[nodiscard]] std::shared_ptr<RemotePort> createRemote(const std::string&) override { return port; }
};

TEST(LogServerRoomTest, waitsForASlowClientButNotForAStuckOne) {
    FakeClock clock;
    FakeMainQueue queue(clock);
    QueueingPorts ports;
    CapturedLog log;
    ManualSource source;
    LogServer server(ports, queue, source);
    ASSERT_TRUE(server.listen([] {}));
    ASSERT_TRUE(ports.local.deliver(serverName, 0, plist({{"CreateLogChannel", "slow"}})));
    ports.port->waiting = 1'000'000;
    ASSERT_TRUE(ports.local.deliver(serverName + ".channel.1", 0, plist({{"SetState", "Streaming"}})));

    EXPECT_FALSE(source.sink->hasRoom());
    queue.advance(900ms);
    EXPECT_FALSE(source.sink->hasRoom());
    ports.port->waiting = 10;
    EXPECT_TRUE(source.sink->hasRoom());
    ports.port->waiting = 1'000'000;
    EXPECT_FALSE(source.sink->hasRoom());
    queue.advance(900ms);
    EXPECT_FALSE(source.sink->hasRoom()) << "the time-out restarted";
    queue.advance(200ms);
    EXPECT_TRUE(source.sink->hasRoom()) << "it is stuck";
    ports.port->waiting = 10;
    EXPECT_TRUE(source.sink->hasRoom());
    ports.port->waiting = 1'000'000;
    EXPECT_FALSE(source.sink->hasRoom()) << "it is waited for again";
}

} // namespace
} // namespace velmora
