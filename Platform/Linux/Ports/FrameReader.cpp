// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Ports/FrameReader.h"

#include <sys/socket.h>

#include <algorithm>
#include <array>
#include <cerrno>
#include <string>
#include <utility>

namespace velmora {

namespace {

/// What a reader without an unfinished frame keeps at most.
constexpr std::size_t idleMemory = 4096;

} // namespace

FrameReader::FrameReader(std::shared_ptr<FrameMemory> memory, std::function<void()> hasGivenUp)
    : _memory(std::move(memory)), _hasGivenUp(std::move(hasGivenUp)) {
    _memory->_readers.push_back(this);
}

FrameReader::~FrameReader() {
    if (_memory)
        std::erase(_memory->_readers, this);
}

FrameReader::Read FrameReader::readFrom(int descriptor) {
    // Bytes get memory of their own only once they have arrived, so that an idle connection takes none.
    static thread_local std::array<std::uint8_t, maximumRead> arrived;
    for (;;) {
        const auto count = ::recv(descriptor, arrived.data(), arrived.size(), MSG_DONTWAIT);
        if (count > 0) {
            append(Bytes(arrived).first(static_cast<std::size_t>(count)));
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
    if (_gaveUp)
        return;
    if (_begin > 0)
        _buffer.erase(_buffer.begin(),
                      _buffer.begin() + static_cast<std::ptrdiff_t>(std::exchange(_begin, 0)));
    const std::size_t size = _buffer.size() + bytes.size();
    if (size > _buffer.capacity()) {
        const std::size_t capacity = capacityFor(size);
        if (_memory && !_memory->makeRoom(*this, capacity))
            return giveUp();
        _buffer.reserve(capacity);
    }
    _buffer.insert(_buffer.end(), bytes.begin(), bytes.end());
}

std::size_t FrameReader::capacityFor(std::size_t size) const {
    const std::size_t doubled = std::max(size, 2 * _buffer.capacity());
    if (_buffer.size() < frameHeaderSize)
        return size;
    const auto header = decodeFrameHeader(_buffer);
    const std::size_t whole = header ? frameHeaderSize + header->payloadSize : 0;
    return std::max(size, std::min(doubled, whole));
}

Result<std::optional<Frame>> FrameReader::next() {
    if (_gaveUp)
        return Failure{"unfinished frames take more than " + std::to_string(_memory->limit()) +
                       " bytes, and it has the longest"};
    const Bytes waiting = Bytes(_buffer).subspan(_begin);
    if (waiting.size() < frameHeaderSize)
        return std::optional<Frame>();
    auto header = decodeFrameHeader(waiting);
    if (!header)
        return Failure{header.reason()};
    if (waiting.size() - frameHeaderSize < header->payloadSize)
        return std::optional<Frame>();

    Frame frame{header->kind, header->hasData, header->messageId, header->serial,
                Data::copyOf(waiting.subspan(frameHeaderSize, header->payloadSize))};
    _begin += frameHeaderSize + header->payloadSize;
    if (_begin == _buffer.size()) {
        _begin = 0;
        _buffer.clear();
        // A single large frame must not keep its memory for as long as the connection lives.
        if (_buffer.capacity() > idleMemory)
            std::vector<std::uint8_t>().swap(_buffer);
    }
    return std::optional<Frame>(std::move(frame));
}

void FrameReader::giveUp() {
    std::vector<std::uint8_t>().swap(_buffer);
    _begin = 0;
    if (!std::exchange(_gaveUp, true) && _hasGivenUp)
        _hasGivenUp();
}

} // namespace velmora
