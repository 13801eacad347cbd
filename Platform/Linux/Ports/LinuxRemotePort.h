// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Files/FileDescriptor.h"
#include "Platform/Linux/LoopTimer.h"
#include "Platform/Linux/Ports/FrameQueue.h"
#include "Platform/Linux/Ports/FrameReader.h"
#include "Platform/Linux/Ports/PortOptions.h"
#include "Platform/Linux/Ports/PortPeers.h"
#include "Platform/Linux/Ports/SocketWatch.h"
#include "Platform/MessagePort.h"

#include <memory>
#include <string>

namespace velmora {

/// A connection to another process's local port.
///
/// The end of the connection is noticed by the event loop, by `sendRequest`, and by `isValid` itself, which
/// asks the system. The invalidation callback comes from the event loop when the connection has ended, and
/// from `invalidate` directly; not when the port is destroyed. Main thread only, on its event loop.
class LinuxRemotePort final : public RemotePort, public std::enable_shared_from_this<LinuxRemotePort> {
public:
    /// Connects; null when there is no such port. The failure says what went wrong otherwise.
    static Result<std::shared_ptr<LinuxRemotePort>>
    connect(const std::string& name, const PortOptions& options, std::shared_ptr<PortPeers> peers);

    ~LinuxRemotePort() override;

    [[nodiscard]] const std::string& name() const override { return _name; }
    [[nodiscard]] bool isValid() const override;
    void setInvalidationCallback(std::function<void(RemotePort&)> callback) override;
    void invalidate() override;
    /// As RemotePort says; what `post` has queued goes out first, within `sendTimeout`. The answer is
    /// BecameInvalid also for a connection that ends while the message is being sent.
    Answer sendRequest(std::int32_t messageId, const Data& payload, std::chrono::nanoseconds sendTimeout,
                       std::chrono::nanoseconds receiveTimeout, bool wantsReply) override;
    void post(std::int32_t messageId, const Data& payload) override;
    [[nodiscard]] std::uint64_t droppedMessages() const override { return _dropped; }
    [[nodiscard]] std::size_t waitingMessages() const override { return _queue.size(); }

private:
    using Deadline = std::chrono::steady_clock::time_point;

    LinuxRemotePort(std::string name, FileDescriptor socket, const PortOptions& options,
                    std::shared_ptr<PortPeers> peers);

    [[nodiscard]] std::int32_t sendNow(const Frame& frame, Deadline deadline);
    [[nodiscard]] Answer awaitReply(std::uint32_t serial, Deadline deadline);
    /// The reply with that serial out of what has arrived; others are late and are discarded. A malformed
    /// frame ends the connection.
    [[nodiscard]] std::optional<Frame> takeReply(std::uint32_t serial);
    void readAvailable();
    void discardReplies();
    void flushQueue();
    void countDropped(std::uint64_t count);
    void reportDropped();
    /// Closes the connection; the callback follows from the event loop.
    void connectionEnded();
    void close();
    void callInvalidationCallback();

    std::string _name;
    std::function<void(RemotePort&)> _invalidationCallback;
    FileDescriptor _socket;
    std::shared_ptr<PortPeers> _peers;
    FrameReader _reader;
    FrameQueue _queue;
    bool _blocked = false; ///< the last write would have blocked
    std::uint32_t _lastSerial = 0;
    std::uint64_t _dropped = 0;
    std::uint64_t _unreported = 0; ///< dropped messages that are not logged yet
    std::unique_ptr<SocketWatch> _readWatch;
    std::unique_ptr<SocketWatch> _writeWatch;
    LoopTimer _droppedReport;
    LoopTimer _ended;
    LoopTimer _gaveUp; ///< the reader has
};

} // namespace velmora
