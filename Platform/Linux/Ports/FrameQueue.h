// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Ports/Frame.h"

#include <cstddef>
#include <deque>

namespace velmora {

/// Frames that are queued for a stream socket. The queue is bounded: when it is full the oldest frames are
/// dropped, always complete ones and never one that is partly written.
class FrameQueue {
public:
    struct Limits {
        std::size_t messages = 65'536;
        std::size_t bytes = std::size_t{32} << 20; ///< headers included
    };
    enum class Flushed {
        All,        ///< nothing waits
        Some,       ///< one call's maximum was written; more can follow immediately
        WouldBlock, ///< the socket takes no more for now
        Broken,     ///< the connection has ended
    };

    FrameQueue() = default;
    explicit FrameQueue(Limits limits) : _limits(limits) {}

    /// Appends the frame and returns how many frames were dropped to hold the limits; the frame itself can be
    /// the oldest that is not partly written, and so be dropped. Precondition: the payload is not above the
    /// maximum.
    [[nodiscard]] std::size_t push(const Frame& frame);
    /// Appends the frame regardless of the limits. Same precondition.
    void pushUnbounded(const Frame& frame);
    /// Removes the newest frame; false when part of it is already written, so that the rest has to follow.
    bool removeNewest();

    /// Writes what the non-blocking socket takes, several frames a system call, a mebibyte or so a call.
    [[nodiscard]] Flushed flush(int descriptor);

    [[nodiscard]] bool empty() const { return _waiting.empty(); }
    [[nodiscard]] std::size_t size() const { return _waiting.size(); }
    /// Queued bytes; a partly written frame counts with its full size.
    [[nodiscard]] std::size_t bytes() const { return _bytes; }

private:
    struct Waiting {
        FrameHeaderBytes header;
        Data payload;
        [[nodiscard]] std::size_t size() const { return header.size() + payload.size(); }
    };

    /// Drops the oldest frame that is not partly written. Precondition: there is one.
    void dropOldest();
    void consume(std::size_t count);

    Limits _limits;
    std::deque<Waiting> _waiting;
    std::size_t _bytes = 0;
    std::size_t _written = 0; ///< of the oldest frame
};

} // namespace velmora
