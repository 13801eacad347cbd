// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Model/ModelFixture.h"

#include <chrono>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::Contains;
using testing::IsEmpty;
using testing::MatchesRegex;

class VelmoraModelRunTest : public ModelFixture {
protected:
    VelmoraModelRunTest() {
        model->restartMonitor();
        log.clear();
    }
    [[nodiscard]] std::string shown(const std::string& path) const {
        const NodeRef node = model->nodeAtPath(path);
        return node && node->value() ? *node->value() : "(none)";
    }
    [[nodiscard]] std::size_t historySize() const {
        const Array* history = model->state()["History"].asArray();
        return history ? history->size() : 0;
    }
};

TEST_F(VelmoraModelRunTest, MessagesBetweenTwoTicksGiveOneRedraw) {
    deliver(idleRecord());
    deliver(idleRecord());
    EXPECT_EQ(redraws, 0);
    queue.advance(2s);
    EXPECT_EQ(redraws, 1);
    queue.advance(20s); // ticks without messages leave the screen alone
    EXPECT_EQ(redraws, 1);
}

TEST_F(VelmoraModelRunTest, RedrawIsQueuedNeverRunWithinTheTick) {
    deliver(idleRecord());
    model->refresh();
    EXPECT_EQ(redraws, 0);
    EXPECT_EQ(queue.pendingCount(), 1u);
    queue.runPending();
    EXPECT_EQ(redraws, 1);
}

TEST_F(VelmoraModelRunTest, ForgetsAllThatWasDecoded) {
    deliver(idleRecord());
    queue.advance(2s);
    const std::string path = "/Process CS/MM Service State";
    ASSERT_EQ(shown(path), "REG_STATE_IDLE");
    deliver(idleRecord());
    model->forget();
    EXPECT_FALSE(model->isConnected());
    EXPECT_EQ(model->topLevelNodes(), nullptr);
    EXPECT_EQ(model->nodeAtPath(path), nullptr);
    EXPECT_EQ(model->getSaveContents(), nullptr);
    EXPECT_TRUE(model->state().empty());
    queue.advance(20s); // neither the timer nor what had arrived redraws
    EXPECT_EQ(redraws, 1);
    model->restartMonitor();
    ASSERT_TRUE(model->isConnected());
    EXPECT_EQ(shown(path), "(none)");
    deliver(idleRecord());
    queue.advance(2s);
    EXPECT_EQ(shown(path), "REG_STATE_IDLE");
}

TEST_F(VelmoraModelRunTest, MessageOfAnotherIdIsDroppedWithoutAWord) {
    deliver(idleRecord(), 1);
    deliver(idleRecord(), -1);
    queue.advance(2s);
    EXPECT_EQ(redraws, 0);
    EXPECT_THAT(errors(), IsEmpty());
}

TEST_F(VelmoraModelRunTest, LogMessagesAreNotAnswered) {
    std::optional<Data> reply = Data(std::vector<std::uint8_t>{1});
    ASSERT_TRUE(ports.deliver(localName, 0, idleRecord(), &reply));
    EXPECT_FALSE(reply.has_value());
}

TEST_F(VelmoraModelRunTest, TreeShowsWhatWasDecoded) {
    deliver(idleRecord());
    queue.advance(2s);
    EXPECT_EQ(model->topLevelNodes()->displayName(), "Velmora");
    EXPECT_EQ(shown("/Process CS/MM Service State"), "REG_STATE_IDLE");
    EXPECT_EQ(model->nodeAtPath("/"), model->topLevelNodes());
    EXPECT_EQ(model->nodeAtPath("/Process CS/"), nullptr);
    EXPECT_EQ(model->nodeAtPath("/Nowhere"), nullptr);
}

