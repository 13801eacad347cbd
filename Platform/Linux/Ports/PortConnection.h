// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Files/FileDescriptor.h"
#include "Platform/Linux/Ports/FrameQueue.h"
#include "Platform/Linux/Ports/FrameReader.h"
#include "Platform/Linux/Ports/SocketWatch.h"

#include <chrono>
#include <functional>
#include <memory>
#include <optional>
#include <utility>

namespace velmora {

/// A connection that a local port has accepted: frames come in, replies go out. Owned by the port, which
/// decides when it reads. Main thread only.
class PortConnection {
public:
    using SteadyTime = std::chrono::steady_clock::time_point;

    PortConnection(FileDescriptor socket, std::shared_ptr<FrameMemory> memory);

    /// `ready` runs when there may be bytes to read, space for replies, or the end of the connection (which
    /// reading then returns). To be set before the event loop runs again.
    void setReady(std::function<void()> ready) { _ready = std::move(ready); }

    /// The next complete frame, see FrameReader.
    [[nodiscard]] Result<std::optional<Frame>> next();
    /// Reads once; see FrameReader.
    [[nodiscard]] FrameReader::Read read();
    /// Lets `ready` run, or not, when bytes arrive. It may when the connection is made.
    void watchReading(bool enabled) { _readWatch->setEnabled(enabled); }

    /// Sends the frame when the socket is writable. Never blocks.
    void send(const Frame& frame);
    /// Whether so many replies wait for a peer that does not take them that no more may be made: its requests
    /// are not read until it does, so that it cannot fill this process's memory.
    [[nodiscard]] bool hasReplyBacklog() const;

    /// When the latest frame was complete; before the first, when the connection was made.
    [[nodiscard]] SteadyTime lastActive() const { return _lastActive; }
    /// Whether it has sent nothing, or has left a frame unfinished.
    [[nodiscard]] bool isIncomplete() const { return !_hasSent || _reader.hasUnfinishedFrame(); }

    /// Set by the port while the connection is in its list of connections to serve.
    bool queued = false;

private:
    void flush();
    void becomeReady();

    FileDescriptor _socket;
    std::function<void()> _ready;
    FrameReader _reader;
    FrameQueue _replies;
    bool _broken = false;
    bool _hasSent = false; ///< a complete frame
    SteadyTime _lastActive = std::chrono::steady_clock::now();
    std::unique_ptr<SocketWatch> _readWatch;
    std::unique_ptr<SocketWatch> _writeWatch; ///< made when replies have to wait
};

} // namespace velmora
