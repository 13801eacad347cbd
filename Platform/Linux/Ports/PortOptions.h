// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Ports/FrameQueue.h"
#include "Platform/Linux/Ports/PortDirectory.h"

#include <sys/stat.h>
#include <unistd.h>

#include <chrono>
#include <cstddef>
#include <filesystem>
#include <optional>

namespace velmora {

/// How the ports of a LinuxMessagePorts behave.
struct PortOptions {
    /// Where the sockets lie; absent stands for the place that the environment names.
    std::optional<std::filesystem::path> directory;
    /// The user that peers have to belong to, on either side of a connection.
    uid_t peerUser = ::geteuid();
    /// How much `RemotePort::post` lets wait.
    FrameQueue::Limits queue;
    /// Connections that a local port holds at the same time; newer ones are refused.
    std::size_t maximumConnections = 64;
    /// How long connecting may block when the peer's queue of new connections is full.
    std::chrono::nanoseconds connectTimeout = std::chrono::seconds(1);
    /// How long connecting may block when the port's owner has crashed, in case that is just being started
    /// again.
    std::chrono::nanoseconds restartPatience{0};

    /// For clients of a service. The next attempt is theirs to make seconds later, which a service that is
    /// back within a moment is worth blocking for.
    [[nodiscard]] static PortOptions forClients() {
        PortOptions options;
        options.restartPatience = std::chrono::milliseconds(500);
        return options;
    }

    [[nodiscard]] Result<PortDirectory> openDirectory() const {
        return directory ? PortDirectory::open(*directory, S_IWGRP | S_IWOTH) : PortDirectory::openStandard();
    }
};

} // namespace velmora
