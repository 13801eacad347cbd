// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Platform/LinuxRemotePortFixture.h"

#include <gmock/gmock.h>

#include <thread>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::IsEmpty;

using LinuxRemotePortTest = LinuxRemotePortFixture;

TEST_F(LinuxRemotePortTest, ARequestIsSentAndItsReplyReturned) {
    const auto port = connected();
    std::thread peer([this] {
        EXPECT_EQ(readBlocking(_peer, 18), hex("02 00 00 00  // length\n"
                                               "FF FF FF FF  // message id -1\n"
                                               "01 00 00 00  // request\n"
                                               "01 00 00 00  // serial\n"
                                               "68 69        // \"hi\"\n"));
        sendAll(_peer, hex("03 00 00 00  FF FF FF FF  02 00 00 00  01 00 00 00  79 65 73"));
    });
    const auto answer = port->sendRequest(-1, dataOf("hi"), 5s, 5s, true);
    peer.join();
    EXPECT_EQ(answer.status, 0);
    ASSERT_TRUE(answer.reply);
    EXPECT_EQ(textOf(*answer.reply), "yes");
}

TEST_F(LinuxRemotePortTest, NoDataAndDataOfNoBytesAreTwoThings) {
    const auto port = connected();
    sendAll(_peer, joined(hex("00 00 00 00  00 00 00 00  0A 00 00 00  01 00 00 00"),
                          hex("00 00 00 00  00 00 00 00  02 00 00 00  02 00 00 00")));
    const auto without = port->sendRequest(0, Data(), 5s, 5s, true);
    EXPECT_EQ(without.status, 0);
    EXPECT_FALSE(without.reply);
    // The second reply has been there for as long as the first: nothing more arrives at the socket.
    const auto with = port->sendRequest(0, Data(), 5s, 5s, true);
    EXPECT_EQ(with.status, 0);
    ASSERT_TRUE(with.reply);
    EXPECT_TRUE(with.reply->empty());
}

TEST_F(LinuxRemotePortTest, ALateReplyIsDiscarded) {
    const auto port = connected();
    EXPECT_EQ(port->sendRequest(0, dataOf("a"), 5s, 20ms, true).status, -2);
    sendAll(_peer, joined(hex("01 00 00 00  00 00 00 00  02 00 00 00  01 00 00 00  41"),
                          hex("01 00 00 00  00 00 00 00  02 00 00 00  02 00 00 00  42")));
    const auto answer = port->sendRequest(0, dataOf("b"), 5s, 5s, true);
    EXPECT_EQ(answer.status, 0);
    ASSERT_TRUE(answer.reply);
    EXPECT_EQ(textOf(*answer.reply), "B");
    EXPECT_TRUE(port->isValid());
    EXPECT_THAT(_log.lines(), IsEmpty());
}

TEST_F(LinuxRemotePortTest, ALateReplyThatComesBetweenRequestsIsDiscarded) {
    const auto port = connected();
    EXPECT_EQ(port->sendRequest(0, Data(), 5s, 0ms, true).status, -2);
    sendAll(_peer, hex("01 00 00 00  00 00 00 00  02 00 00 00  01 00 00 00  41"));
    turnLoop();
    EXPECT_TRUE(port->isValid());
    EXPECT_EQ(port->sendRequest(0, Data(), 5s, 20ms, true).status, -2);
}

