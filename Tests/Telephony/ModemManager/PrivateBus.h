// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tests/Support/TemporaryDirectory.h"
#include "Tests/Telephony/TelephonydProcess.h"

#include <memory>
#include <string>

namespace velmora {

/// A message bus of the test's own, as a process. It starts no services and lets every client own any name.
class PrivateBus {
public:
    /// `rules` are policy rules in the form of the bus's configuration, after the one that allows everything.
    explicit PrivateBus(const std::string& rules = {});

    /// Starts the bus and waits until it listens; throws std::runtime_error where it does not.
    void start();
    /// Ends it: all connections to it break.
    void stop();

    [[nodiscard]] const std::string& address() const { return _address; }

private:
    TemporaryDirectory _directory;
    std::string _address;
    std::unique_ptr<TestProcess> _process;
};

} // namespace velmora
