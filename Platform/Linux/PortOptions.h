#pragma once

#include "Platform/Linux/FrameQueue.h"
#include "Platform/Linux/PortDirectory.h"

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

    [[nodiscard]] Result<PortDirectory> openDirectory() const {
        return directory ? PortDirectory::open(*directory, S_IWGRP | S_IWOTH) : PortDirectory::openStandard();
    }
};

} // namespace velmora