TEST_F(VelmoraModelRunTest, TreeIsBuiltOnceARefreshSoThatTheHistoryGrowsByOne) {
    deliver(idleRecord());
    onRedraw = [this] {
        const NodeRef root = model->topLevelNodes();
        EXPECT_EQ(model->topLevelNodes(), root);
        static_cast<void>(model->nodeAtPath("/Process CS"));
    };
    queue.advance(2s);
    EXPECT_EQ(historySize(), 1u);
    queue.advance(10s);
    EXPECT_EQ(historySize(), 1u);
    deliver(idleRecord());
    queue.advance(2s);
    EXPECT_EQ(historySize(), 2u);
}

TEST_F(VelmoraModelRunTest, NodeAtPathBuildsTheTreeWhereThereIsNone) {
    deliver(idleRecord());
    queue.advance(2s);
    EXPECT_EQ(historySize(), 0u);
    EXPECT_NE(model->nodeAtPath("/Process CS"), nullptr);
    EXPECT_EQ(historySize(), 1u);
}

TEST_F(VelmoraModelRunTest, SaveContentsAreTheHistoryAndTheLog) {
    deliver(idleRecord());
    queue.advance(2s);
    static_cast<void>(model->topLevelNodes());
    const ArrayRef contents = model->getSaveContents();
    ASSERT_EQ(contents->size(), 2u);
    EXPECT_EQ((*(*contents)[0].asDictionary())["Description"], Value("Snapshot (2026-11-16 05:00:02 +0000)"));
    // The version report, and the 16-byte record less its type byte.
    EXPECT_EQ((*(*contents)[1].asDictionary())["Description"], Value("DLF binary (176 bytes)"));
}

TEST_F(VelmoraModelRunTest, DeadServiceIsNoticedAtTheNextTickAndTheMonitorRestarts) {
    deliver(idleRecord());
    queue.advance(2s);
    static_cast<void>(model->topLevelNodes());
    telephony.available = false;
    ports.sever(channelName);
    EXPECT_TRUE(model->isConnected()); // not noticed yet
    queue.advance(2s);
    EXPECT_FALSE(model->isConnected());
    EXPECT_EQ(queue.timerCount(), 0u);
    const auto lines = errors();
    ASSERT_GE(lines.size(), 3u);
    EXPECT_THAT(lines[lines.size() - 3], MatchesRegex(R"( \*\*\*\*\* INVALIDATED 0x[0-9a-f]+ \*\*\*\*\*)"));
    EXPECT_EQ(lines[lines.size() - 2], "Could not create VoxServerConnection");
    EXPECT_EQ(lines.back(), "Could not create the ports necessary");

    telephony.available = true;
    queue.advance(5s);
    EXPECT_TRUE(model->isConnected());
    EXPECT_EQ(historySize(), 1u); // state and history are kept
    EXPECT_EQ(shown("/Process CS/MM Service State"), "REG_STATE_IDLE");
}

TEST_F(VelmoraModelRunTest, DisplayIsLiveAgainAfterAReconnection) {
    deliver(idleRecord());
    queue.advance(2s);
    ports.sever(channelName);
    queue.advance(2s); // noticed and, the service being there, restarted at once with a new decoder
    ASSERT_TRUE(model->isConnected());
    const Dictionary* display = model->state()["Display"].asDictionary();
    deliver(record(0x7132, "06 00 00"));
    queue.advance(2s);
    EXPECT_EQ(shown("/Process CS/MM Service State"), "REG_STATE_OFFLINE");
    EXPECT_EQ(model->state()["Display"].asDictionary(), display); // the same display, not a new one
}

TEST_F(VelmoraModelRunTest, LocalPortThatThePlatformClosesRestartsAtOnce) {
    ASSERT_TRUE(ports.closeLocal(localName));
    EXPECT_TRUE(model->isConnected());
    EXPECT_EQ(count("Starting the display update timer"), 1);
    EXPECT_EQ(queue.timerCount(), 1u);
}

