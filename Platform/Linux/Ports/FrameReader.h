// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Ports/Frame.h"
#include "Platform/Linux/Ports/FrameMemory.h"

#include <functional>
#include <memory>
#include <optional>
#include <vector>

namespace velmora {

/// Assembles frames from the bytes of a stream socket, however these were split in transit. Its memory grows
/// with the bytes that have arrived, never with the length in a header, and is at most one frame and one
/// read. Main thread only.
class FrameReader {
public:
    enum class Outcome { Some, WouldBlock, Ended };
    struct Read {
        Outcome outcome = Outcome::WouldBlock;
        std::size_t count = 0; ///< bytes that were read
    };

    /// A reader whose memory has no other limit.
    FrameReader() = default;
    /// A reader that shares `memory` with others. Where it has to give up its frame for one of them,
    /// `hasGivenUp` is called, from inside that reader's call.
    FrameReader(std::shared_ptr<FrameMemory> memory, std::function<void()> hasGivenUp);
    ~FrameReader();
    FrameReader(const FrameReader&) = delete;
    FrameReader& operator=(const FrameReader&) = delete;

    /// Reads once from the non-blocking socket, `maximumRead` bytes at most. A broken connection counts as
    /// ended.
    [[nodiscard]] Read readFrom(int descriptor);
    /// Takes bytes as if they had been read.
    void append(Bytes bytes);

    /// The next frame, or none while it is incomplete. An invalid header is a failure, and remains one: no
    /// frame boundary after it can be found. So is a frame that the shared memory has no room for.
    [[nodiscard]] Result<std::optional<Frame>> next();

    /// Whether a part of a frame has arrived.
    [[nodiscard]] bool hasUnfinishedFrame() const { return _begin < _buffer.size(); }
    /// Bytes of memory that the reader holds.
    [[nodiscard]] std::size_t memory() const { return _buffer.capacity(); }
    /// Frees the memory; from now on `next` is a failure.
    void giveUp();

    static constexpr std::size_t maximumRead = std::size_t{64} << 10;

private:
    /// The capacity for `size` bytes: at least that, so that bytes are not moved with every read, and no more
    /// than the frame that they belong to.
    [[nodiscard]] std::size_t capacityFor(std::size_t size) const;

    std::shared_ptr<FrameMemory> _memory;
    std::function<void()> _hasGivenUp;
    bool _gaveUp = false;
    std::vector<std::uint8_t> _buffer; ///< what has arrived
    std::size_t _begin = 0;            ///< first byte not yet taken
};

} // namespace velmora
