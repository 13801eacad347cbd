// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>

namespace velmora {

/// How sending ended. The numbers are what log lines show.
namespace PortStatus {
inline constexpr std::int32_t Success = 0;
inline constexpr std::int32_t SendTimeout = -1;    ///< the peer did not take the message in time
inline constexpr std::int32_t ReceiveTimeout = -2; ///< the peer did not answer in time
inline constexpr std::int32_t Invalid = -3;        ///< the port was not valid when the request was made
inline constexpr std::int32_t TransportError =
    -4; ///< the message cannot be sent at all (its size, the system)
inline constexpr std::int32_t BecameInvalid = -5; ///< the connection ended while the answer was awaited
} // namespace PortStatus

/// Bytes of a port's name.
inline constexpr std::size_t maximumPortNameSize = 80;

/// A named port of this process on which messages arrive. Its holders own it; dropping the last reference, or
/// `invalidate`, closes it and frees its name. Callbacks run on the main queue, and each of them may
/// invalidate the port or drop the last reference to it. Main thread only.
class LocalPort {
public:
    virtual ~LocalPort() = default;
    [[nodiscard]] virtual const std::string& name() const = 0;
    [[nodiscard]] virtual bool isValid() const = 0;
    /// Lets callbacks run. A port that is not attached receives no message; senders wait.
    virtual void attachToMainQueue() = 0;
    /// For a port whose senders make a request, wait for the answer and leave: when its connections become
    /// many, those that have sent nothing for a while may be closed. On any other port these are only those
    /// that have never sent a message, or leave one unfinished.
    virtual void closeIdleConnections() {}
    /// Called once when the port becomes invalid, whether by `invalidate` or because the platform closed it,
    /// with the port (alive for the length of the call). An empty function removes the callback.
    virtual void setInvalidationCallback(std::function<void(LocalPort&)> callback) = 0;
    /// Closes the port and frees its name, then calls the invalidation callback. Does nothing when invalid.
    virtual void invalidate() = 0;
};

/// The other end of another process's local port. Valid while its connection is. Main thread only.
class RemotePort {
public:
    struct Answer {
        std::int32_t status = PortStatus::Success;
        std::optional<Data> reply; ///< absent where none was requested or the peer sent none
    };

    virtual ~RemotePort() = default;
    [[nodiscard]] virtual const std::string& name() const = 0;
    [[nodiscard]] virtual bool isValid() const = 0;
    /// As LocalPort's; called once when the connection ends or the port is invalidated.
    virtual void setInvalidationCallback(std::function<void(RemotePort&)> callback) = 0;
    virtual void invalidate() = 0;

    /// Sends a message and blocks: up to `sendTimeout` until the peer has taken it, then, when `wantsReply`,
    /// up to `receiveTimeout` for the reply. Without `wantsReply` the message is one-way.
    virtual Answer sendRequest(std::int32_t messageId, const Data& payload,
                               std::chrono::nanoseconds sendTimeout, std::chrono::nanoseconds receiveTimeout,
                               bool wantsReply) = 0;

    /// Queues a one-way message and returns at once. The queue is bounded: when the peer is slow the oldest
    /// messages that wait are dropped and counted. Does nothing on an invalid port.
    virtual void post(std::int32_t messageId, const Data& payload) = 0;
    /// Messages that `post` has dropped since the port was made.
    [[nodiscard]] virtual std::uint64_t droppedMessages() const = 0;
    /// Messages that `post` has queued and the peer has not taken; 0 where the port keeps no queue. A sender
    /// may wait while there are many.
    [[nodiscard]] virtual std::size_t waitingMessages() const { return 0; }
};

/// The machine's ports.
class MessagePorts {
public:
    /// Returns the receiver's reply, or nothing. An empty answer to a request is sent as a reply without
    /// data.
    using MessageCallback =
        std::function<std::optional<Data>(LocalPort& port, std::int32_t messageId, const Data& payload)>;

    struct Created {
        std::shared_ptr<LocalPort> port; ///< null when no port could be made at all
        bool alreadyExisted = false;     ///< the name is taken; `port` is then a handle that gets no message
    };

    virtual ~MessagePorts() = default;
    /// Makes the port and takes its name. A name is taken while its owner lives.
    [[nodiscard]] virtual Created createLocal(const std::string& name, MessageCallback callback) = 0;
    /// Connects to the port of that name; null when there is none.
    [[nodiscard]] virtual std::shared_ptr<RemotePort> createRemote(const std::string& name) = 0;
    /// Why the latest of these two calls has made no port; empty where it has made one, or where there is
    /// simply none to connect to.
    [[nodiscard]] virtual std::string failure() const { return {}; }
};

} // namespace velmora
