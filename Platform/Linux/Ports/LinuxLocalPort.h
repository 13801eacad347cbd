// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/LoopTimer.h"
#include "Platform/Linux/Ports/PortConnection.h"
#include "Platform/Linux/Ports/PortNameLock.h"
#include "Platform/Linux/Ports/PortOptions.h"
#include "Platform/Linux/Ports/PortPeers.h"
#include "Platform/MessagePort.h"

#include <deque>
#include <memory>
#include <string>
#include <vector>

namespace velmora {

/// A local port: a listening Unix-domain socket named after the port, and the connections that it has
/// accepted.
///
/// Messages are processed in batches: at most 256 messages or a mebibyte per iteration of the event loop for
/// the port, round robin over its connections, so that no flood starves the rest of the program. Where nearly
/// as many connections are open as may be, those that ask for nothing are closed. Held by
/// shared_ptr; the callback may invalidate the port or drop the last reference, after which no message is
/// delivered any more. Destroying the port closes it without calling the invalidation callback. Main thread
/// only, on its event loop.
class LinuxLocalPort final : public LocalPort, public std::enable_shared_from_this<LinuxLocalPort> {
public:
    /// Takes the name and listens; null when the name has a live owner. The failure names the system call's
    /// error.
    static Result<std::shared_ptr<LinuxLocalPort>> create(const std::string& name,
                                                          MessagePorts::MessageCallback callback,
                                                          const PortOptions& options,
                                                          std::shared_ptr<PortPeers> peers);

    ~LinuxLocalPort() override;

    [[nodiscard]] const std::string& name() const override { return _name; }
    [[nodiscard]] bool isValid() const override { return _socket.get() >= 0; }
    void attachToMainQueue() override;
    void closeIdleConnections() override { _closesIdle = true; }
    void setInvalidationCallback(std::function<void(LocalPort&)> callback) override;
    void invalidate() override;

private:
    using Connection = std::shared_ptr<PortConnection>;
    struct Budget {
        std::size_t messages;
        std::size_t bytes;
    };
    enum class Served { Idle, More, Closed, PortGone };

    LinuxLocalPort(std::string name, MessagePorts::MessageCallback callback, PortOptions options,
                   std::shared_ptr<PortPeers> peers, PortDirectory directory, PortNameLock lock,
                   FileDescriptor socket);

    void acceptConnections();
    /// Handles accept(2)'s error; true when it can be called again immediately.
    bool handleAcceptError(int error);
    void admit(FileDescriptor socket);
    /// Whether so many connections are open that none may stay without a purpose.
    [[nodiscard]] bool isNearlyFull() const;
    void closeIdle();
    void queue(const Connection& connection);
    void serveQueued();
    Served serve(const Connection& connection, Budget& budget, const std::shared_ptr<LinuxLocalPort>& self);
    void deliver(PortConnection& connection, const Frame& frame);
    void refuse(const std::string& reason);
    void drop(const Connection& connection);
    void close();

    std::string _name;
    std::shared_ptr<const MessagePorts::MessageCallback> _callback;
    std::function<void(LocalPort&)> _invalidationCallback;
    PortOptions _options;
    std::shared_ptr<PortPeers> _peers;
    PortDirectory _directory;
    std::optional<PortNameLock> _lock;
    FileDescriptor _socket;
    std::unique_ptr<SocketWatch> _acceptWatch; ///< null until the port is attached
    LoopTimer _acceptPause;
    LoopTimer _serve;
    LoopTimer _idleCheck;
    bool _closesIdle = false;
    std::vector<Connection> _connections;
    std::deque<Connection> _queued; ///< those that may have something to read, in round-robin order
};

} // namespace velmora
