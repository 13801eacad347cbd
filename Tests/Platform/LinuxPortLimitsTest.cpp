// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Platform/LinuxPortFixture.h"

#include <gmock/gmock.h>
#include <poll.h>
#include <sys/socket.h>

#include <algorithm>

namespace velmora {

namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::IsEmpty;

/// A one-way message 2 "abc", as LinuxLocalPortTest has it, and the beginning of a frame of 16 MiB.
const Data oneWayAbc = hex("03 00 00 00  02 00 00 00  04 00 00 00  00 00 00 00  61 62 63");
const Data unfinished = hex("00 00 00 01  00 00 00 00  04 00 00 00  00 00 00 00  01");

/// A port that may have 64 connections, of which those without a purpose end after a fifth of a second.
class LinuxPortLimits : public LinuxPortTest {
protected:
    LinuxPortLimits() { _options.idleTimeout = 200ms; }

    std::vector<FileDescriptor> connections(std::size_t count, const Data& sent) {
        std::vector<FileDescriptor> all;
        for (std::size_t i = 0; i < count; ++i) {
            all.push_back(rawClient("in"));
            if (!sent.empty())
                sendAll(all.back(), sent);
            turnOnce(); // the system's own queue of new connections is bounded too
        }
        return all;
    }
    static void turnOnce() {
        (void)testLoop().runUntil([] { return false; }, 0ms);
    }

    static std::size_t closedOf(const std::vector<FileDescriptor>& all) {
        return static_cast<std::size_t>(std::count_if(all.begin(), all.end(), [](const auto& each) {
            char byte = 0;
            return ::recv(each.get(), &byte, 1, MSG_DONTWAIT | MSG_PEEK) == 0;
        }));
    }
    /// A new client is served once the time-out is over.
    bool servesANewClient() {
        return eventually([this] {
            const auto client = rawClient("in");
            (void)::send(client.get(), oneWayAbc.bytes().data(), oneWayAbc.size(), MSG_NOSIGNAL);
            turnLoop();
            return std::count(_messages.begin(), _messages.end(), Message{2, "abc"}) > 0;
        });
    }
};

TEST_F(LinuxPortLimits, IdleConnectionsDoNotKeepANewClientOut) {
    const auto port = listening("in");
    const auto idle = connections(64, Data());
    EXPECT_TRUE(isClosedByPeer(rawClient("in"))) << "the time-out is not over";
    EXPECT_TRUE(servesANewClient());
    EXPECT_GE(closedOf(idle), 17U);
    EXPECT_TRUE(_log.contains(3, "Message port in: closed a connection that is idle while 64 are open"));
}

TEST_F(LinuxPortLimits, UnfinishedFramesDoNotKeepANewClientOut) {
    const auto port = listening("in");
    const auto stalled = connections(64, unfinished);
    EXPECT_TRUE(servesANewClient());
    EXPECT_GE(closedOf(stalled), 17U);
}

TEST_F(LinuxPortLimits, AConnectionThatHasSentMessagesStays) {
    const auto port = listening("in");
    const auto quiet = connections(1, oneWayAbc);
    const auto idle = connections(63, Data());
    EXPECT_TRUE(eventually([&] { return closedOf(idle) > 0; }));
    EXPECT_EQ(closedOf(quiet), 0U) << "a stream of messages may pause";
}

TEST_F(LinuxPortLimits, WhereConnectionsAreForOneRequestItDoesNot) {
    const auto port = listening("in");
    port->closeIdleConnections();
    const auto asked = connections(64, oneWayAbc);
    EXPECT_TRUE(eventually([&] { return closedOf(asked) > 0; }));
    _messages.clear();
    EXPECT_TRUE(servesANewClient());
}

TEST_F(LinuxPortLimits, FewIdleConnectionsStay) {
    const auto port = listening("in");
    const auto idle = connections(47, unfinished);
    EXPECT_FALSE(testLoop().runUntil([] { return false; }, 600ms));
    EXPECT_EQ(closedOf(idle), 0U);
    EXPECT_THAT(_log.lines(), IsEmpty());
}

TEST_F(LinuxPortLimits, UnfinishedFramesOfAllPortsShareTheirMemory) {
    _options.frameMemory = 1'500'000;
    LinuxMessagePorts ports(_options);
    const auto noAnswer = [](LocalPort&, std::int32_t, const Data&) { return std::nullopt; };
    const auto first = ports.createLocal("in", noAnswer).port;
    const auto second = ports.createLocal("other", noAnswer).port;
    first->attachToMainQueue();
    second->attachToMainQueue();
    const auto longest = rawClient("in");
    const auto shorter = rawClient("other");
    const auto last = rawClient("other");
    const auto sendSlowly = [](const FileDescriptor& socket, std::size_t bytes) {
        sendAll(socket, unfinished);
        const Data piece(std::vector<std::uint8_t>(50'000));
        for (; bytes > 0; bytes -= 50'000) {
            sendAll(socket, piece);
            turnLoop();
        }
    };
    sendSlowly(longest, 450'000);
    sendSlowly(shorter, 300'000);
    EXPECT_THAT(_log.lines(), IsEmpty());
    sendSlowly(last, 300'000);
    EXPECT_TRUE(isClosedByPeer(longest));
    EXPECT_THAT(_log.lines(), ElementsAre(CapturedLog::Line{
                                  3, "Message port in: closed a connection: unfinished frames take "
                                     "more than 1500000 bytes, and it has the longest"}));
    for (const auto* other : {&shorter, &last}) {
        pollfd poll = {other->get(), POLLRDHUP, 0};
        EXPECT_EQ(::poll(&poll, 1, 0), 0) << "the others go on";
    }
}

TEST_F(LinuxPortLimits, RefusalsAreLinesTenTimesASecond) {
    _options.maximumConnections = 1;
    const auto port = listening("in");
    const auto only = connections(1, oneWayAbc);
    ASSERT_TRUE(eventually([&] { return !_messages.empty(); }));
    for (int i = 0; i < 25; ++i)
        EXPECT_TRUE(isClosedByPeer(rawClient("in")));
    EXPECT_EQ(_log.lines().size(), 10U);
    ASSERT_TRUE(eventually([&] { return _log.lines().size() == 11; }));
    EXPECT_EQ(_log.lines().back(), (CapturedLog::Line{3, "refused connections: 15 more within a second"}));
}

} // namespace

} // namespace velmora
