// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Ports/Frame.h"

#include <optional>
#include <vector>

namespace velmora {

/// Assembles frames from the bytes of a stream socket, however these were split in transit. Its memory grows
/// with the bytes that have arrived, never with the length in a header, and is at most one frame and one
/// read.
class FrameReader {
public:
    enum class Outcome { Some, WouldBlock, Ended };
    struct Read {
        Outcome outcome = Outcome::WouldBlock;
        std::size_t count = 0; ///< bytes that were read
    };

    /// Reads once from the non-blocking socket, `maximumRead` bytes at most. A broken connection counts as
    /// ended.
    [[nodiscard]] Read readFrom(int descriptor);
    /// Takes bytes as if they had been read.
    void append(Bytes bytes);

    /// The next frame, or none while it is incomplete. An invalid header is a failure, and remains one: no
    /// frame boundary after it can be found.
    [[nodiscard]] Result<std::optional<Frame>> next();

    /// Bytes of memory that the reader holds.
    [[nodiscard]] std::size_t memory() const { return _buffer.capacity(); }

    static constexpr std::size_t maximumRead = std::size_t{64} << 10;

private:
    /// Room for `size` bytes after those that have not been taken.
    std::uint8_t* room(std::size_t size);

    std::vector<std::uint8_t> _buffer;
    std::size_t _begin = 0; ///< first byte not yet taken
    std::size_t _end = 0;   ///< first byte not yet filled
};

} // namespace velmora