TEST_F(LinuxRemotePortTest, TimeOutsAreHonoured) {
    const auto port = connected();
    auto start = std::chrono::steady_clock::now();
    EXPECT_EQ(port->sendRequest(0, dataOf("a"), 5s, 50ms, true).status, -2);
    EXPECT_GE(std::chrono::steady_clock::now() - start, 50ms);

    // Nobody reads: 4 MiB is more than the socket holds.
    const Data much(std::vector<std::uint8_t>(4 << 20));
    start = std::chrono::steady_clock::now();
    EXPECT_EQ(port->sendRequest(0, much, 50ms, 5s, true).status, -1);
    EXPECT_GE(std::chrono::steady_clock::now() - start, 50ms);
    // Behind the message that is half sent nothing can go.
    EXPECT_EQ(port->sendRequest(0, dataOf("b"), 0ms, 5s, true).status, -1);
    EXPECT_TRUE(port->isValid());

    // A frame that is partly sent is completed, one that was not begun is not sent: the next one is readable.
    EXPECT_EQ(receive(_peer, 17 + 16 + (4 << 20)).size(), std::size_t{17 + 16 + (4 << 20)});
    EXPECT_EQ(port->sendRequest(7, dataOf("c"), 5s, 0ms, false).status, 0);
    EXPECT_EQ(receive(_peer, 17), hex("01 00 00 00  07 00 00 00  04 00 00 00  00 00 00 00  63"));
}

TEST_F(LinuxRemotePortTest, AMessageThatIsTooLongCannotBeSent) {
    const auto port = connected();
    const Data tooLong(std::vector<std::uint8_t>((16 << 20) + 1));
    EXPECT_EQ(port->sendRequest(0, tooLong, 1s, 1s, false).status, -4);
    port->post(0, tooLong);
    EXPECT_EQ(port->droppedMessages(), 1U);
    EXPECT_THAT(_log.lines(),
                ElementsAre(CapturedLog::Line{
                    3, "Message port peer: dropped a message of 16777217 bytes, wanted at most 16777216"}));
    EXPECT_TRUE(port->isValid());
}

TEST_F(LinuxRemotePortTest, APeerThatClosesDuringARequestEndsIt) {
    const auto port = connected();
    int invalidated = 0;
    port->setInvalidationCallback([&](RemotePort&) { ++invalidated; });
    std::thread peer([this] {
        (void)readBlocking(_peer, 16);
        _peer.reset();
    });
    EXPECT_EQ(port->sendRequest(0, Data(), 5s, 5s, true).status, -5);
    peer.join();
    EXPECT_FALSE(port->isValid());
    EXPECT_EQ(invalidated, 0); // from the event loop only
    EXPECT_EQ(port->sendRequest(0, Data(), 5s, 5s, true).status, -3);
    EXPECT_TRUE(eventually([&] { return invalidated == 1; }));
    port->invalidate();
    turnLoop();
    EXPECT_EQ(invalidated, 1);
}

TEST_F(LinuxRemotePortTest, ADeadPeerIsSeenWithoutTheEventLoop) {
    const auto port = connected();
    sendAll(_peer, hex("00 00 00 00"));
    EXPECT_TRUE(port->isValid());
    _peer.reset();
    EXPECT_FALSE(port->isValid());
    EXPECT_EQ(port->sendRequest(0, Data(), 5s, 5s, true).status, -3);
}

TEST_F(LinuxRemotePortTest, TheEventLoopSeesADeadPeer) {
    auto port = connected();
    RemotePort* seen = nullptr;
    RemotePort* const raw = port.get();
    port->setInvalidationCallback([&](RemotePort& invalid) {
        seen = &invalid;
        EXPECT_FALSE(invalid.isValid());
        port.reset(); // alive for the length of the call all the same
        EXPECT_EQ(invalid.name(), "peer");
    });
    _peer.reset();
    EXPECT_TRUE(eventually([&] { return seen != nullptr; }));
    EXPECT_EQ(seen, raw);
}

