// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/TelephonyService.h"
#include "Telephony/Service/LogServer.h"
#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/FakeMainQueue.h"
#include "Tests/Support/FakeMessagePorts.h"
#include "Tests/Telephony/TelephonyTesting.h"

#include <gtest/gtest.h>

#include <functional>
#include <stdexcept>
#include <string>
#include <utility>
#include <vector>

namespace velmora {

inline const std::string serverName = "com.velmora.vox.server";

/// A source that sends what the test says.
class ManualSource final : public LogSource {
public:
    int starts = 0;
    int stops = 0;
    LogSink* sink = nullptr;
    std::string_view spoken = kVoxLogChannelTechnology_Ostrel_GSM;
    std::function<void()> changed;

    [[nodiscard]] std::string_view technology() const override { return spoken; }
    void setTechnologyCallback(std::function<void()> call) override { changed = std::move(call); }
    void start(LogSink& to) override {
        ++starts;
        sink = &to;
    }
    void stop() override {
        ++stops;
        sink = nullptr;
    }
};

class LogServerTest : public ::testing::Test {
protected:
    void listen() {
        ASSERT_TRUE(server.listen([this] { lost = true; }));
    }

    /// Asks for a channel to `application`, which is served; the channel's name.
    std::string createChannel(const std::string& application) {
        ports.serve(application, [](std::int32_t, const Data&, bool) { return RemotePort::Answer{}; });
        const Value reply = request(serverName, plist({{"CreateLogChannel", application}}));
        const std::string* port = reply.asDictionary() ? (*reply.asDictionary())["Port"].asString() : nullptr;
        if (!port)
            throw std::runtime_error("no channel was made");
        return *port;
    }

    void stream(const std::string& channel) {
        ASSERT_TRUE(ports.deliver(channel, 0, plist({{"SetState", "Streaming"}})));
    }

    /// The reply as a value; none where there was no reply.
    Value request(const std::string& port, const Data& payload) {
        std::optional<Data> reply;
        if (!ports.deliver(port, 0, payload, &reply))
            throw std::runtime_error("nobody listens on " + port);
        if (!reply)
            return {};
        const auto parsed = readPropertyList(reply->bytes());
        if (!parsed)
            throw std::runtime_error(parsed.reason());
        return *parsed;
    }

    std::vector<Data> sentTo(const std::string& application) {
        std::vector<Data> messages;
        for (const auto& sent : ports.sent())
            if (sent.port == application) {
                EXPECT_EQ(sent.id, 0);
                EXPECT_FALSE(sent.wantsReply);
                messages.push_back(sent.payload);
            }
        return messages;
    }

    std::vector<std::string> errors() { return log.textsAt(LogPriority::Error); }

    FakeClock clock;
    FakeMainQueue queue{clock};
    FakeMessagePorts ports;
    CapturedLog log;
    ManualSource source;
    bool lost = false;
    LogServer server{ports, queue, source};
};

[[nodiscard]] inline Value dictionary(std::initializer_list<Dictionary::Entry> entries) {
    return Value(std::make_shared<Dictionary>(entries));
}

} // namespace velmora
