// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Ports/LinuxRemotePort.h"

#include "Platform/Linux/Errno.h"
#include "Platform/Linux/Ports/PeerUser.h"
#include "Platform/Linux/Ports/SocketWait.h"
#include "Platform/SystemLog.h"

#include <fcntl.h>
#include <poll.h>
#include <sys/socket.h>
#include <sys/time.h>

#include <algorithm>
#include <cerrno>
#include <cinttypes>
#include <thread>
#include <utility>

namespace velmora {

namespace {

using SteadyClock = std::chrono::steady_clock;

/// Messages, or bytes, that wait before `post` writes without waiting for the event loop.
constexpr std::size_t batchMessages = 64;
constexpr std::size_t batchBytes = std::size_t{128} << 10;
constexpr auto restartPollInterval = std::chrono::milliseconds(10);

/// 0, or the errno value.
int connectTo(const PortAddress& address, int descriptor) {
    while (::connect(descriptor, reinterpret_cast<const sockaddr*>(&address.address), address.size) != 0)
        if (errno != EINTR)
            return errno;
    return 0;
}

} // namespace

Result<std::shared_ptr<LinuxRemotePort>> LinuxRemotePort::connect(const std::string& name,
                                                                  const PortOptions& options,
                                                                  std::shared_ptr<PortPeers> peers) {
    if (auto checked = PortDirectory::checkName(name); !checked)
        return Failure{checked.reason()};
    auto directory = options.openDirectory();
    if (!directory)
        return Failure{directory.reason()};
    FileDescriptor socket(::socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC, 0));
    if (!socket)
        return Failure{"no socket can be made: " + errnoText(errno)};

    // Connecting blocks while the peer's queue of new connections is full, for as long as sending may.
    const auto microseconds = std::chrono::ceil<std::chrono::microseconds>(options.connectTimeout).count();
    const timeval time = {microseconds / 1'000'000, microseconds % 1'000'000};
    ::setsockopt(socket.get(), SOL_SOCKET, SO_SNDTIMEO, &time, sizeof time);
    const PortAddress address = directory->addressOf(name);
    int error = connectTo(address, socket.get());
    // A socket without a listener is what a crash leaves. A new owner removes it before it makes its own.
    const auto deadline =
        deadlineAfter(error == ECONNREFUSED ? options.restartTimeout : SteadyClock::duration::zero());
    while ((error == ECONNREFUSED || error == ENOENT) && SteadyClock::now() < deadline) {
        std::this_thread::sleep_for(restartPollInterval);
        error = connectTo(address, socket.get());
    }
    if (error == ENOENT || error == ECONNREFUSED)
        return std::shared_ptr<LinuxRemotePort>();
    if (error == EAGAIN)
        return Failure{"the peer did not take the connection in time"};
    if (error != 0)
        return Failure{"cannot be connected to: " + errnoText(error)};
    if (auto checked = checkPeerUser(socket.get(), options.peerUser); !checked)
        return Failure{checked.reason()};
    if (::fcntl(socket.get(), F_SETFL, O_NONBLOCK) != 0)
        return Failure{"the socket cannot be set up: " + errnoText(errno)};
    return std::shared_ptr<LinuxRemotePort>(
        new LinuxRemotePort(name, std::move(socket), options, std::move(peers)));
}

LinuxRemotePort::LinuxRemotePort(std::string name, FileDescriptor socket, const PortOptions& options,
                                 std::shared_ptr<PortPeers> peers)
    : _name(std::move(name)), _socket(std::move(socket)), _peers(std::move(peers)),
      _reader(_peers->memory(), [this] { _gaveUp.startOnce(std::chrono::nanoseconds::zero()); }),
      _queue(options.queue), _readWatch(std::make_unique<SocketWatch>(
                                 _socket.get(), SocketWatch::For::Reading, [this] { readAvailable(); })),
      _writeWatch(std::make_unique<SocketWatch>(_socket.get(), SocketWatch::For::Writing,
                                                [this] {
                                                    _blocked = false;
                                                    flushQueue();
                                                })),
      _droppedReport([this] { reportDropped(); }), _ended([this] { callInvalidationCallback(); }),
      _gaveUp([this] { discardReplies(); }) {
    _writeWatch->setEnabled(false);
}

LinuxRemotePort::~LinuxRemotePort() {
    close();
}

bool LinuxRemotePort::isValid() const {
    if (!_socket)
        return false;
    pollfd poll = {_socket.get(), POLLRDHUP, 0};
    return ::poll(&poll, 1, 0) <= 0 || (poll.revents & (POLLHUP | POLLRDHUP | POLLERR | POLLNVAL)) == 0;
}

void LinuxRemotePort::setInvalidationCallback(std::function<void(RemotePort&)> callback) {
    _invalidationCallback = std::move(callback);
}

void LinuxRemotePort::invalidate() {
    if (!_socket)
        return;
    close();
    callInvalidationCallback();
}

void LinuxRemotePort::connectionEnded() {
    close();
    _ended.startOnce(std::chrono::nanoseconds::zero());
}

void LinuxRemotePort::close() {
    if (!_socket)
        return;
    // What was posted just before is not lost for want of a turn of the event loop.
    if (!_blocked) [[maybe_unused]]
        const auto flushed = _queue.flush(_socket.get());
    _readWatch.reset();
    _writeWatch.reset();
    _socket.reset();
    if (_unreported > 0)
        reportDropped();
    _droppedReport.stop();
    _gaveUp.stop();
}

void LinuxRemotePort::callInvalidationCallback() {
    const auto self = shared_from_this();
    if (const auto callback = std::exchange(_invalidationCallback, nullptr))
        callback(*this);
}

