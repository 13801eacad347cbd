// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Ports/LinuxLocalPort.h"

#include "Platform/Linux/Errno.h"
#include "Platform/Linux/Ports/PeerUser.h"
#include "Platform/SystemLog.h"

#include <fcntl.h>
#include <sys/socket.h>
#include <sys/stat.h>

#include <algorithm>
#include <cerrno>
#include <utility>

namespace velmora {

namespace {

constexpr int waitingConnections = 64;
constexpr int idleChecks = 10; // within the time-out
constexpr int acceptedPerTurn = 16;
constexpr std::size_t messagesPerTurn = 256;
constexpr std::size_t bytesPerTurn = std::size_t{1} << 20;

/// Makes the socket under the name, whose lock is held, in place of one that a crashed owner has left.
Result<FileDescriptor> listenOn(const PortDirectory& directory, const std::string& name) {
    struct stat status = {};
    if (::fstatat(directory.descriptor(), name.c_str(), &status, AT_SYMLINK_NOFOLLOW) == 0) {
        if (!S_ISSOCK(status.st_mode))
            return Failure{(directory.path() / name).string() + " is there and no socket"};
        ::unlinkat(directory.descriptor(), name.c_str(), 0);
    }
    FileDescriptor socket(::socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0));
    const PortAddress address = directory.addressOf(name);
    if (!socket ||
        ::bind(socket.get(), reinterpret_cast<const sockaddr*>(&address.address), address.size) != 0 ||
        ::fchmodat(directory.descriptor(), name.c_str(), S_IRUSR | S_IWUSR, 0) != 0 ||
        ::listen(socket.get(), waitingConnections) != 0)
        return Failure{(directory.path() / name).string() + " cannot be listened on: " + errnoText(errno)};
    return socket;
}

} // namespace

Result<std::shared_ptr<LinuxLocalPort>> LinuxLocalPort::create(const std::string& name,
                                                               MessagePorts::MessageCallback callback,
                                                               const PortOptions& options,
                                                               std::shared_ptr<PortPeers> peers) {
    if (auto checked = PortDirectory::checkName(name); !checked)
        return Failure{checked.reason()};
    auto directory = options.openDirectory();
    if (!directory)
        return Failure{directory.reason()};
    auto lock = PortNameLock::take(*directory, name);
    if (!lock)
        return Failure{lock.reason()};
    if (!*lock)
        return std::shared_ptr<LinuxLocalPort>();
    auto socket = listenOn(*directory, name);
    if (!socket)
        return Failure{socket.reason()};
    return std::shared_ptr<LinuxLocalPort>(new LinuxLocalPort(name, std::move(callback), options,
                                                              std::move(peers), *std::move(directory),
                                                              **std::move(lock), *std::move(socket)));
}

LinuxLocalPort::LinuxLocalPort(std::string name, MessagePorts::MessageCallback callback, PortOptions options,
                               std::shared_ptr<PortPeers> peers, PortDirectory directory, PortNameLock lock,
                               FileDescriptor socket)
    : _name(std::move(name)),
      _callback(std::make_shared<const MessagePorts::MessageCallback>(std::move(callback))),
      _options(std::move(options)), _peers(std::move(peers)), _directory(std::move(directory)),
      _lock(std::move(lock)), _socket(std::move(socket)),
      _acceptPause([this] { _acceptWatch->setEnabled(true); }), _serve([this] { serveQueued(); }),
      _idleCheck([this] { closeIdle(); }) {}

LinuxLocalPort::~LinuxLocalPort() {
    close();
}

void LinuxLocalPort::attachToMainQueue() {
    if (isValid() && !_acceptWatch)
        _acceptWatch = std::make_unique<SocketWatch>(_socket.get(), SocketWatch::For::Reading,
                                                     [this] { acceptConnections(); });
}

void LinuxLocalPort::setInvalidationCallback(std::function<void(LocalPort&)> callback) {
    _invalidationCallback = std::move(callback);
}

void LinuxLocalPort::invalidate() {
    if (!isValid())
        return;
    const auto self = shared_from_this();
    close();
    if (const auto callback = std::exchange(_invalidationCallback, nullptr))
        callback(*this);
}

void LinuxLocalPort::close() {
    if (!isValid())
        return;
    _acceptWatch.reset();
    _acceptPause.stop();
    _serve.stop();
    _idleCheck.stop();
    _queued.clear();
    _connections.clear();
    _socket.reset();
    if (_lock->holds())
        ::unlinkat(_directory.descriptor(), _name.c_str(), 0);
    _lock.reset();
    _callback.reset();
}

void LinuxLocalPort::acceptConnections() {
    const auto self = shared_from_this();
    for (int i = 0; i < acceptedPerTurn; ++i) {
        FileDescriptor socket(::accept4(_socket.get(), nullptr, nullptr, SOCK_CLOEXEC | SOCK_NONBLOCK));
        if (socket)
            admit(std::move(socket));
        else if (!handleAcceptError(errno))
            return;
    }
}

bool LinuxLocalPort::handleAcceptError(int error) {
    switch (error) {
    case EINTR:
    case ECONNABORTED: return true;
    case EAGAIN: return false;
    case EMFILE:
    case ENFILE:
    case ENOBUFS:
    case ENOMEM:
        // The connection stays in the queue and would wake the loop without end.
        refuse("a connection: " + errnoText(error));
        _acceptWatch->setEnabled(false);
        _acceptPause.startOnce(std::chrono::seconds(1));
        return false;
    default:
        logFormat(LogPriority::Error, "Message port %s: closed: %s", _name.c_str(), errnoText(error).c_str());
        invalidate();
        return false;
    }
}

