// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/ModemManager/ModemManagerFixture.h"

#include "LogMessages/LogMessage.h"
#include "PropertyLists/PropertyList.h"

#include <QDBusPendingCall>

#include <limits>

namespace velmora {

using namespace std::chrono_literals;

ModemManagerTest::ModemManagerTest(const std::string& rules) : bus(rules) {
    mock.put(Mock::simPath(0), {{Mock::sim, {{"SimIdentifier", "89011010000000000017"}}}});
}

ModemManagerTest::~ModemManagerTest() {
    source.reset();
}

void ModemManagerTest::follow(const ModemChoice& choice) {
    source = std::make_unique<ModemManagerSource>(
        queue, clock, ModemManagerSource::Options{{choice, bus.address()}, directory.path()});
    const std::size_t before = mock.count("GetManagedObjects");
    ASSERT_TRUE(comes([&] { return mock.count("GetManagedObjects") > before; }));
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

Value ModemManagerTest::latest(std::uint32_t code) const {
    for (auto message = sink.messages.rbegin(); message != sink.messages.rend(); ++message) {
        const auto header = LogMessage::parse(message->bytes());
        if (!header || header->logCode() != code)
            continue;
        EXPECT_EQ(header->type, 0xFF);
        // The length of what follows the type byte.
        EXPECT_EQ(header->length(), message->size() - 1);
        const auto root = readPropertyList(message->bytes().subspan(13));
        EXPECT_TRUE(root);
        return root ? *root : Value();
    }
    return {};
}

Value ModemManagerTest::latest(std::uint32_t code, const std::vector<std::string>& path) const {
    return at(latest(code), path);
}

std::size_t ModemManagerTest::count(std::uint32_t code) const {
    std::size_t records = 0;
    for (const Data& message : sink.messages)
        if (const auto header = LogMessage::parse(message.bytes()); header && header->logCode() == code)
            ++records;
    return records;
}

bool ModemManagerTest::becomes(std::uint32_t code, const std::vector<std::string>& path, const Value& value) {
    return passes([&] { return latest(code, path) == value; });
}

double realOf(const Value& value) {
    return value.asReal() ? *value.asReal() : std::numeric_limits<double>::quiet_NaN();
}

Value dictionary(std::initializer_list<Dictionary::Entry> entries) {
    return std::make_shared<Dictionary>(entries);
}

Value array(std::initializer_list<Value> values) {
    return std::make_shared<Array>(values);
}

ModemChoice modemOfIndex(std::uint32_t index) {
    ModemChoice choice;
    choice.index = index;
    return choice;
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
