// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/ModemManager/ModemManagerSource.h"
#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeMainQueue.h"
#include "Tests/Telephony/ModemManager/MockModemManager.h"
#include "Tests/Telephony/ModemManager/PrivateBus.h"
#include "Tests/Telephony/TelephonyTesting.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <functional>
#include <memory>
#include <optional>
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
    void follow(std::optional<std::uint32_t> modem = std::nullopt);
    void listen() { source->start(sink); }

    /// Serves the bus until the condition holds, with the tasks that are due; time stands still.
    [[nodiscard]] bool comes(const std::function<bool()>& condition);
    /// The same while a tenth of a second of the test's time pass at every look.
    [[nodiscard]] bool passes(const std::function<bool()>& condition);
    /// Until everything that was sent on the bus so far has arrived.
    void drain();

    /// The list of the latest record of that code of the extra stream; none where there is none. Expects the
    /// record's header to be right.
    [[nodiscard]] Value latest(std::uint16_t code) const;
    [[nodiscard]] std::size_t count(std::uint16_t code) const;
    /// What a decoder of the source's technology shows of all records: its display.
    [[nodiscard]] Value display(const std::string& templateName) const;
    [[nodiscard]] std::vector<std::string> warnings() const { return log.textsAt(LogPriority::Warning); }

    PrivateBus bus;
    Mock mock{bus.address()};
    FakeClock clock;
    FakeMainQueue queue{clock};
    CollectingSink sink;
    CapturedLog log{LogPriority::Notice};
    std::unique_ptr<ModemManagerSource> source;
    int changes = 0; ///< of the technology
};

/// The value at the end of keys and, for arrays, indices: at(display, {"UMTS", "UMTS Set", "0", "RSCP"}).
[[nodiscard]] Value at(const Value& root, const std::vector<std::string>& path);

inline constexpr std::uint16_t simCode = 0;
inline constexpr std::uint16_t cellCode = 1;
inline constexpr std::uint16_t contextCode = 2;

} // namespace velmora
