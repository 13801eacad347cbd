// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Sources/MessagePlayer.h"

#include "Telephony/Drives/GSM/GSMScenario.h"
#include "Telephony/Sources/ScenarioSource.h"
#include "Tests/Support/FakeMainQueue.h"
#include "Tests/Support/Hex.h"
#include "Tests/Telephony/TelephonyTesting.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <vector>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using ::testing::ElementsAre;

Data numbered(std::size_t number) {
    return Data(
        std::vector<std::uint8_t>{static_cast<std::uint8_t>(number), static_cast<std::uint8_t>(number >> 8)});
}

/// One message at each offset, numbered from 0.
MessagePlayer::Next at(std::vector<std::chrono::nanoseconds> offsets) {
    return [offsets = std::move(offsets), number = std::size_t{0}]() mutable -> std::optional<ScenarioEvent> {
        if (number == offsets.size())
            return std::nullopt;
        const std::size_t now = number++;
        return ScenarioEvent{offsets[now], numbered(now)};
    };
}

/// Messages without end, `interval` apart.
MessagePlayer::Next every(std::chrono::nanoseconds interval) {
    return [interval, number = 0]() mutable {
        const auto offset = interval * number;
        return std::optional(ScenarioEvent{offset, numbered(static_cast<std::size_t>(number++))});
    };
}

class MessagePlayerTest : public ::testing::Test {
protected:
    FakeClock clock;
    FakeMainQueue queue{clock};
    CollectingSink sink;
};

TEST_F(MessagePlayerTest, sendsEachMessageInItsTime) {
    MessagePlayer player(queue, clock, 1);
    player.start(sink, at({0s, 100ms, 100ms, 2h, 2h + 1s}));
    EXPECT_EQ(sink.messages.size(), 0U) << "never from inside the call";
    queue.advance(0s);
    EXPECT_EQ(sink.messages.size(), 1U);
    queue.advance(99ms);
    EXPECT_EQ(sink.messages.size(), 1U);
    queue.advance(2ms);
    EXPECT_THAT(sink.messages, ElementsAre(numbered(0), numbered(1), numbered(2)));
    queue.advance(2h - 102ms);
    EXPECT_EQ(sink.messages.size(), 3U);
    queue.advance(2ms);
    EXPECT_EQ(sink.messages.size(), 4U);
    EXPECT_EQ(sink.ends, 0);
    queue.advance(1h);
    EXPECT_EQ(sink.messages.size(), 5U);
    EXPECT_EQ(sink.ends, 1);
    EXPECT_EQ(queue.delayedCount(), 0U) << "nothing is left to do at the end";
}

TEST_F(MessagePlayerTest, playsFasterAndSlower) {
    for (const double speed : {0.5, 4.0}) {
        sink.messages.clear();
        MessagePlayer player(queue, clock, speed);
        player.start(sink, every(100ms));
        queue.advance(10s + 50ms);
        EXPECT_NEAR(static_cast<double>(sink.messages.size()), 1 + 100 * speed, 1) << speed;
        player.stop();
    }
}

TEST_F(MessagePlayerTest, keepsUpAtAThousandTimesTheSpeed) {
    MessagePlayer player(queue, clock, 1000);
    player.start(sink, every(50ms)); // twenty a second
    queue.advance(1s);
    EXPECT_NEAR(static_cast<double>(sink.messages.size()), 20'000, 100);
}

TEST_F(MessagePlayerTest, sendsABoundedNumberInOneWakeUp) {
    MessagePlayer player(queue, clock, 1e9);
    player.start(sink, every(1s));
    queue.advance(0s);
    queue.advance(1ms);
    EXPECT_LE(sink.messages.size(), 2U * MessagePlayer::batch);
    queue.advance(10ms);
    EXPECT_LE(sink.messages.size(), 12U * MessagePlayer::batch);
    EXPECT_GE(sink.messages.size(), 10U * MessagePlayer::batch);
}

TEST_F(MessagePlayerTest, unpacedItSendsAsLongAsThereIsRoom) {
    MessagePlayer player(queue, clock, MessagePlayer::unpaced);
    player.start(sink, every(1h));
    queue.advance(0s);
    EXPECT_EQ(sink.messages.size(), static_cast<std::size_t>(MessagePlayer::batch));
    sink.room = false;
    queue.advance(1s);
    EXPECT_EQ(sink.messages.size(), static_cast<std::size_t>(MessagePlayer::batch));
    sink.room = true;
    queue.advance(10ms);
    EXPECT_GT(sink.messages.size(), 5U * MessagePlayer::batch);
}

TEST_F(MessagePlayerTest, aPacedOneDoesNotWaitForRoom) {
    sink.room = false;
    MessagePlayer player(queue, clock, 1);
    player.start(sink, every(100ms));
    queue.advance(1s);
    EXPECT_GE(sink.messages.size(), 10U);
}

TEST_F(MessagePlayerTest, stopsAtOnce) {
    MessagePlayer player(queue, clock, 1);
    player.start(sink, every(1ms));
    queue.advance(10ms);
    player.stop();
    const auto sent = sink.messages.size();
    queue.advance(1s);
    EXPECT_EQ(sink.messages.size(), sent);
    player.stop();
}

TEST_F(MessagePlayerTest, stopsFromInsideTheSink) {
    MessagePlayer player(queue, clock, 1);
    sink.onTake = [&] { player.stop(); };
    player.start(sink, at({0s, 0s, 0s}));
    queue.advance(1s);
    EXPECT_EQ(sink.messages.size(), 1U);
    player.start(sink, at({0s, 0s}));
    queue.advance(1s);
    EXPECT_EQ(sink.messages.size(), 2U) << "and can be started again";
}

TEST_F(MessagePlayerTest, stopsWithItsOwner) {
    auto player = std::make_unique<MessagePlayer>(queue, clock, 1);
    player->start(sink, every(1ms));
    player.reset();
    queue.advance(1s);
    EXPECT_EQ(sink.messages.size(), 0U);
}

TEST_F(MessagePlayerTest, aClockThatIsSetNeitherStopsNorRushesIt) {
    MessagePlayer player(queue, clock, 1);
    player.start(sink, every(100ms));
    queue.advance(1s);
    const auto before = sink.messages.size();
    clock.setNow(clock.now() - 24h);
    queue.advance(1s);
    EXPECT_NEAR(static_cast<double>(sink.messages.size() - before), 10, 1);
    clock.setNow(clock.now() + 48h);
    queue.advance(1s);
    EXPECT_NEAR(static_cast<double>(sink.messages.size() - before), 30, 2) << "a second at most is caught up";
}

TEST_F(MessagePlayerTest, aScenarioRestartsWithEachStart) {
    ScenarioSource source(
        queue, clock, [] { return std::make_unique<GSMScenario>(11); }, 10);
    EXPECT_EQ(source.technology(), "kVoxLogChannelTechnology_Ostrel_GSM");
    source.start(sink);
    queue.advance(3s);
    source.stop();
    const auto first = std::move(sink.messages);
    sink.messages.clear();
    ASSERT_GT(first.size(), 400U) << "thirty seconds of the drive";
    queue.advance(5s);
    EXPECT_TRUE(sink.messages.empty());
    source.start(sink);
    queue.advance(3s);
    EXPECT_EQ(sink.messages, first);
}

} // namespace
} // namespace velmora