void LinuxLocalPort::admit(FileDescriptor socket) {
    if (auto checked = checkPeerUser(socket.get(), _options.peerUser); !checked)
        return refuse(checked.reason());
    if (isNearlyFull())
        closeIdle();
    if (_connections.size() >= _options.maximumConnections)
        return refuse("a connection beyond " + std::to_string(_options.maximumConnections));
    auto connection = std::make_shared<PortConnection>(std::move(socket), _peers->memory());
    _connections.push_back(connection);
    connection->setReady([this, weak = std::weak_ptr(connection)] {
        if (const auto ready = weak.lock())
            queue(ready);
    });
    if (isNearlyFull() && !_idleCheck.isRunning())
        _idleCheck.startOnce(_options.idleTimeout / idleChecks);
}

bool LinuxLocalPort::isNearlyFull() const {
    return _connections.size() >= _options.maximumConnections - _options.maximumConnections / 4;
}

void LinuxLocalPort::closeIdle() {
    const auto since = std::chrono::steady_clock::now() - _options.idleTimeout;
    const auto idle = [&](const Connection& connection) {
        return connection->lastActive() <= since && (_closesIdle || connection->isIncomplete());
    };
    // The longest idle first, and no more than needed.
    std::stable_sort(_connections.begin(), _connections.end(), [](const Connection& a, const Connection& b) {
        return a->lastActive() < b->lastActive();
    });
    const auto connections = _connections; // which drop changes
    for (const Connection& connection : connections) {
        if (!isNearlyFull())
            break;
        if (!idle(connection))
            continue;
        _peers->log().format(LogPriority::Error, "closed idle connections",
                             "Message port %s: closed a connection that is idle while %zu are open",
                             _name.c_str(), _connections.size());
        drop(connection);
    }
    if (isNearlyFull())
        _idleCheck.startOnce(_options.idleTimeout / idleChecks);
}

void LinuxLocalPort::queue(const Connection& connection) {
    connection->watchReading(false);
    if (!std::exchange(connection->queued, true))
        _queued.push_back(connection);
    if (!_serve.isRunning())
        _serve.startOnce(std::chrono::nanoseconds::zero());
}

void LinuxLocalPort::serveQueued() {
    const auto self = shared_from_this();
    Budget budget{messagesPerTurn, bytesPerTurn};
    while (!_queued.empty() && budget.messages > 0 && budget.bytes > 0) {
        const Connection connection = _queued.front();
        _queued.pop_front();
        connection->queued = false;
        switch (serve(connection, budget, self)) {
        case Served::Idle: break;
        case Served::More: queue(connection); break;
        case Served::Closed: drop(connection); break;
        case Served::PortGone: return;
        }
    }
    if (!_queued.empty())
        _serve.startOnce(std::chrono::nanoseconds::zero());
}

LinuxLocalPort::Served LinuxLocalPort::serve(const Connection& connection, Budget& budget,
                                             const std::shared_ptr<LinuxLocalPort>& self) {
    const auto malformed = [this](const std::string& reason) {
        _peers->log().format(LogPriority::Error, "closed connections",
                             "Message port %s: closed a connection: %s", _name.c_str(), reason.c_str());
        return Served::Closed;
    };
    while (budget.messages > 0 && budget.bytes > 0) {
        if (connection->hasReplyBacklog())
            return Served::Idle; // comes back once its replies are taken
        auto next = connection->next();
        if (!next)
            return malformed(next.reason());
        if (const auto& frame = *next) {
            if (frame->kind == FrameKind::Reply)
                return malformed("a reply, wanted a request or a one-way message");
            --budget.messages;
            deliver(*connection, *frame);
            // The callback may have closed the port, or this function may hold the last reference to it.
            if (!isValid() || self.use_count() == 1)
                return Served::PortGone;
            continue;
        }
        const auto read = connection->read();
        if (read.outcome == FrameReader::Outcome::Ended)
            return Served::Closed;
        if (read.outcome == FrameReader::Outcome::WouldBlock) {
            connection->watchReading(true);
            return Served::Idle;
        }
        budget.bytes -= std::min(budget.bytes, read.count);
    }
    return Served::More;
}

void LinuxLocalPort::deliver(PortConnection& connection, const Frame& frame) {
    const auto callback = _callback; // outlives a callback that closes the port
    auto answer = (*callback)(*this, frame.messageId, frame.payload);
    if (frame.kind != FrameKind::Request || !isValid())
        return;
    Frame reply{FrameKind::Reply, answer.has_value(), frame.messageId, frame.serial, Data()};
    if (answer && answer->size() > maximumFramePayload) {
        _peers->log().format(LogPriority::Error, "replies that are too long",
                             "Message port %s: a reply of %zu bytes, wanted at most %zu", _name.c_str(),
                             answer->size(), maximumFramePayload);
        reply.hasData = false;
    } else if (answer) {
        reply.payload = *std::move(answer);
    }
    connection.send(reply);
}

void LinuxLocalPort::refuse(const std::string& reason) {
    _peers->log().format(LogPriority::Error, "refused connections", "Message port %s: refused %s",
                         _name.c_str(), reason.c_str());
}

void LinuxLocalPort::drop(const Connection& connection) {
    std::erase(_queued, connection);
    std::erase(_connections, connection);
}

} // namespace velmora
