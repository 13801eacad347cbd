// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Ports/Frame.h"

#include <optional>
#include <vector>

namespace velmora {

/// Puts frames together from the bytes of a stream socket, however they were cut on the way. What it holds
/// grows with the bytes that have arrived, never with what a header announces, and is at most one frame and
/// one read.
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

    /// The next frame, or none while it has not arrived whole. A header that cannot be is a failure, and
    /// stays one: nothing after it can be told apart.
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
