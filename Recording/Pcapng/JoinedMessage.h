// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Recording/Pcapng/BlockReader.h"

#include <cstddef>
#include <cstdint>
#include <vector>

namespace velmora {

/// A message of several blocks: a packet with its first part, and blocks with the others (see
/// pcapng::longestPart). Copies what it is given.
class JoinedMessage {
public:
    using Block = BlockReader::Block;

    /// Whether a packet of that many of a message's bytes is the first part of such a message.
    [[nodiscard]] static bool hasParts(std::uint32_t captured, std::uint32_t original);

    /// `first`: the part in the packet. Precondition: it has further parts.
    JoinedMessage(const Block& packet, Bytes first, std::uint32_t original);

    /// Adds a block if it is the message's next part; otherwise nothing.
    [[nodiscard]] bool add(const Block& block);
    [[nodiscard]] bool isComplete() const { return _message.size() == _original; }

    /// The message, once.
    [[nodiscard]] Data takeMessage() { return Data(std::move(_message)); }
    /// The packet's block with the bytes of all blocks.
    [[nodiscard]] const Block& block();

private:
    std::size_t _original;
    std::vector<std::uint8_t> _message;
    std::vector<std::uint8_t> _bytes;
    Block _block;
};

} // namespace velmora
