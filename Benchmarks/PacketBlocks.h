// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <cstddef>
#include <cstdint>
#include <cstring>
#include <vector>

#include <unistd.h>

namespace velmora {

/// Reads a recording's blocks and checks them, with as little work as that can take. Lower bounds are made of
/// it: it knows the one form that recordings are written in (little-endian, Enhanced Packet Blocks of
/// nanoseconds).
class PacketBlocks {
public:
    /// A block of one message.
    struct Packet {
        std::uint64_t time_ns; ///< since 1970
        Bytes message;
    };

    /// Reads to the end of the file. `take(Packet)` returns whether to go on. False where that returned
    /// false, or the file is not as recordings are written, or cannot be read.
    template <class Take>
    [[nodiscard]] bool read(int file, Take take) {
        for (;;) {
            std::size_t at = 0;
            while (_filled - at >= blockHeader) {
                const std::size_t length = u32(&_chunk[at + 4]);
                if (length < blockOverhead || length % 4 != 0 || length > largestBlock)
                    return false;
                if (_filled - at < length)
                    break;
                if (!takeBlock(Bytes(&_chunk[at], length), take))
                    return false;
                at += length;
            }
            std::memmove(_chunk.data(), &_chunk[at], _filled - at);
            _filled -= at;
            if (_filled == _chunk.size())
                _chunk.resize(2 * _chunk.size());
            const ssize_t got = ::read(file, &_chunk[_filled], _chunk.size() - _filled);
            if (got <= 0)
                return got == 0 && _filled == 0;
            _filled += static_cast<std::size_t>(got);
        }
    }

private:
    static constexpr std::uint32_t enhancedPacket = 6;
    static constexpr std::size_t blockHeader = 8;
    static constexpr std::size_t blockOverhead = 12;
    static constexpr std::size_t packetHeader = 28;
    static constexpr std::size_t largestBlock = std::size_t{17} << 20;
    static constexpr std::size_t chunkSize = std::size_t{1} << 20;

    static std::uint32_t u32(const std::uint8_t* bytes) {
        return numberAt<std::uint32_t>(bytes, std::endian::little);
    }

    template <class Take>
    static bool takeBlock(Bytes block, Take& take) {
        const std::size_t length = block.size();
        if (u32(&block[length - 4]) != length)
            return false;
        if (u32(block.data()) != enhancedPacket)
            return true;
        if (length < packetHeader + 4)
            return false;
        const std::size_t captured = u32(&block[20]);
        if (captured > length - packetHeader - 4 || captured != u32(&block[24]))
            return false;
        const std::uint64_t time_ns = std::uint64_t{u32(&block[12])} << 32 | u32(&block[16]);
        return take(Packet{time_ns, block.subspan(packetHeader, captured)});
    }

    std::vector<std::uint8_t> _chunk = std::vector<std::uint8_t>(chunkSize);
    std::size_t _filled = 0;
};

} // namespace velmora
