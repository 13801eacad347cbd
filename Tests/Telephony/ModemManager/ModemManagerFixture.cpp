// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/ModemManager/ModemManagerFixture.h"

#include "LogGenerator/LogGenerator.h"
#include "LogMessages/LogMessage.h"
#include "LogMessages/RecordTime.h"
#include "PropertyLists/PropertyList.h"
#include "Tests/Support/FakeResources.h"
#include "Tests/Support/ShippedResources.h"

#include <QDBusPendingCall>

namespace velmora {

using namespace std::chrono_literals;

ModemManagerTest::ModemManagerTest(const std::string& rules) : bus(rules) {
    mock.put(Mock::simPath(0), {{Mock::sim, {{"SimIdentifier", "89011010000000000017"}}}});
}

ModemManagerTest::~ModemManagerTest() {
    source.reset();
}

void ModemManagerTest::follow(std::optional<std::uint32_t> modem) {
    source = std::make_unique<ModemManagerSource>(queue, clock, ModemFollower::Options{modem, bus.address()});
    source->setTechnologyCallback([this] { ++changes; });
    ASSERT_TRUE(comes([this] { return mock.count("GetManagedObjects") > 0; }));
    drain();
}

bool ModemManagerTest::comes(const std::function<bool()>& condition) {
    return eventually([&] {
        queue.advance(0ns);
        return condition();
    });
}

bool ModemManagerTest::passes(const std::function<bool()>& condition) {
    return eventually([&] {
        queue.advance(100ms);
        return condition();
    });
}

void ModemManagerTest::drain() {
    // What was sent before goes before, on both ways; the second call follows what the first one's answer
    // made the source send.
    for (int i = 0; i < 3; ++i) {
        auto ping = QDBusMessage::createMethodCall(
            "org.freedesktop.ModemManager1", "/org/freedesktop/ModemManager1", "com.velmora.Test", "Ping");
        const QString name = QStringLiteral("velmora-test-drain");
        {
            auto other = QDBusConnection::connectToBus(QString::fromStdString(bus.address()), name);
            const QDBusPendingCall call = other.asyncCall(ping);
            ASSERT_TRUE(comes([&call] { return call.isFinished(); }));
        }
        QDBusConnection::disconnectFromBus(name);
    }
}

Value ModemManagerTest::latest(std::uint16_t code) const {
    for (auto message = sink.messages.rbegin(); message != sink.messages.rend(); ++message) {
        const auto header = LogMessage::parse(message->bytes());
        if (!header || header->code != code)
            continue;
        EXPECT_EQ(header->type, 0xFF);
        // The length of what follows the type byte, and the time that it was sent.
        const Bytes bytes = message->bytes();
        EXPECT_EQ(bytes[1] | bytes[2] << 8, static_cast<int>(message->size() - 1));
        const auto list = readPropertyList(bytes.subspan(13));
        EXPECT_TRUE(list);
        return list ? *list : Value();
    }
    return {};
}

std::size_t ModemManagerTest::count(std::uint16_t code) const {
    std::size_t records = 0;
    for (const Data& message : sink.messages)
        if (const auto header = LogMessage::parse(message.bytes()); header && header->code == code)
            ++records;
    return records;
}

Value ModemManagerTest::display(const std::string& templateName) const {
    FakeResources resources;
    resources.put(templateName, "plist", shippedResource(templateName + ".plist"));
    const CapturedLog quiet;
    const auto decoder = LogGenerator::generatorFromTechnology(source->technology(), clock);
    if (!decoder)
        return {};
    Dictionary state;
    for (const Data& message : sink.messages)
        decoder->updateState(state, message);
    return state["Display"];
}

Value at(const Value& root, const std::vector<std::string>& path) {
    Value value = root;
    for (const std::string& step : path) {
        if (const Dictionary* dictionary = value.asDictionary())
            value = Value((*dictionary)[step]);
        else if (const Array* array = value.asArray(); array && std::stoul(step) < array->size())
            value = Value((*array)[std::stoul(step)]);
        else
            return {};
    }
    return value;
}

} // namespace velmora
