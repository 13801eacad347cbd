// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Pcapng/JoinedMessage.h"

#include "Recording/MessageReader.h"
#include "Recording/Pcapng/ByteReader.h"
#include "Recording/Pcapng/Pcapng.h"

#include <algorithm>

namespace velmora {

namespace {

constexpr std::size_t partOffset = pcapng::bodyOffset + 4;

} // namespace

bool JoinedMessage::hasParts(std::uint32_t captured, std::uint32_t original) {
    return captured == pcapng::longestPart && original > captured && original <= maximumMessageSize;
}

JoinedMessage::JoinedMessage(const Block& packet, Bytes first, std::uint32_t original)
    : _original(original), _message(first.begin(), first.end()),
      _bytes(packet.bytes.begin(), packet.bytes.end()), _block(packet) {}

bool JoinedMessage::add(const Block& block) {
    if (block.type != pcapng::BlockType::MessagePart || block.bigEndian != _block.bigEndian)
        return false;
    const std::size_t size = std::min(_original - _message.size(), pcapng::longestPart);
    if (block.bytes.size() != pcapng::blockOverhead + 4 + pcapng::padded(size) ||
        ByteReader(block.bytes, block.bigEndian).u32(pcapng::bodyOffset) != _message.size())
        return false;
    const Bytes part = block.bytes.subspan(partOffset, size);
    _message.insert(_message.end(), part.begin(), part.end());
    _bytes.insert(_bytes.end(), block.bytes.begin(), block.bytes.end());
    return true;
}

const JoinedMessage::Block& JoinedMessage::block() {
    _block.bytes = _bytes;
    return _block;
}

} // namespace velmora
