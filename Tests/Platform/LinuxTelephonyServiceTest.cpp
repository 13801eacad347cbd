// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Ports/LinuxTelephonyService.h"
#include "PropertyLists/PropertyList.h"
#include "Tests/Platform/LinuxPortFixture.h"
#include "Tests/Support/FakeMessagePorts.h"

#include <gmock/gmock.h>

namespace velmora {

namespace {

using namespace std::chrono_literals;

class LinuxTelephonyServiceTest : public testing::Test {
protected:
    struct Outcome {
        std::int32_t domain;
        std::int32_t code;
        std::string name;
        friend bool operator==(const Outcome&, const Outcome&) = default;
    };

    /// Creates a channel with a service that answers so.
    Outcome channel(RemotePort::Answer answer) {
        _ports.serve("com.velmora.vox.server", [&](std::int32_t, const Data&, bool) { return answer; });
        const auto connection = _service._VoxServerConnectionCreate(nullptr);
        EXPECT_TRUE(connection);
        std::string name = "left from before";
        const auto error =
            _service._VoxServerConnectionNetworkMonitorCreateLogChannel(*connection, "local", name);
        return {error.domain, error.code, name};
    }

    Outcome channel(const Value& reply) {
        const auto text = writeXMLPropertyList(reply);
        EXPECT_TRUE(text);
        return channel({0, dataOf(*text)});
    }

    FakeMessagePorts _ports;
    LinuxTelephonyService _service{_ports};
};

TEST_F(LinuxTelephonyServiceTest, AnAbsentServiceGivesNoConnection) {
    EXPECT_FALSE(_service._VoxServerConnectionCreate([] {}));
}

TEST_F(LinuxTelephonyServiceTest, TheRequestNamesTheLocalPort) {
    auto reply = makeDictionary();
    reply->set("Port", "com.velmora.vox.channel.1");
    EXPECT_EQ(channel(reply), (Outcome{0, 0, "com.velmora.vox.channel.1"}));
    ASSERT_EQ(_ports.sent().size(), 1U);
    const auto& sent = _ports.sent().front();
    EXPECT_EQ(sent.id, 0);
    EXPECT_TRUE(sent.wantsReply);
    EXPECT_EQ(sent.sendTimeout, 1s);
    EXPECT_EQ(sent.receiveTimeout, 1s);
    EXPECT_TRUE(textOf(sent.payload).starts_with("<?xml"));
    const auto request = readPropertyList(sent.payload.bytes());
    ASSERT_TRUE(request);
    auto expected = makeDictionary();
    expected->set("CreateLogChannel", "local");
    EXPECT_TRUE(*request == Value(expected));
}

TEST_F(LinuxTelephonyServiceTest, TransportFailuresAreTheFirstDomain) {
    for (const std::int32_t status : {-1, -2, -3, -4, -5})
        EXPECT_EQ(channel({status, std::nullopt}), (Outcome{1, status, ""})) << status;
}

TEST_F(LinuxTelephonyServiceTest, TheServicesErrorsAreTheSecond) {
    const auto error = [](std::int64_t code) {
        auto reply = makeDictionary();
        reply->set("Error", code);
        reply->set("Port", "not to be used");
        return Value(reply);
    };
    EXPECT_EQ(channel(error(12)), (Outcome{2, 12, ""}));
    EXPECT_EQ(channel(error(-12)), (Outcome{2, -12, ""}));
    EXPECT_EQ(channel(error(std::int64_t{1} << 32)), (Outcome{2, -2147483647 - 1, ""}));
    EXPECT_EQ(channel(error(0)), (Outcome{0, 0, "not to be used"}));
}

TEST_F(LinuxTelephonyServiceTest, AnswersWithoutANameGiveNone) {
    const CapturedLog log;
    EXPECT_EQ(channel({0, std::nullopt}), (Outcome{0, 0, ""}));
    EXPECT_EQ(channel({0, Data()}), (Outcome{0, 0, ""}));
    EXPECT_EQ(channel({0, dataOf("rubbish")}), (Outcome{0, 0, ""}));
    EXPECT_EQ(channel(Value(makeArray())), (Outcome{0, 0, ""}));
    EXPECT_EQ(channel(Value(makeDictionary())), (Outcome{0, 0, ""}));
    auto number = makeDictionary();
    number->set("Port", 5);
    EXPECT_EQ(channel(Value(number)), (Outcome{0, 0, ""}));
}

TEST_F(LinuxTelephonyServiceTest, TheConnectionReportsALostService) {
    _ports.serve("com.velmora.vox.server",
                 [](std::int32_t, const Data&, bool) { return RemotePort::Answer(); });
    int closed = 0;
    auto connection = _service._VoxServerConnectionCreate([&] { ++closed; });
    _ports.sever("com.velmora.vox.server");
    EXPECT_EQ(closed, 1);
    connection = _service._VoxServerConnectionCreate([&] { ++closed; });
    connection.reset();
    _ports.sever("com.velmora.vox.server");
    EXPECT_EQ(closed, 1);
}

} // namespace

} // namespace velmora