TEST_F(LinuxRemotePortTest, InvalidateCallsBackOnceAndNotWithoutACallback) {
    auto port = connected();
    int invalidated = 0;
    port->setInvalidationCallback([&](RemotePort& invalid) {
        ++invalidated;
        invalid.invalidate();
    });
    port->invalidate();
    port->invalidate();
    EXPECT_EQ(invalidated, 1);
    EXPECT_FALSE(port->isValid());
    EXPECT_TRUE(isClosedByPeer(_peer));
    port->post(0, dataOf("nobody"));
    EXPECT_EQ(port->droppedMessages(), 0U);

    port = connected();
    port->setInvalidationCallback([&](RemotePort&) { ++invalidated; });
    port->setInvalidationCallback(nullptr);
    port->invalidate();
    port = connected();
    port->setInvalidationCallback([&](RemotePort&) { ++invalidated; });
    port.reset();
    turnLoop();
    EXPECT_EQ(invalidated, 1);
}

TEST_F(LinuxRemotePortTest, AnythingButAReplyEndsTheConnection) {
    const std::pair<const char*, std::string> cases[] = {
        {"00 00 00 00  00 00 00 00  04 00 00 00  00 00 00 00", "no reply, wanted a reply"},
        {"00 00 00 00  00 00 00 00  06 00 00 00  00 00 00 00",
         "frame flags 0x00000006, wanted 1, 2, 4 or 0xA"},
        {"01 00 00 01  00 00 00 00  02 00 00 00  01 00 00 00",
         "a frame of 16777217 bytes, wanted at most 16777216"},
    };
    for (const auto& [header, reason] : cases) {
        SCOPED_TRACE(reason);
        const CapturedLog::Line line{3, "Message port peer: closed the connection: " + reason};
        _log.clear();
        auto port = connected();
        sendAll(_peer, hex(header));
        EXPECT_EQ(port->sendRequest(0, Data(), 5s, 5s, true).status, -5);
        EXPECT_FALSE(port->isValid());
        EXPECT_THAT(_log.lines(), ElementsAre(line));

        _log.clear();
        port = connected();
        sendAll(_peer, hex(header));
        EXPECT_TRUE(eventually([&] { return !port->isValid(); }));
        EXPECT_THAT(_log.lines(), ElementsAre(line));
    }
}

TEST_F(LinuxRemotePortTest, APeerThatSendsOtherThingsDoesNotStretchTheTime) {
    const auto port = connected();
    const Data late = hex("00 00 00 00  00 00 00 00  02 00 00 00  00 01 00 00");
    std::thread peer([&] {
        while (::send(_peer.get(), late.bytes().data(), late.size(), MSG_NOSIGNAL) > 0) {
        }
    });
    EXPECT_EQ(port->sendRequest(0, Data(), 5s, 50ms, true).status, -2);
    port->invalidate();
    peer.join();
}

TEST_F(LinuxRemotePortTest, AnAbsentPeerIsNoErrorAndAForeignOneIs) {
    EXPECT_FALSE(LinuxMessagePorts(_options).createRemote("nobody"));
    _server.reset(); // as a crash leaves it: a socket without a listener
    EXPECT_FALSE(LinuxMessagePorts(_options).createRemote("peer"));
    EXPECT_THAT(_log.lines(), IsEmpty());

    _server = rawServer("other");
    _options.peerUser = ::geteuid() + 1;
    EXPECT_FALSE(LinuxMessagePorts(_options).createRemote("other"));
    EXPECT_THAT(_log.lines(), ElementsAre(CapturedLog::Line{
                                  3, "Message port other: a peer of user " + std::to_string(::geteuid()) +
                                         ", wanted user " + std::to_string(::geteuid() + 1)}));
}

TEST_F(LinuxRemotePortTest, ConnectingHasAnEnd) {
    _options.connectTimeout = 50ms;
    ASSERT_EQ(::listen(_server.get(), 0), 0);
    std::vector<std::shared_ptr<RemotePort>> waiting;
    for (int i = 0; i < 4; ++i)
        waiting.push_back(LinuxMessagePorts(_options).createRemote("peer"));
    EXPECT_TRUE(waiting.front());
    EXPECT_FALSE(waiting.back());
    EXPECT_TRUE(_log.contains(3, "Message port peer: the peer did not take the connection in time"));
}

} // namespace
} // namespace velmora
