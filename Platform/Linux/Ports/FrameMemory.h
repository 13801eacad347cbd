// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <vector>

namespace velmora {

class FrameReader;

/// What the unfinished frames of several connections may take together. Where a connection needs more than is
/// left, the connection that holds the most loses its frame: so connections that hoard memory never keep one
/// with a small frame from being served. Main thread only.
class FrameMemory {
public:
    static constexpr std::size_t defaultLimit = std::size_t{64} << 20;

    explicit FrameMemory(std::size_t limit = defaultLimit) : _limit(limit) {}
    FrameMemory(const FrameMemory&) = delete;
    FrameMemory& operator=(const FrameMemory&) = delete;

    [[nodiscard]] std::size_t limit() const { return _limit; }
    /// Bytes that all readers hold.
    [[nodiscard]] std::size_t held() const;

    /// Makes sure that `reader` can move to a buffer of `size` bytes within the limit, at the cost of readers
    /// that hold more than that. False when there is none: then `reader` itself is the one that has to give
    /// up.
    [[nodiscard]] bool makeRoom(const FrameReader& reader, std::size_t size);

private:
    friend class FrameReader; // which enters and leaves the list

    std::size_t _limit;
    std::vector<FrameReader*> _readers;
};

} // namespace velmora
