// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Platform/LinuxRemotePortFixture.h"

#include <gmock/gmock.h>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;

using LinuxRemotePortQueueTest = LinuxRemotePortFixture;

TEST_F(LinuxRemotePortQueueTest, PostedMessagesGoOutFromTheEventLoopAndBeforeRequests) {
    const auto port = connected();
    port->post(1, dataOf("x"));
    EXPECT_EQ(receive(_peer, 17), hex("01 00 00 00  01 00 00 00  04 00 00 00  00 00 00 00  78"));
    port->post(2, Data());
    EXPECT_EQ(port->sendRequest(3, Data(), 5s, 0s, false).status, 0);
    EXPECT_EQ(readBlocking(_peer, 32), joined(hex("00 00 00 00  02 00 00 00  04 00 00 00  00 00 00 00"),
                                              hex("00 00 00 00  03 00 00 00  04 00 00 00  00 00 00 00")));
}

TEST_F(LinuxRemotePortQueueTest, WhatWasPostedLastIsNotLost) {
    auto port = connected();
    port->post(1, Data());
    port.reset();
    EXPECT_EQ(readBlocking(_peer, 100), hex("00 00 00 00  01 00 00 00  04 00 00 00  00 00 00 00"));
}

TEST_F(LinuxRemotePortQueueTest, TheOldestMessagesOfASlowReaderAreDroppedAndCounted) {
    _options.queue.messages = 4;
    auto port = connected();
    const Data payload(std::vector<std::uint8_t>(50'000));
    for (std::int32_t id = 1; id <= 100; ++id)
        port->post(id, payload);
    const auto dropped = port->droppedMessages();
    ASSERT_GE(dropped, 50U); // the socket holds a few hundred kilobytes, the queue four messages
    ASSERT_LE(dropped, 96U);

    const std::size_t received = 100 - dropped;
    const Data all = receive(_peer, received * 50'016);
    ASSERT_EQ(all.size(), received * 50'016);
    std::vector<int> ids;
    for (std::size_t offset = 0; offset < all.size(); offset += 50'016)
        ids.push_back(all.bytes()[offset + 4]);
    // First what the socket took, then the message that was half written, then the newest.
    std::vector<int> expected;
    for (std::size_t id = 1; id <= received - 3; ++id)
        expected.push_back(static_cast<int>(id));
    for (const int id : {98, 99, 100})
        expected.push_back(id);
    EXPECT_EQ(ids, expected);

    EXPECT_THAT(_log.lines(), ElementsAre(CapturedLog::Line{
                                  3, "Message port peer: messages dropped because the peer is slow: 1"}));
    port.reset();
    ASSERT_EQ(_log.lines().size(), 2U);
    EXPECT_EQ(_log.lines()[1].text,
              "Message port peer: messages dropped because the peer is slow: " + std::to_string(dropped - 1));
}

TEST_F(LinuxRemotePortQueueTest, TheQueueIsBoundedInBytes) {
    _options.queue.bytes = 1000;
    const auto port = connected();
    port->post(1, Data(std::vector<std::uint8_t>(484)));
    port->post(2, Data(std::vector<std::uint8_t>(484)));
    EXPECT_EQ(port->droppedMessages(), 0U);
    port->post(3, Data());
    EXPECT_EQ(port->droppedMessages(), 1U);
    EXPECT_EQ(receive(_peer, 516).bytes()[4], 2);
}

} // namespace
} // namespace velmora
