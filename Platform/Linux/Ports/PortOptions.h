// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Ports/FrameMemory.h"
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
    /// The directory of the sockets; absent for the one that the environment names.
    std::optional<std::filesystem::path> directory;
    /// The user that peers must run as, on either side of a connection.
    uid_t peerUser = ::geteuid();
    /// The limits of `RemotePort::post`'s queue.
    FrameQueue::Limits queue;
    /// Maximum simultaneous connections of a local port; further ones are refused.
    std::size_t maximumConnections = 64;
    /// From three quarters of that number on, a connection that asks for nothing or leaves a frame unfinished
    /// for so long is closed.
    std::chrono::nanoseconds idleTimeout = std::chrono::seconds(10);
    /// What the unfinished frames of all connections may take together, in bytes.
    std::size_t frameMemory = FrameMemory::defaultLimit;
    /// How long connecting may block when the peer's queue of new connections is full.
    std::chrono::nanoseconds connectTimeout = std::chrono::seconds(1);
    /// How long connecting may block when the port's owner has crashed, in case it is being restarted.
    std::chrono::nanoseconds restartTimeout{0};

    /// For clients of a service, which retry only seconds later: blocking briefly catches a service that
    /// restarts at once.
    [[nodiscard]] static PortOptions forClients() {
        PortOptions options;
        options.restartTimeout = std::chrono::milliseconds(500);
        return options;
    }

    [[nodiscard]] Result<PortDirectory> openDirectory() const {
        return directory ? PortDirectory::open(*directory, S_IWGRP | S_IWOTH) : PortDirectory::openStandard();
    }
};

} // namespace velmora
