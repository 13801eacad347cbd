// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/MainLoop.h"
#include "Platform/Linux/Ports/LinuxMessagePorts.h"
#include "Platform/Linux/Ports/LinuxTelephonyService.h"

#include <chrono>
#include <filesystem>
#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <sys/types.h>
#include <vector>

/// The telephony service as a process, and clients of it over real sockets. The test program runs one event
/// loop, made in its `main`; called as "--client DIRECTORY NAME" it is a client itself.

namespace velmora {

[[nodiscard]] MainLoop& testLoop();

/// Serves events until the condition holds; false after thirty seconds, which no working test comes near.
[[nodiscard]] bool eventually(const std::function<bool()>& condition);

/// A process whose output is kept in files. Killed at the end.
class TestProcess {
public:
    /// Starts `program` with `VELMORA_PORT_DIR` set to `directory`, in which the output files lie too.
    TestProcess(std::string program, std::vector<std::string> arguments,
                const std::filesystem::path& directory);
    ~TestProcess();
    TestProcess(const TestProcess&) = delete;
    TestProcess& operator=(const TestProcess&) = delete;

    void signal(int number);
    /// The exit status; -1 when it ended by a signal, nothing when it has not ended after thirty seconds.
    [[nodiscard]] std::optional<int> exitStatus();
    [[nodiscard]] std::string standardOutput() const;
    [[nodiscard]] std::string standardError() const;

private:
    std::filesystem::path _output;
    std::filesystem::path _errors;
    pid_t _id = -1;
    std::optional<int> _status;
};

/// What an application does: a local port, a log channel to it, and commands.
class TestClient {
public:
    TestClient(const std::filesystem::path& directory, const std::string& name);

    /// Asks for a channel once the service is there, and connects to its port. False when that fails.
    [[nodiscard]] bool connect();
    /// The answer to GetTechnology; empty when there was none.
    [[nodiscard]] std::string technology();
    [[nodiscard]] bool stream();
    void close();

    std::vector<Data> messages; ///< those that have arrived
    std::string channel;        ///< the name of the channel's port
    std::shared_ptr<RemotePort> commands;

private:
    LinuxMessagePorts _ports;
    LinuxTelephonyService _service{_ports};
    std::string _name;
    std::shared_ptr<LocalPort> _local;
};

} // namespace velmora
