// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Ports/FrameReader.h"

#include <sys/socket.h>

#include <algorithm>
#include <cerrno>

namespace velmora {

FrameReader::Read FrameReader::readFrom(int descriptor) {
    std::uint8_t* space = room(maximumRead);
    for (;;) {
        const auto count = ::recv(descriptor, space, maximumRead, MSG_DONTWAIT);
        if (count > 0) {
            _end += static_cast<std::size_t>(count);
            return {Outcome::Some, static_cast<std::size_t>(count)};
        }
        if (count < 0 && errno == EINTR)
            continue;
        if (count < 0 && (errno == EAGAIN || errno == EWOULDBLOCK))
            return {Outcome::WouldBlock, 0};
        return {Outcome::Ended, 0};
    }
}

void FrameReader::append(Bytes bytes) {
    std::copy(bytes.begin(), bytes.end(), room(bytes.size()));
    _end += bytes.size();
}

Result<std::optional<Frame>> FrameReader::next() {
    const Bytes waiting = Bytes(_buffer).subspan(_begin, _end - _begin);
    if (waiting.size() < frameHeaderSize)
        return std::optional<Frame>();
    auto header = decodeFrameHeader(waiting);
    if (!header)
        return Failure{header.reason()};
    if (waiting.size() - frameHeaderSize < header->payloadSize)
        return std::optional<Frame>();

    _begin += frameHeaderSize + header->payloadSize;
    Frame frame{header->kind, header->hasData, header->messageId, header->serial,
                Data::copyOf(waiting.subspan(frameHeaderSize, header->payloadSize))};
    return std::optional<Frame>(std::move(frame));
}

std::uint8_t* FrameReader::room(std::size_t size) {
    if (_begin == _end) {
        _begin = _end = 0;
        // A single large frame must not keep its memory for as long as the connection lives.
        if (_buffer.size() > 4 * maximumRead)
            std::vector<std::uint8_t>().swap(_buffer);
    }
    if (_buffer.size() - _end < size && _begin > 0) {
        std::copy(_buffer.begin() + static_cast<std::ptrdiff_t>(_begin),
                  _buffer.begin() + static_cast<std::ptrdiff_t>(_end), _buffer.begin());
        _end -= _begin;
        _begin = 0;
    }
    if (_buffer.size() - _end < size)
        _buffer.resize(std::max(2 * _end, _end + size));
    return _buffer.data() + _end;
}

} // namespace velmora
