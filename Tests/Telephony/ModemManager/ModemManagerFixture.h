// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogMessages/LiveModem.h"
#include "Telephony/ModemManager/ModemManagerSource.h"
#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeMainQueue.h"
#include "Tests/Support/TemporaryDirectory.h"
#include "Tests/Telephony/ModemManager/MockModemManager.h"
#include "Tests/Telephony/ModemManager/PrivateBus.h"
#include "Tests/Telephony/TelephonyTesting.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdint>
#include <functional>
#include <initializer_list>
#include <memory>
#include <string>
#include <vector>

namespace velmora {

/// A source that follows the mock on a bus of the test's own. The bus is real; time is the test's.
class ModemManagerTest : public ::testing::Test {
protected:
    using Mock = MockModemManager;

    /// The mock has SIM 0, which is that of `testModem`. `rules` are the bus's.
    explicit ModemManagerTest(const std::string& rules = {});
    ~ModemManagerTest() override;

    /// Makes the source and waits until it knows which modems there are.
    void follow(const ModemChoice& choice = {});
    void listen() { source->start(sink); }

    /// Serves the bus until the condition holds, with the tasks that are due; time stands still.
    [[nodiscard]] bool comes(const std::function<bool()>& condition);
    /// The same while a tenth of a second of the test's time pass at every look.
    [[nodiscard]] bool passes(const std::function<bool()>& condition);
    /// Until everything that was sent on the bus so far has arrived.
    void drain();

    /// The root of the latest message of that code; none where there is none. Expects its header to be right.
    [[nodiscard]] Value latest(std::uint32_t code) const;
    /// What is in it at the end of these keys.
    [[nodiscard]] Value latest(std::uint32_t code, const std::vector<std::string>& path) const;
    [[nodiscard]] std::size_t count(std::uint32_t code) const;
    /// Whether the latest message comes to have that value there.
    [[nodiscard]] bool becomes(std::uint32_t code, const std::vector<std::string>& path, const Value& value);
    [[nodiscard]] std::vector<std::string> warnings() const { return log.textsAt(LogPriority::Warning); }

    PrivateBus bus;
    Mock mock{bus.address()};
    FakeClock clock;
    FakeMainQueue queue{clock};
    CollectingSink sink;
    CapturedLog log{LogPriority::Notice};
    TemporaryDirectory directory; ///< what the source remembers lies there
    std::unique_ptr<ModemManagerSource> source;
};

/// The value at the end of keys and, for arrays, indices: at(root, {"kVoxTraffic", "0", "kVoxTrafficSent"}).
[[nodiscard]] Value at(const Value& root, const std::vector<std::string>& path);

/// The value as a real; NaN where it is none.
[[nodiscard]] double realOf(const Value& value);
[[nodiscard]] Value dictionary(std::initializer_list<Dictionary::Entry> entries);
[[nodiscard]] Value array(std::initializer_list<Value> values);
/// The choice of that index.
[[nodiscard]] ModemChoice modemOfIndex(std::uint32_t index);

} // namespace velmora
