// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Model/VelmoraModel.h"
#include "PropertyLists/PropertyList.h"
#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeMainQueue.h"
#include "Tests/Support/FakeMessagePorts.h"
#include "Tests/Support/FakeResources.h"
#include "Tests/Support/FakeTelephonyService.h"
#include "Tests/Support/Hex.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <functional>
#include <memory>
#include <optional>
#include <string>

namespace velmora {

/// A model on fake ports in virtual time, with a service that answers as the test has set it.
class ModelFixture : public testing::Test, public ModelObserver {
protected:
    static constexpr const char* localName = "com.velmora.BasebandStateReport.LogChannel";
    static constexpr const char* channelName = "com.velmora.test.channel";

    ModelFixture() {
        resources.put("Ostrel_GSM", "plist",
                      Value(std::make_shared<Dictionary>(std::initializer_list<Dictionary::Entry>{
                          {"Process CS", makeDictionary()}, {"Equivalent PLMN List", makeArray()}})));
        ports.serve(channelName, [this](std::int32_t, const Data& payload, bool wantsReply) {
            return wantsReply ? getTechnology(payload) : startCommand(payload);
        });
    }

    void updateViewControllerFromModel() override {
        ++redraws;
        if (onRedraw)
            onRedraw();
    }

    static Data bytes(std::string_view text) {
        return Data(std::vector<std::uint8_t>(text.begin(), text.end()));
    }
    static Data list(const Value& value) { return bytes(*writeXMLPropertyList(value)); }
    static RemotePort::Answer answers(std::string_view technology) {
        return {PortStatus::Success,
                list(Value(std::make_shared<Dictionary>(
                    std::initializer_list<Dictionary::Entry>{{"GetTechnology", technology}})))};
    }

    void deliver(const Data& message, std::int32_t messageId = 0) {
        ASSERT_TRUE(ports.deliver(localName, messageId, message));
    }
    /// A record that sets "MM Service State" to "REG_STATE_IDLE" in "Process CS".
    static Data idleRecord() { return record(0x7132, "01 00 00"); }

    [[nodiscard]] std::vector<std::string> errors() const { return log.textsAt(LogPriority::Error); }
    /// How often this line was written.
    [[nodiscard]] std::ptrdiff_t count(std::string_view text) const {
        const auto lines = errors();
        return std::count(lines.begin(), lines.end(), text);
    }

    CapturedLog log;
    FakeClock clock;
    FakeMainQueue queue{clock};
    FakeMessagePorts ports;
    FakeTelephonyService telephony;
    FakeResources resources;

    std::optional<std::string> portName = logChannelPortName();
    std::function<RemotePort::Answer(const Data&)> getTechnology = [](const Data&) {
        return answers(kVoxLogChannelTechnology_Ostrel_GSM);
    };
    std::function<RemotePort::Answer(const Data&)> startCommand = [](const Data&) {
        return RemotePort::Answer{};
    };
    int redraws = 0;
    std::function<void()> onRedraw;

    std::shared_ptr<VelmoraModel> model = std::make_shared<VelmoraModel>(
        ModelPlatform{ports, queue, telephony, clock, [this] { return portName; }}, this);
};

} // namespace velmora
