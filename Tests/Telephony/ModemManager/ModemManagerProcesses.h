// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tests/Support/TemporaryDirectory.h"
#include "Tests/Telephony/ModemManager/PrivateBus.h"
#include "Tests/Telephony/TelephonydProcess.h"

#include <gtest/gtest.h>

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
    /// Starts the telephony service with that source and waits until it has said `line`.
    void serve(const std::string& source, const std::string& line);
    [[nodiscard]] std::unique_ptr<TestProcess> watch() const;
    /// Waits until the watcher shows all of the texts in one refresh. Gives that refresh; empty where there
    /// is none. In it and in the texts several blanks are one.
    [[nodiscard]] static std::string shown(const TestProcess& watcher, const std::vector<std::string>& texts);
    /// Runs ModemManager's own client: its output without colours and with blanks squeezed.
    [[nodiscard]] std::string mmcli(std::vector<std::string> arguments) const;

    PrivateBus bus;
    TemporaryDirectory directory;
    std::unique_ptr<TestProcess> service;
};

} // namespace velmora
