// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/LogServerFixture.h"

#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>

namespace velmora {
namespace {

using ::testing::ElementsAre;
using ::testing::IsEmpty;
using namespace std::chrono_literals;

TEST_F(LogServerTest, makesAChannel) {
    listen();
    const std::string channel = createChannel("app");
    EXPECT_EQ(channel, "com.velmora.vox.server.channel.1");
    EXPECT_TRUE(ports.isTaken(channel));
    EXPECT_EQ(ports.connectionCount("app"), 1U);
    EXPECT_EQ(createChannel("other"), "com.velmora.vox.server.channel.2");
    EXPECT_EQ(server.channelCount(), 2U);
    EXPECT_EQ(source.starts, 0) << "no client streams yet";
    EXPECT_THAT(errors(), IsEmpty());
}

TEST_F(LogServerTest, skipsChannelNamesThatAreTaken) {
    const auto other = ports.createLocal("com.velmora.vox.server.channel.1",
                                         [](LocalPort&, std::int32_t, const Data&) { return std::nullopt; });
    listen();
    EXPECT_EQ(createChannel("app"), "com.velmora.vox.server.channel.2");
    EXPECT_TRUE(other.port->isValid());
}

TEST_F(LogServerTest, refusesAPortThatIsNotThere) {
    listen();
    EXPECT_EQ(request(serverName, plist({{"CreateLogChannel", "nobody"}})), dictionary({{"Error", 1}}));
    EXPECT_EQ(server.channelCount(), 0U);
    EXPECT_FALSE(ports.isTaken("com.velmora.vox.server.channel.1"));
    EXPECT_THAT(errors(), ElementsAre("nobody requests a log channel, but there is no such port"));
}

TEST_F(LogServerTest, refusesMalformedRequests) {
    listen();
    for (const Data& request_ : {plist({}), plist({{"CreateLogChannel", 5}}),
                                 plist({{"CreateLogChannel", ""}}), plist({{"createlogchannel", "app"}})}) {
        log.clear();
        EXPECT_EQ(request(serverName, request_), dictionary({{"Error", 2}}));
        EXPECT_THAT(errors(), ElementsAre("a request names no port, wanted {\"CreateLogChannel\": NAME}"));
    }
    log.clear();
    EXPECT_EQ(request(serverName, hex("DE AD")), dictionary({{"Error", 2}}));
    ASSERT_EQ(errors().size(), 1U);
    EXPECT_THAT(errors()[0], ::testing::StartsWith("cannot read a request for a log channel: "));
    EXPECT_EQ(server.channelCount(), 0U);
}

TEST_F(LogServerTest, refusesNamesOfItsOwn) {
    listen();
    const std::string channel = createChannel("app");
    for (const std::string& own : {serverName, channel, serverName + ".channel.7", serverName + ".x"}) {
        log.clear();
        EXPECT_EQ(request(serverName, plist({{"CreateLogChannel", own}})), dictionary({{"Error", 5}}));
        EXPECT_THAT(errors(),
                    ElementsAre(own + " requests a log channel, but that name is the service's own"));
        EXPECT_EQ(ports.connectionCount(own), 0U) << "it would be its own client";
    }
    EXPECT_EQ(server.channelCount(), 1U);
    EXPECT_EQ(createChannel(serverName + "s"), serverName + ".channel.2") << "only begins alike";
}

TEST_F(LogServerTest, namesThatNoPortCanHaveAreNotRepeated) {
    listen();
    EXPECT_EQ(request(serverName, plist({{"CreateLogChannel", std::string(81, 'x')}})),
              dictionary({{"Error", 2}}));
    EXPECT_EQ(request(serverName, plist({{"CreateLogChannel", "a\tb"}})), dictionary({{"Error", 2}}));
    EXPECT_EQ(request(serverName, plist({{"CreateLogChannel", "a\x7F"}})), dictionary({{"Error", 2}}));
    EXPECT_THAT(errors(), ElementsAre("a request names a port with 81 bytes, wanted at most 80",
                                      "a request names a port with control characters, wanted none",
                                      "a request names a port with control characters, wanted none"));
    EXPECT_EQ(createChannel(std::string(80, 'x')), serverName + ".channel.1");
}

TEST_F(LogServerTest, linesAboutClientsAreLimited) {
    listen();
    const std::string channel = createChannel("app");
    for (int i = 0; i < 1000; ++i) {
        EXPECT_TRUE(ports.deliver(channel, 0, plist({})));
        EXPECT_EQ(request(serverName, plist({})), dictionary({{"Error", 2}}));
    }
    EXPECT_EQ(errors().size(), 20U);
    log.clear();
    queue.advance(1s);
    EXPECT_THAT(errors(), ::testing::UnorderedElementsAre(
                              "invalid commands: 990 more within a second",
                              "refused requests for log channels: 990 more within a second"));
}

TEST_F(LogServerTest, refusesWhenNoChannelPortCanBeMade) {
    listen();
    ports.serve("app", [](std::int32_t, const Data&, bool) { return RemotePort::Answer{}; });
    ports.failNextLocal();
    EXPECT_EQ(request(serverName, plist({{"CreateLogChannel", "app"}})), dictionary({{"Error", 4}}));
    EXPECT_THAT(errors(), ElementsAre("app requests a log channel, but no port can be made for it"));
    EXPECT_EQ(ports.connectionCount("app"), 0U);
}

TEST_F(LogServerTest, boundsTheChannels) {
    listen();
    for (std::size_t i = 0; i < LogServer::maximumChannels; ++i)
        createChannel("app" + std::to_string(i));
    ports.serve("late", [](std::int32_t, const Data&, bool) { return RemotePort::Answer{}; });
    EXPECT_EQ(request(serverName, plist({{"CreateLogChannel", "late"}})), dictionary({{"Error", 3}}));
    EXPECT_THAT(errors(), ElementsAre("late requests a log channel, but 64 are open already"));
    ports.sever("app0");
    EXPECT_EQ(createChannel("late"), "com.velmora.vox.server.channel.65");
}

TEST_F(LogServerTest, channelsThatAskForNothingMakeRoomWhereManyAreOpen) {
    listen();
    stream(createChannel("streaming"));
    for (std::size_t i = 1; i < LogServer::maximumChannels; ++i)
        createChannel("idle" + std::to_string(i));
    ports.serve("late", [](std::int32_t, const Data&, bool) { return RemotePort::Answer{}; });
    queue.advance(9s);
    EXPECT_EQ(request(serverName, plist({{"CreateLogChannel", "late"}})), dictionary({{"Error", 3}}));
    queue.advance(2s);
    EXPECT_TRUE(log.contains(LogPriority::Notice,
                             serverName + ".channel.2: closed, idle1 has asked for nothing within 10 s"));
    EXPECT_EQ(ports.connectionCount("streaming"), 1U) << "it is in use";
    stream(createChannel("late"));
    EXPECT_EQ(ports.connectionCount("late"), 1U);
    queue.advance(60s);
    EXPECT_EQ(ports.connectionCount("late"), 1U);
}

TEST_F(LogServerTest, fewChannelsMayBeIdle) {
    listen();
    for (std::size_t i = 1; i < LogServer::manyChannels; ++i)
        createChannel("idle" + std::to_string(i));
    queue.advance(60s);
    EXPECT_EQ(server.channelCount(), LogServer::manyChannels - 1);
}

TEST_F(LogServerTest, otherMessageIdsAreIgnored) {
    listen();
    const std::string channel = createChannel("app");
    std::optional<Data> reply;
    EXPECT_TRUE(ports.deliver(serverName, 1, plist({{"CreateLogChannel", "app"}}), &reply));
    EXPECT_FALSE(reply);
    EXPECT_TRUE(ports.deliver(channel, 1, plist({{"SetState", "Streaming"}}), &reply));
    EXPECT_EQ(source.starts, 0);
    EXPECT_EQ(server.channelCount(), 1U);
    EXPECT_THAT(errors(), IsEmpty());
}

TEST_F(LogServerTest, reportsTheTechnology) {
    listen();
    const std::string channel = createChannel("app");
    EXPECT_EQ(request(channel, plist({{"GetTechnology", "GetTechnology"}})),
              dictionary({{"GetTechnology", "kVoxLogChannelTechnology_Ostrel_GSM"}}));
    EXPECT_EQ(source.starts, 0);
}

TEST_F(LogServerTest, reportsNoTechnologyWhileTheSourceHasNone) {
    listen();
    source.spoken = {};
    const std::string channel = createChannel("app");
    EXPECT_EQ(request(channel, plist({{"GetTechnology", "GetTechnology"}})), dictionary({}));
    EXPECT_TRUE(ports.isTaken(channel)) << "the client may ask again";
}

TEST_F(LogServerTest, aChangedTechnologyClosesAllChannels) {
    listen();
    const std::string streaming = createChannel("app");
    const std::string idle = createChannel("other");
    stream(streaming);
    source.sink->receive(record(0x0001, "01", 0xFF));
    log.clear();
    source.spoken = kVoxLogChannelTechnology_Ostrel_LTE;
    source.changed();
    EXPECT_FALSE(ports.isTaken(streaming));
    EXPECT_FALSE(ports.isTaken(idle)) << "its client was given the old technology";
    EXPECT_EQ(ports.connectionCount("app"), 0U);
    EXPECT_THAT(log.textsAt(LogPriority::Notice),
                ElementsAre(streaming + ": closed, the technology is Ostrel_LTE now",
                            idle + ": closed, the technology is Ostrel_LTE now"));
    EXPECT_EQ(source.stops, 0) << "not from inside the source";
    queue.runPending();
    EXPECT_EQ(source.stops, 1);
    EXPECT_EQ(server.channelCount(), 0U);

    const std::string channel = createChannel("app");
    EXPECT_EQ(request(channel, plist({{"GetTechnology", "GetTechnology"}})),
              dictionary({{"GetTechnology", "kVoxLogChannelTechnology_Ostrel_LTE"}}));
    stream(channel);
    EXPECT_EQ(source.starts, 2);
    EXPECT_THAT(sentTo("app"), ElementsAre(record(0x0001, "01", 0xFF)))
        << "nothing of the old technology again";
    server.stop();
    EXPECT_FALSE(source.changed) << "a server that has stopped is not called";
}

TEST_F(LogServerTest, aChangeWhileAMessageIsOnItsWayEndsThatToo) {
    listen();
    stream(createChannel("app"));
    ports.serve("app", [this](std::int32_t, const Data&, bool) {
        source.changed();
        return RemotePort::Answer{};
    });
    source.sink->receive(record(0x0001, "01", 0xFF));
    queue.runPending();
    EXPECT_EQ(source.stops, 1);
    EXPECT_EQ(server.channelCount(), 0U);
}

TEST_F(LogServerTest, streamsWhatTheFilterPasses) {
    listen();
    const std::string channel = createChannel("app");
    const Value codes(std::make_shared<Array>(Array{0x5137}));
    const Value extra(std::make_shared<Array>(Array{0}));
    ASSERT_TRUE(ports.deliver(
        channel, 0,
        plist({{"SetState", "Streaming"}, {"SetOstrelLogCodes", codes}, {"SetVoxExtraCodes", extra}})));
    ASSERT_EQ(source.starts, 1);

    const Data wanted = record(0x5137, "01");
    const Data malformed = hex("01 02 03");
    const Data sim = record(0x0000, "02", 0xFF);
    for (const Data& each : {wanted, record(0x5138, "01"), malformed, sim, record(0x0001, "02", 0xFF)})
        source.sink->receive(each);
    EXPECT_THAT(sentTo("app"), ElementsAre(wanted, malformed, sim));
}

TEST_F(LogServerTest, aNewStartCommandChangesTheFilterWithoutARestart) {
    listen();
    const std::string channel = createChannel("app");
    stream(channel);
    const Value codes(std::make_shared<Array>(Array{2}));
    ASSERT_TRUE(ports.deliver(channel, 0, plist({{"SetState", "Streaming"}, {"SetOstrelLogCodes", codes}})));
    EXPECT_EQ(source.starts, 1);
    source.sink->receive(record(1, "00"));
    source.sink->receive(record(2, "00"));
    EXPECT_THAT(sentTo("app"), ElementsAre(record(2, "00")));
}

TEST_F(LogServerTest, rubbishCommandsGiveALineEachAndChangeNothing) {
    listen();
    const std::string channel = createChannel("app");
    struct Case {
        Data command;
        std::string line;
    };
    for (const Case& each : {
             Case{plist({}), ": a command has neither GetTechnology nor SetState"},
             Case{plist({{"SetState", "Sleeping"}}), ": SetState is \"Sleeping\", wanted \"Streaming\""},
             Case{plist({{"SetState", std::string(1'000'000, 'x')}}),
                  ": SetState is a text of 1000000 bytes, wanted \"Streaming\""},
             Case{plist({{"SetState", 1}}), ": SetState is of kind integer, wanted \"Streaming\""},
             Case{plist({{"SetState", "Streaming"}, {"SetOstrelLogCodes", "x"}}),
                  ": SetOstrelLogCodes is of kind string, wanted an array"},
         }) {
        log.clear();
        EXPECT_TRUE(request(channel, each.command).isNone());
        EXPECT_THAT(errors(), ElementsAre(channel + each.line));
    }
    log.clear();
    EXPECT_TRUE(request(channel, hex("FF FE 00")).isNone());
    ASSERT_EQ(errors().size(), 1U);
    EXPECT_THAT(errors()[0], ::testing::StartsWith(channel + ": cannot read a command: "));

    EXPECT_EQ(source.starts, 0);
    EXPECT_TRUE(ports.isTaken(channel));
    stream(channel);
    EXPECT_EQ(source.starts, 1) << "the channel is as good as before";
}

} // namespace
} // namespace velmora
