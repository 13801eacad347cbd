// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Ports/PortOptions.h"
#include "Platform/Linux/Ports/PortPeers.h"
#include "Platform/MessagePort.h"

#include <memory>
#include <string>

namespace velmora {

/// Message ports over Unix-domain stream sockets in one directory of the user's, served by the main thread's
/// event loop. The ports live on without it. A failed system call is an error line.
class LinuxMessagePorts final : public MessagePorts {
public:
    explicit LinuxMessagePorts(PortOptions options = {});

    [[nodiscard]] Created createLocal(const std::string& name, MessageCallback callback) override;
    [[nodiscard]] std::shared_ptr<RemotePort> createRemote(const std::string& name) override;
    [[nodiscard]] std::string failure() const override { return _failure; }

private:
    /// The name is a peer's where a service connects to its clients.
    void fail(const std::string& name, const std::string& reason);

    PortOptions _options;
    std::shared_ptr<PortPeers> _peers;
    std::string _failure;
};

} // namespace velmora