RemotePort::Answer LinuxRemotePort::sendRequest(std::int32_t messageId, const Data& payload,
                                                std::chrono::nanoseconds sendTimeout,
                                                std::chrono::nanoseconds receiveTimeout, bool wantsReply) {
    if (!isValid())
        return {PortStatus::Invalid, std::nullopt};
    if (payload.size() > maximumFramePayload)
        return {PortStatus::TransportError, std::nullopt};
    const std::uint32_t serial = wantsReply ? ++_lastSerial : 0;
    const Frame frame{wantsReply ? FrameKind::Request : FrameKind::OneWay, true, messageId, serial, payload};
    const auto status = sendNow(frame, deadlineAfter(sendTimeout));
    if (status != PortStatus::Success || !wantsReply)
        return {status, std::nullopt};
    return awaitReply(serial, deadlineAfter(receiveTimeout));
}

std::int32_t LinuxRemotePort::sendNow(const Frame& frame, Deadline deadline) {
    bool queued = false;
    for (;;) {
        if (!queued && _queue.empty()) {
            _queue.pushUnbounded(frame);
            queued = true;
        }
        switch (_queue.flush(_socket.get())) {
        case FrameQueue::Flushed::All:
            if (!queued)
                break;
            _blocked = false;
            _writeWatch->setEnabled(false);
            return PortStatus::Success;
        case FrameQueue::Flushed::Some: break;
        case FrameQueue::Flushed::WouldBlock:
            if (waitFor(_socket.get(), POLLOUT, deadline))
                break;
            // A frame that is partly written has to be completed; its reply will be a late one.
            if (queued)
                _queue.removeNewest();
            _blocked = true;
            _writeWatch->setEnabled(!_queue.empty());
            return PortStatus::SendTimeout;
        case FrameQueue::Flushed::Broken: connectionEnded(); return PortStatus::BecameInvalid;
        }
    }
}

RemotePort::Answer LinuxRemotePort::awaitReply(std::uint32_t serial, Deadline deadline) {
    bool late = false;
    for (;;) {
        if (auto reply = takeReply(serial)) {
            if (!reply->hasData)
                return {PortStatus::Success, std::nullopt};
            return {PortStatus::Success, std::move(reply->payload)};
        }
        if (!_socket)
            return {PortStatus::BecameInvalid, std::nullopt};
        // A peer that keeps sending other frames must not extend the time-out.
        if (late || !waitFor(_socket.get(), POLLIN, deadline))
            return {PortStatus::ReceiveTimeout, std::nullopt};
        late = SteadyClock::now() >= deadline;
        if (_reader.readFrom(_socket.get()).outcome == FrameReader::Outcome::Ended) {
            connectionEnded();
            return {PortStatus::BecameInvalid, std::nullopt};
        }
    }
}

std::optional<Frame> LinuxRemotePort::takeReply(std::uint32_t serial) {
    for (;;) {
        auto next = _reader.next();
        std::string fault;
        if (!next)
            fault = next.reason();
        else if (!*next)
            return std::nullopt;
        else if ((*next)->kind != FrameKind::Reply)
            fault = "no reply, wanted a reply";
        else if ((*next)->serial == serial)
            return *std::move(next);
        if (!fault.empty()) {
            _peers->log().format(LogPriority::Error, "closed connections",
                                 "Message port %s: closed the connection: %s", _name.c_str(), fault.c_str());
            connectionEnded();
            return std::nullopt;
        }
    }
}

void LinuxRemotePort::readAvailable() {
    if (_reader.readFrom(_socket.get()).outcome == FrameReader::Outcome::Ended)
        return connectionEnded();
    discardReplies();
}

void LinuxRemotePort::discardReplies() {
    // Outside of sendRequest no reply is expected: all are discarded, since 0 is no request's serial.
    [[maybe_unused]] const auto none = takeReply(0);
}

void LinuxRemotePort::post(std::int32_t messageId, const Data& payload) {
    if (!_socket)
        return;
    if (payload.size() > maximumFramePayload) {
        ++_dropped;
        _peers->log().format(LogPriority::Error, "dropped messages",
                             "Message port %s: dropped a message of %zu bytes, wanted at most %zu",
                             _name.c_str(), payload.size(), maximumFramePayload);
        return;
    }
    if (const auto dropped = _queue.push({FrameKind::OneWay, true, messageId, 0, payload}); dropped > 0)
        countDropped(dropped);
    if (!_blocked && (_queue.size() >= batchMessages || _queue.bytes() >= batchBytes))
        flushQueue();
    else if (_queue.size() == 1)
        _writeWatch->setEnabled(true);
}

void LinuxRemotePort::flushQueue() {
    const auto flushed = _queue.flush(_socket.get());
    if (flushed == FrameQueue::Flushed::Broken)
        return connectionEnded();
    _blocked = flushed == FrameQueue::Flushed::WouldBlock;
    _writeWatch->setEnabled(flushed != FrameQueue::Flushed::All);
}

void LinuxRemotePort::countDropped(std::uint64_t count) {
    _dropped += count;
    _unreported += count;
    if (!_droppedReport.isRunning())
        reportDropped();
}

void LinuxRemotePort::reportDropped() {
    if (_unreported == 0)
        return;
    logFormat(LogPriority::Error, "Message port %s: messages dropped because the peer is slow: %" PRIu64,
              _name.c_str(), std::exchange(_unreported, 0));
    // What is dropped meanwhile is reported after a second.
    _droppedReport.startOnce(std::chrono::seconds(1));
}

} // namespace velmora