TEST_F(VelmoraModelRunTest, ClosingThePortsRestartsNothing) {
    model->destroyPorts();
    EXPECT_FALSE(model->isConnected());
    EXPECT_EQ(queue.timerCount(), 0u);
    EXPECT_EQ(queue.delayedCount(), 0u);
    queue.advance(1min);
    EXPECT_THAT(log.lines(), IsEmpty());
    EXPECT_FALSE(ports.isTaken(localName));
}

TEST_F(VelmoraModelRunTest, ClosingThePortsKeepsDecoderStateAndTree) {
    deliver(idleRecord());
    const NodeRef root = model->topLevelNodes();
    const LogGenerator* decoder = model->logGenerator();
    model->destroyPorts();
    EXPECT_EQ(model->logGenerator(), decoder);
    EXPECT_EQ(model->topLevelNodes(), root);
}

TEST_F(VelmoraModelRunTest, ReconnectionWithoutAnAnswerKeepsTheDecoder) {
    const LogGenerator* decoder = model->logGenerator();
    getTechnology = [](const Data&) { return RemotePort::Answer{PortStatus::Success, std::nullopt}; };
    model->restartMonitor();
    EXPECT_TRUE(model->isConnected());
    EXPECT_EQ(model->logGenerator(), decoder);
    EXPECT_THAT(errors(), Contains(" ***** No response to GetTechnology; cannot configure"));
    EXPECT_EQ(errors().back(), "Starting the display update timer");
}

TEST_F(VelmoraModelRunTest, ReconnectionWithAnUnknownTechnologyLosesTheDecoder) {
    getTechnology = [](const Data&) { return answers("kVoxLogChannelTechnology_Unheard"); };
    model->restartMonitor();
    EXPECT_EQ(model->logGenerator(), nullptr);
    EXPECT_EQ(model->getSaveContents(), nullptr);
    EXPECT_EQ(model->topLevelNodes(), nullptr);
    EXPECT_EQ(model->nodeAtPath("/"), nullptr);
    EXPECT_EQ(errors().back(), "No log generator technology works");
}

TEST_F(VelmoraModelRunTest, ReconnectionWithATechnologyReplacesTheDecoder) {
    getTechnology = [](const Data&) { return answers(kVoxLogChannelTechnology_IFX); };
    deliver(idleRecord());
    static_cast<void>(model->topLevelNodes());
    model->restartMonitor();
    EXPECT_EQ(historySize(), 1u); // the new decoder starts with what the earlier one left
    const auto& start = ports.sent().back();
    const auto command = readPropertyList(start.payload.bytes());
    ASSERT_TRUE(command);
    EXPECT_EQ(command->asDictionary()->size(), 1u);
}

TEST_F(VelmoraModelRunTest, ServersCallbackRefreshes) {
    deliver(idleRecord());
    telephony.callBack();
    queue.runPending();
    EXPECT_EQ(redraws, 1);
}

TEST_F(VelmoraModelRunTest, NothingRefersToADestroyedModel) {
    deliver(idleRecord());
    model->refresh();
    model.reset();
    queue.runPending();
    telephony.callBack();
    queue.advance(1min);
    EXPECT_EQ(redraws, 0);
    EXPECT_FALSE(ports.isTaken(localName));
}

TEST_F(VelmoraModelRunTest, MissingTemplateShowsNothingAndIsAskedForAgain) {
    const FakeResources none; // hides the fixture's
    const auto bare = std::make_shared<VelmoraModel>(
        ModelPlatform{ports, queue, telephony, clock,
                      [] { return std::optional<std::string>(logChannelPortName("com.velmora.bare")); }},
        this);
    bare->restartMonitor();
    for (int i = 0; i < 2; ++i)
        ASSERT_TRUE(ports.deliver(logChannelPortName("com.velmora.bare"), 0, idleRecord()));
    EXPECT_EQ(count("Cannot load template for display"), 2);
    EXPECT_EQ(bare->topLevelNodes()->childNodes(), nullptr);
}

} // namespace
} // namespace velmora
