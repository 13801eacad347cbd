// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Ports/LinuxMessagePorts.h"

#include <filesystem>
#include <memory>
#include <string>
#include <vector>

namespace velmora {

/// A telephony service on the test's event loop that sends the test's messages to every client that has
/// started streaming. Its clients see its destruction as that of a killed service.
class FakeLogService {
public:
    /// `technology` is a short name, or empty for a service that names none.
    FakeLogService(const std::filesystem::path& directory, std::string technology);
    ~FakeLogService();
    FakeLogService(const FakeLogService&) = delete;
    FakeLogService& operator=(const FakeLogService&) = delete;

    /// Clients that have sent their start command.
    [[nodiscard]] std::size_t streaming() const { return _clients.size(); }
    void send(const Data& message);
    /// Says that no more messages follow.
    void sendEnd();
    /// Whether every client has taken all that was sent.
    [[nodiscard]] bool isAllTaken() const;

private:
    [[nodiscard]] std::optional<Data> createChannel(const Data& request);
    [[nodiscard]] std::optional<Data> command(const std::string& client, const Data& payload);

    LinuxMessagePorts _ports;
    std::string _technology;
    std::shared_ptr<LocalPort> _server;
    std::vector<std::shared_ptr<LocalPort>> _channels;
    std::vector<std::shared_ptr<RemotePort>> _clients;
};

} // namespace velmora
