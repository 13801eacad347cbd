// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Support/FakeMessagePorts.h"

#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <utility>
#include <vector>

namespace velmora {
namespace {

using namespace std::chrono_literals;
using testing::ElementsAre;

const std::string name = "com.velmora.test.port";

MessagePorts::MessageCallback noAnswer() {
    return [](LocalPort&, std::int32_t, const Data&) { return std::optional<Data>(); };
}

class FakeLocalPortTest : public testing::Test {
protected:
    FakeMessagePorts _ports;
    const Data _payload = hex("01 02");
};

TEST_F(FakeLocalPortTest, TakesMessagesOnceItIsAttached) {
    std::vector<std::pair<std::int32_t, Data>> messages;
    const auto created = _ports.createLocal(name, [&](LocalPort& port, std::int32_t id, const Data& payload) {
        EXPECT_EQ(port.name(), name);
        messages.emplace_back(id, payload);
        return std::optional<Data>(hex("AA"));
    });
    ASSERT_TRUE(created.port);
    EXPECT_FALSE(created.alreadyExisted);
    EXPECT_TRUE(created.port->isValid());

    EXPECT_FALSE(_ports.deliver(name, 3, _payload));
    EXPECT_TRUE(messages.empty());
    created.port->attachToMainQueue();
    std::optional<Data> reply;
    EXPECT_TRUE(_ports.deliver(name, 3, _payload, &reply));
    EXPECT_THAT(messages, ElementsAre(std::pair<std::int32_t, Data>(3, _payload)));
    EXPECT_EQ(reply, hex("AA"));
    EXPECT_FALSE(_ports.deliver("another", 3, _payload));
}

TEST_F(FakeLocalPortTest, ATakenNameGivesAHandleThatLeavesTheOwnerAlone) {
    int delivered = 0;
    const auto owner = _ports.createLocal(name, [&](LocalPort&, std::int32_t, const Data&) {
        ++delivered;
        return std::optional<Data>();
    });
    owner.port->attachToMainQueue();
    {
        const auto dropped = _ports.createLocal(name, noAnswer());
        EXPECT_TRUE(dropped.alreadyExisted);
        ASSERT_TRUE(dropped.port);
        dropped.port->attachToMainQueue();
    }
    const auto invalidated = _ports.createLocal(name, noAnswer());
    EXPECT_TRUE(invalidated.alreadyExisted);
    invalidated.port->invalidate();
    EXPECT_FALSE(invalidated.port->isValid());

    EXPECT_TRUE(_ports.isTaken(name));
    EXPECT_TRUE(owner.port->isValid());
    EXPECT_TRUE(_ports.deliver(name, 0, _payload));
    EXPECT_EQ(delivered, 1);
}

TEST_F(FakeLocalPortTest, TheNameIsFreeOnceItsOwnerIsInvalidOrDestroyed) {
    auto first = _ports.createLocal(name, noAnswer()).port;
    first->invalidate();
    EXPECT_FALSE(_ports.isTaken(name));
    auto second = _ports.createLocal(name, noAnswer());
    EXPECT_FALSE(second.alreadyExisted);
    first.reset();
    EXPECT_TRUE(_ports.isTaken(name)) << "the first port no longer owned the name";
    second.port.reset();
    EXPECT_FALSE(_ports.isTaken(name));
    EXPECT_FALSE(_ports.createLocal(name, noAnswer()).alreadyExisted);
}

TEST_F(FakeLocalPortTest, FailsOnRequest) {
    _ports.failNextLocal();
    const auto failed = _ports.createLocal(name, noAnswer());
    EXPECT_FALSE(failed.port);
    EXPECT_FALSE(failed.alreadyExisted);
    EXPECT_TRUE(_ports.createLocal(name, noAnswer()).port);
}

TEST_F(FakeLocalPortTest, InvalidationIsReportedOnceWithTheNameAlreadyFree) {
    const auto port = _ports.createLocal(name, noAnswer()).port;
    int calls = 0;
    port->setInvalidationCallback([&](LocalPort& invalid) {
        ++calls;
        EXPECT_EQ(&invalid, port.get());
        EXPECT_FALSE(invalid.isValid());
        EXPECT_FALSE(_ports.isTaken(name));
        invalid.invalidate();
    });
    EXPECT_TRUE(_ports.closeLocal(name));
    EXPECT_EQ(calls, 1);
    port->invalidate();
    EXPECT_EQ(calls, 1);
    EXPECT_FALSE(_ports.closeLocal(name));
}

TEST_F(FakeLocalPortTest, ARemovedInvalidationCallbackIsNotCalled) {
    const auto port = _ports.createLocal(name, noAnswer()).port;
    int calls = 0;
    port->setInvalidationCallback([&](LocalPort&) { ++calls; });
    port->setInvalidationCallback(nullptr);
    port->invalidate();
    EXPECT_EQ(calls, 0);
}

TEST_F(FakeLocalPortTest, CallbacksMayDropTheLastReference) {
    auto invalidated = _ports.createLocal(name, noAnswer()).port;
    std::string seen;
    invalidated->setInvalidationCallback([&](LocalPort& port) {
        invalidated.reset();
        seen = port.name();
    });
    _ports.closeLocal(name);
    EXPECT_EQ(seen, name);

    std::shared_ptr<LocalPort> receiving;
    const auto held = std::make_shared<int>(5);
    int after = 0;
    receiving = _ports
                    .createLocal(name,
                                 [&receiving, &after, held](LocalPort& port, std::int32_t, const Data&) {
                                     port.invalidate();
                                     receiving.reset();
                                     after = *held;
                                     return std::optional<Data>();
                                 })
                    .port;
    receiving->attachToMainQueue();
    EXPECT_TRUE(_ports.deliver(name, 0, _payload));
    EXPECT_EQ(after, 5);
    EXPECT_FALSE(_ports.isTaken(name));
    EXPECT_EQ(held.use_count(), 1);
}

TEST_F(FakeLocalPortTest, PortsMayOutliveTheirOrigin) {
    std::shared_ptr<LocalPort> local;
    std::shared_ptr<RemotePort> remote;
    {
        FakeMessagePorts ports;
        ports.serve(name, [](std::int32_t, const Data&, bool) { return RemotePort::Answer{}; });
        local = ports.createLocal(name, noAnswer()).port;
        remote = ports.createRemote(name);
    }
    local->invalidate();
    EXPECT_EQ(remote->sendRequest(0, _payload, 1s, 1s, true).status, PortStatus::Success);
}

class FakeRemotePortTest : public testing::Test {
protected:
    FakeRemotePortTest() {
        _ports.serve(name, [](std::int32_t, const Data&, bool) {
            return RemotePort::Answer{PortStatus::Success, hex("55")};
        });
    }

