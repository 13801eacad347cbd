// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Ports/FrameQueue.h"

#include <sys/socket.h>
#include <sys/uio.h>

#include <algorithm>
#include <array>
#include <cerrno>

namespace velmora {

namespace {

constexpr std::size_t maximumFlush = std::size_t{1} << 20;
constexpr std::size_t piecesPerCall = 256;

/// What is left of a piece whose first `skipped` bytes are written; takes those off `skipped`.
iovec restOfBuffer(Bytes piece, std::size_t& skipped) {
    const std::size_t skip = std::min(skipped, piece.size());
    skipped -= skip;
    const Bytes rest = piece.subspan(skip);
    // The interface lacks a const; sending does not change the bytes.
    return {const_cast<std::uint8_t*>(rest.data()), rest.size()};
}

} // namespace

std::size_t FrameQueue::push(const Frame& frame) {
    pushUnbounded(frame);
    std::size_t dropped = 0;
    while (_waiting.size() > _limits.messages || _bytes > _limits.bytes) {
        if (_waiting.size() == 1 && _written > 0)
            break;
        dropOldest();
        ++dropped;
        if (_waiting.empty())
            break;
    }
    return dropped;
}

void FrameQueue::pushUnbounded(const Frame& frame) {
    _waiting.push_back({encodeFrameHeader(frame), frame.payload});
    _bytes += _waiting.back().size();
}

bool FrameQueue::removeNewest() {
    if (_waiting.empty() || (_waiting.size() == 1 && _written > 0))
        return false;
    _bytes -= _waiting.back().size();
    _waiting.pop_back();
    return true;
}

void FrameQueue::dropOldest() {
    const auto oldest = _waiting.begin() + (_written > 0 ? 1 : 0);
    _bytes -= oldest->size();
    _waiting.erase(oldest);
}

void FrameQueue::consume(std::size_t count) {
    _written += count;
    while (!_waiting.empty() && _written >= _waiting.front().size()) {
        _written -= _waiting.front().size();
        _bytes -= _waiting.front().size();
        _waiting.pop_front();
    }
}

FrameQueue::Flushed FrameQueue::flush(int descriptor) {
    std::size_t total = 0;
    while (!_waiting.empty()) {
        if (total >= maximumFlush)
            return Flushed::Some;
        std::array<iovec, piecesPerCall> pieces;
        std::size_t count = 0;
        std::size_t bytes = 0;
        std::size_t skipped = _written;
        for (const Waiting& waiting : _waiting) {
            if (count + 2 > pieces.size() || bytes >= maximumFlush)
                break;
            for (const Bytes piece : {Bytes(waiting.header), waiting.payload.bytes()}) {
                pieces[count] = restOfBuffer(piece, skipped);
                bytes += pieces[count].iov_len;
                if (pieces[count].iov_len > 0)
                    ++count;
            }
        }
        msghdr message = {};
        message.msg_iov = pieces.data();
        message.msg_iovlen = count;
        const auto written = ::sendmsg(descriptor, &message, MSG_NOSIGNAL | MSG_DONTWAIT);
        if (written >= 0) {
            total += static_cast<std::size_t>(written);
            consume(static_cast<std::size_t>(written));
        } else if (errno == EAGAIN || errno == EWOULDBLOCK) {
            return Flushed::WouldBlock;
        } else if (errno != EINTR) {
            return Flushed::Broken;
        }
    }
    return Flushed::All;
}

} // namespace velmora
