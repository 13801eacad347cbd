// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Ports/PortConnection.h"

namespace velmora {

namespace {

constexpr std::size_t maximumWaitingReplies = 64;
constexpr std::size_t maximumWaitingBytes = std::size_t{1} << 20;

} // namespace

PortConnection::PortConnection(FileDescriptor socket, std::shared_ptr<FrameMemory> memory)
    : _socket(std::move(socket)), _reader(std::move(memory), [this] { becomeReady(); }),
      _readWatch(std::make_unique<SocketWatch>(_socket.get(), SocketWatch::For::Reading,
                                               [this] { becomeReady(); })) {}

Result<std::optional<Frame>> PortConnection::next() {
    auto frame = _reader.next();
    if (frame && *frame) {
        _hasSent = true;
        _lastActive = std::chrono::steady_clock::now();
    }
    return frame;
}

FrameReader::Read PortConnection::read() {
    if (_broken)
        return {FrameReader::Outcome::Ended, 0};
    return _reader.readFrom(_socket.get());
}

void PortConnection::send(const Frame& frame) {
    _replies.pushUnbounded(frame); // the port makes no reply for a clogged connection
    flush();
}

bool PortConnection::hasReplyBacklog() const {
    return !_broken && (_replies.size() >= maximumWaitingReplies || _replies.bytes() >= maximumWaitingBytes);
}

void PortConnection::becomeReady() {
    // A copy, as the port may let go of the connection meanwhile.
    const auto ready = _ready;
    ready();
}

void PortConnection::flush() {
    const bool wasClogged = hasReplyBacklog();
    const auto flushed = _replies.flush(_socket.get());
    _broken = flushed == FrameQueue::Flushed::Broken;
    const bool waiting = !_broken && flushed != FrameQueue::Flushed::All;
    if (waiting && !_writeWatch)
        _writeWatch =
            std::make_unique<SocketWatch>(_socket.get(), SocketWatch::For::Writing, [this] { flush(); });
    else if (_writeWatch)
        _writeWatch->setEnabled(waiting);
    if (_broken || (wasClogged && !hasReplyBacklog()))
        becomeReady();
}

} // namespace velmora