    FakeMessagePorts _ports;
    const Data _payload = hex("01 02");
};

TEST_F(FakeRemotePortTest, OnlyServedNamesCanBeConnectedTo) {
    EXPECT_FALSE(_ports.createRemote("another"));
    const auto port = _ports.createRemote(name);
    ASSERT_TRUE(port);
    EXPECT_EQ(port->name(), name);
    EXPECT_EQ(_ports.connectionCount(name), 1U);
    _ports.stopServing(name);
    EXPECT_FALSE(_ports.createRemote(name));
    EXPECT_TRUE(port->isValid());
    EXPECT_EQ(port->sendRequest(0, _payload, 1s, 1s, true).reply, hex("55"));
}

TEST_F(FakeRemotePortTest, RecordsWhatIsSentAndGivesTheHandlersAnswer) {
    const auto port = _ports.createRemote(name);
    EXPECT_EQ(port->sendRequest(7, _payload, 1s, 2s, true).reply, hex("55"));
    EXPECT_EQ(port->sendRequest(0, _payload, 3s, 0s, false).reply, std::nullopt) << "no reply was asked for";
    port->post(9, hex("FF"));
    ASSERT_EQ(_ports.sent().size(), 3U);
    EXPECT_EQ(_ports.sent()[0].port, name);
    EXPECT_EQ(_ports.sent()[0].id, 7);
    EXPECT_EQ(_ports.sent()[0].payload, _payload);
    EXPECT_EQ(_ports.sent()[0].sendTimeout, 1s);
    EXPECT_EQ(_ports.sent()[0].receiveTimeout, 2s);
    EXPECT_TRUE(_ports.sent()[0].wantsReply);
    EXPECT_EQ(_ports.sent()[1].sendTimeout, 3s);
    EXPECT_FALSE(_ports.sent()[1].wantsReply);
    EXPECT_EQ(_ports.sent()[2].id, 9);
    EXPECT_EQ(_ports.sent()[2].payload, hex("FF"));
    _ports.clearSent();
    EXPECT_TRUE(_ports.sent().empty());
}

TEST_F(FakeRemotePortTest, ANewHandlerServesOldConnectionsToo) {
    const auto port = _ports.createRemote(name);
    _ports.serve(name, [](std::int32_t, const Data&, bool) {
        return RemotePort::Answer{PortStatus::ReceiveTimeout, std::nullopt};
    });
    EXPECT_EQ(port->sendRequest(0, _payload, 1s, 1s, true).status, PortStatus::ReceiveTimeout);
}

TEST_F(FakeRemotePortTest, SeveredPortsAreInvalidAndSayNothing) {
    const auto first = _ports.createRemote(name);
    auto second = _ports.createRemote(name);
    int calls = 0;
    second->setInvalidationCallback([&](RemotePort& port) {
        ++calls;
        second.reset();
        EXPECT_FALSE(port.isValid());
    });
    _ports.sever(name);
    EXPECT_EQ(calls, 1);
    EXPECT_FALSE(first->isValid());
    EXPECT_EQ(first->sendRequest(0, _payload, 1s, 1s, true).status, PortStatus::Invalid);
    first->post(0, _payload);
    EXPECT_TRUE(_ports.sent().empty());
    EXPECT_EQ(_ports.connectionCount(name), 0U);
    EXPECT_TRUE(_ports.createRemote(name)) << "the name is served on";
}

} // namespace
} // namespace velmora
