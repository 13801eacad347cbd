// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogMessages/LiveModem.h"
#include "PropertyLists/Value.h"
#include "Tests/Support/TemporaryDirectory.h"
#include "Tests/Telephony/ModemManager/PrivateBus.h"
#include "Tests/Telephony/TelephonydProcess.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

namespace velmora {

/// The programs as a user starts them, on a bus of the test's own that is system and session bus to them.
class ModemManagerProcesses : public ::testing::Test {
protected:
    explicit ModemManagerProcesses(const std::string& rules = {});
    ~ModemManagerProcesses() override;

    [[nodiscard]] std::unique_ptr<TestProcess> start(const std::string& program,
                                                     std::vector<std::string> arguments) const;
    /// Starts velmora-log.
    [[nodiscard]] std::unique_ptr<TestProcess> startTool(std::vector<std::string> arguments) const;
    /// Starts the telephony service with that source and waits until it has said `line`.
    void serve(const std::string& source, const std::string& line);
    /// What is at the end of these keys in the client's latest message of that code.
    [[nodiscard]] static Value latest(const TestClient& client, std::uint32_t code,
                                      const std::vector<std::string>& path);
    /// Waits until it is that value.
    [[nodiscard]] static bool becomes(const TestClient& client, std::uint32_t code,
                                      const std::vector<std::string>& path, const Value& value);
    /// Runs ModemManager's own client: its output without colours and with blanks squeezed.
    [[nodiscard]] std::string mmcli(std::vector<std::string> arguments) const;

    PrivateBus bus;
    TemporaryDirectory directory;
    std::unique_ptr<TestProcess> service;
};

} // namespace velmora
