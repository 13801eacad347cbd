// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/LoopTimer.h"
#include "Tests/Platform/LinuxPortFixture.h"

#include <gmock/gmock.h>
#include <sys/socket.h>

#include <algorithm>

namespace velmora {

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

const Data oneWayAbc = hex("03 00 00 00  // length\n"
                           "02 00 00 00  // message id\n"
                           "04 00 00 00  // one-way\n"
                           "00 00 00 00  // serial\n"
                           "61 62 63     // \"abc\"\n");
const Data requestHi = hex("02 00 00 00  05 00 00 00  01 00 00 00  09 00 00 00  68 69");

TEST_F(LinuxPortTest, OneWayMessagesArriveInOrder) {
    const auto port = listening("in");
    const auto client = rawClient("in");
    sendAll(client, joined(oneWayAbc, requestHi));
    ASSERT_TRUE(eventually([&] { return _messages.size() == 2; }));
    EXPECT_THAT(_messages, ElementsAre(Message{2, "abc"}, Message{5, "hi"}));
    EXPECT_EQ(port->name(), "in");
    EXPECT_TRUE(port->isValid());
}

TEST_F(LinuxPortTest, ARequestGetsTheCallbacksAnswerAndAOneWayMessageNothing) {
    const auto created = LinuxMessagePorts(_options).createLocal(
        "in", [](LocalPort&, std::int32_t id, const Data&) -> std::optional<Data> {
            if (id == 5)
                return dataOf("yes");
            return id == 2 ? std::optional(Data()) : std::nullopt;
        });
    created.port->attachToMainQueue();
    const auto client = rawClient("in");
    sendAll(client, joined(oneWayAbc, requestHi,
                           hex("00 00 00 00  02 00 00 00  01 00 00 00  0A 00 00 00"),   // data of no bytes
                           hex("00 00 00 00  FF FF FF FF  01 00 00 00  0B 00 00 00"))); // no data
    EXPECT_EQ(receive(client, 51), joined(hex("03 00 00 00  05 00 00 00  02 00 00 00  09 00 00 00  79 65 73"),
                                          hex("00 00 00 00  02 00 00 00  02 00 00 00  0A 00 00 00"),
                                          hex("00 00 00 00  FF FF FF FF  0A 00 00 00  0B 00 00 00")));
}

TEST_F(LinuxPortTest, APortThatIsNotAttachedTakesNothing) {
    auto created = LinuxMessagePorts(_options).createLocal(
        "in", [this](LocalPort&, std::int32_t id, const Data& payload) {
            _messages.push_back({id, textOf(payload)});
            return std::nullopt;
        });
    const auto client = rawClient("in");
    sendAll(client, oneWayAbc);
    turnLoop();
    EXPECT_THAT(_messages, IsEmpty());
    created.port->attachToMainQueue();
    created.port->attachToMainQueue();
    ASSERT_TRUE(eventually([&] { return !_messages.empty(); }));
    EXPECT_THAT(_messages, ElementsAre(Message{2, "abc"}));
}

TEST_F(LinuxPortTest, MalformedFramesCloseTheirConnectionAlone) {
    struct {
        const char* name;
        const char* header;
        const char* reason;
    } const cases[] = {
        {"too long", "01 00 00 01  00 00 00 00  04 00 00 00  00 00 00 00",
         "a frame of 16777217 bytes, wanted at most 16777216"},
        {"bad flags", "00 00 00 00  00 00 00 00  05 00 00 00  00 00 00 00",
         "frame flags 0x00000005, wanted 1, 2, 4 or 0xA"},
        {"a reply", "00 00 00 00  00 00 00 00  02 00 00 00  00 00 00 00",
         "a reply, wanted a request or a one-way message"},
    };
    const auto port = listening("in");
    const auto bystander = rawClient("in");
    for (const auto& row : cases) {
        SCOPED_TRACE(row.name);
        _messages.clear();
        _log.clear();
        const auto client = rawClient("in");
        sendAll(client, joined(oneWayAbc, hex(row.header), oneWayAbc));
        EXPECT_TRUE(isClosedByPeer(client));
        sendAll(bystander, requestHi);
        ASSERT_TRUE(eventually([&] { return _messages.size() == 2; }));
        EXPECT_THAT(_messages, ElementsAre(Message{2, "abc"}, Message{5, "hi"}));
        EXPECT_THAT(_log.lines(),
                    ElementsAre(CapturedLog::Line{3, std::string("Message port in: closed a connection: ") +
                                                         row.reason}));
    }
    EXPECT_TRUE(port->isValid());
}

TEST_F(LinuxPortTest, PeersThatGoInMidFrameAreNoError) {
    const auto port = listening("in");
    std::vector<FileDescriptor> clients;
    for (int i = 0; i < 8; ++i) {
        clients.push_back(rawClient("in"));
        sendAll(clients.back(), hex("00 00 00 01  00 00 00 00  04 00 00 00  00 00 00 00  01"));
    }
    turnLoop();
    clients.clear();
    turnLoop();
    EXPECT_THAT(_messages, IsEmpty());
    EXPECT_THAT(_log.lines(), IsEmpty());
}

TEST_F(LinuxPortTest, WhatAPeerSentBeforeItWentIsDelivered) {
    const auto port = listening("in");
    sendAll(rawClient("in"), oneWayAbc);
    ASSERT_TRUE(eventually([&] { return !_messages.empty(); }));
    EXPECT_THAT(_messages, ElementsAre(Message{2, "abc"}));
}

TEST_F(LinuxPortTest, AFloodIsTakenInSlicesAndInTurn) {
    std::vector<int> senders;
    const auto created =
        LinuxMessagePorts(_options).createLocal("in", [&senders](LocalPort&, std::int32_t id, const Data&) {
            senders.push_back(id);
            return std::nullopt;
        });
    created.port->attachToMainQueue();
    std::vector<FileDescriptor> clients;
    for (const char* header : {"00 00 00 00  01 00 00 00  04 00 00 00  00 00 00 00",
                               "00 00 00 00  02 00 00 00  04 00 00 00  00 00 00 00"}) {
        clients.push_back(rawClient("in"));
        Data thousand = hex(header);
        for (int i = 0; i < 10; ++i)
            thousand = joined(thousand, thousand);
        sendAll(clients.back(), thousand); // 1024 messages
    }
    std::size_t atLastTurn = 0;
    std::size_t longest = 0;
    LoopTimer turn([&] {
        longest = std::max(longest, senders.size() - atLastTurn);
        atLastTurn = senders.size();
        turn.startOnce(std::chrono::nanoseconds::zero());
    });
    turn.startOnce(std::chrono::nanoseconds::zero());
    ASSERT_TRUE(eventually([&] { return senders.size() == 2048; }));
    EXPECT_LE(longest, 256U);
    EXPECT_GE(longest, 1U);
    // The second sender has had its turn long before the first was done.
    const auto firstOfSecond = std::find(senders.begin(), senders.end(), 2) - senders.begin();
    const auto firstOfFirst = std::find(senders.begin(), senders.end(), 1) - senders.begin();
    EXPECT_LE(firstOfFirst, 512);
    EXPECT_LE(firstOfSecond, 512);
}

TEST_F(LinuxPortTest, ConnectionsBeyondTheLimitAreRefused) {
    _options.maximumConnections = 2;
    const auto port = listening("in");
    auto first = rawClient("in");
    auto second = rawClient("in");
    const auto third = rawClient("in");
    const auto fourth = rawClient("in");
    EXPECT_TRUE(isClosedByPeer(third));
    EXPECT_TRUE(isClosedByPeer(fourth));
    const CapturedLog::Line refused{3, "Message port in: refused a connection beyond 2"};
    EXPECT_THAT(_log.lines(), ElementsAre(refused, refused));
    first.reset();
    turnLoop();
    const auto fifth = rawClient("in");
    sendAll(fifth, oneWayAbc);
    sendAll(second, requestHi);
    ASSERT_TRUE(eventually([&] { return _messages.size() == 2; }));
}

TEST_F(LinuxPortTest, APeerOfAnotherUserIsRefused) {
    _options.peerUser = ::geteuid() + 1;
    const auto port = listening("in");
    const auto client = rawClient("in");
    sendAll(client, oneWayAbc);
    EXPECT_TRUE(isClosedByPeer(client));
    EXPECT_THAT(_messages, IsEmpty());
    const auto user = std::to_string(::geteuid());
    const auto other = std::to_string(::geteuid() + 1);
    EXPECT_THAT(_log.lines(), ElementsAre(CapturedLog::Line{3, "Message port in: refused a peer of user " +
                                                                   user + ", wanted user " + other}));
}

TEST_F(LinuxPortTest, APeerThatTakesNoRepliesIsNotReadAndTheOthersAre) {
    std::size_t answered = 0;
    const auto created =
        LinuxMessagePorts(_options).createLocal("in", [&](LocalPort&, std::int32_t id, const Data&) {
            answered += id == 7 ? 1 : 0;
            return std::optional(Data(std::vector<std::uint8_t>(100'000)));
        });
    created.port->attachToMainQueue();
    const auto greedy = rawClient("in");
    Data requests = hex("00 00 00 00  07 00 00 00  01 00 00 00  01 00 00 00");
    for (int i = 0; i < 10; ++i)
        requests = joined(requests, requests);
    sendAll(greedy, requests); // 1024 requests for 100 kB each
    turnLoop();
    EXPECT_GE(answered, 1U);
    EXPECT_LT(answered, 200U); // a mebibyte waits, a few hundred kilobytes are in the socket
    const auto modest = rawClient("in");
    sendAll(modest, requestHi);
    EXPECT_EQ(receive(modest, 100'016).size(), 100'016U);
    // All of it comes once the peer reads.
    EXPECT_EQ(receive(greedy, 1024 * 100'016).size(), std::size_t{1024} * 100'016);
    EXPECT_EQ(answered, 1024U);
}

TEST_F(LinuxPortTest, AReplyThatIsTooLongBecomesOneWithoutData) {
    const auto created =
        LinuxMessagePorts(_options).createLocal("in", [](LocalPort&, std::int32_t, const Data&) {
            return std::optional(Data(std::vector<std::uint8_t>((16 << 20) + 1)));
        });
    created.port->attachToMainQueue();
    const auto client = rawClient("in");
    sendAll(client, requestHi);
    EXPECT_EQ(receive(client, 16), hex("00 00 00 00  05 00 00 00  0A 00 00 00  09 00 00 00"));
    EXPECT_THAT(_log.lines(), ElementsAre(CapturedLog::Line{
                                  3, "Message port in: a reply of 16777217 bytes, wanted at most 16777216"}));
}

TEST_F(LinuxPortTest, ACallbackMayInvalidateThePort) {
    int invalidated = 0;
    int messages = 0;
    const auto created =
        LinuxMessagePorts(_options).createLocal("in", [&](LocalPort& port, std::int32_t, const Data&) {
            ++messages;
            port.invalidate();
            port.invalidate();
            return std::optional(dataOf("late"));
        });
    created.port->attachToMainQueue();
    created.port->setInvalidationCallback([&](LocalPort& port) {
        ++invalidated;
        EXPECT_FALSE(port.isValid());
        EXPECT_THAT(files(), IsEmpty());
    });
    const auto client = rawClient("in");
    sendAll(client, joined(requestHi, requestHi));
    EXPECT_TRUE(isClosedByPeer(client));
    turnLoop();
    EXPECT_EQ(messages, 1);
    EXPECT_EQ(invalidated, 1);
}

TEST_F(LinuxPortTest, ACallbackMayDropTheLastReference) {
    int messages = 0;
    std::shared_ptr<LocalPort> held;
    auto created = LinuxMessagePorts(_options).createLocal("in", [&](LocalPort&, std::int32_t, const Data&) {
        ++messages;
        held.reset();
        return std::optional(dataOf("last words"));
    });
    held = std::move(created.port);
    held->attachToMainQueue();
    held->setInvalidationCallback([](LocalPort&) { ADD_FAILURE() << "destroyed, not invalidated"; });
    const auto client = rawClient("in");
    sendAll(client, joined(requestHi, requestHi));
    EXPECT_TRUE(isClosedByPeer(client));
    turnLoop();
    EXPECT_EQ(messages, 1);
    EXPECT_THAT(files(), IsEmpty());
}

} // namespace

} // namespace velmora
