// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogMessages/LogMessage.h"
#include "Platform/Bytes.h"

#include <bit>
#include <cstdint>
#include <cstdio>
#include <cstring>
#include <vector>

#include <fcntl.h>
#include <unistd.h>

// What decoding cannot cost less than: reads a recording, checks its blocks, frames every message as a log
// record and copies that into a buffer that is used again. It knows the one form that recordings are written
// in (little-endian, Enhanced Packet Blocks) and shows nothing, but that what it prints depends on all of it.

namespace velmora {
namespace {

constexpr std::uint32_t enhancedPacket = 6;
constexpr std::size_t blockHeader = 8;
constexpr std::size_t blockOverhead = 12;
constexpr std::size_t packetHeader = 28;
constexpr std::size_t largestBlock = std::size_t{17} << 20;
constexpr std::size_t chunkSize = std::size_t{1} << 20;

std::uint32_t u32(const std::uint8_t* bytes) {
    std::uint32_t value = 0;
    std::memcpy(&value, bytes, sizeof value);
    return value;
}

struct Totals {
    std::uint64_t messages = 0;
    std::uint64_t records = 0;
    std::uint64_t bytes = 0;
    std::uint64_t codes = 0; ///< sum of the log codes
};

class Floor {
public:
    /// Reads to the end of the file; false where it is not as recordings are written, or cannot be read.
    bool run(int file) {
        for (;;) {
            std::size_t at = 0;
            while (_filled - at >= blockHeader) {
                const std::size_t length = u32(&_chunk[at + 4]);
                if (length < blockOverhead || length % 4 != 0 || length > largestBlock)
                    return false;
                if (_filled - at < length)
                    break;
                if (!take(Bytes(&_chunk[at], length)))
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

    [[nodiscard]] const Totals& totals() const { return _totals; }

private:
    bool take(Bytes block) {
        const std::size_t length = block.size();
        if (u32(&block[length - 4]) != length)
            return false;
        const std::uint32_t type = u32(block.data());
        if (type != enhancedPacket)
            return true;
        if (length < packetHeader + 4)
            return false;
        const std::size_t captured = u32(&block[20]);
        if (captured > length - packetHeader - 4 || captured != u32(&block[24]))
            return false;
        ++_totals.messages;
        frame(block.subspan(packetHeader, captured));
        return true;
    }

    void frame(Bytes message) {
        const auto parsed = LogMessage::parse(message);
        if (!parsed)
            return;
        const Bytes record = parsed->record;
        if (record.size() > _record.size())
            _record.resize(record.size());
        std::memcpy(_record.data(), record.data(), record.size());
        ++_totals.records;
        _totals.bytes += record.size();
        _totals.codes += numberAt<std::uint16_t>(&_record[LogMessage::codeOffset], std::endian::little);
    }

    std::vector<std::uint8_t> _chunk = std::vector<std::uint8_t>(chunkSize);
    std::size_t _filled = 0;
    std::vector<std::uint8_t> _record = std::vector<std::uint8_t>(4096);
    Totals _totals;
};

int run(int count, char** arguments) {
    if (count != 2) {
        std::fputs("usage: floor FILE\n", stderr);
        return 2;
    }
    const int file = ::open(arguments[1], O_RDONLY | O_CLOEXEC);
    Floor floor;
    if (file < 0 || !floor.run(file)) {
        std::fprintf(stderr, "floor: %s: not readable as a recording of ours\n", arguments[1]);
        return 1;
    }
    ::close(file);
    const Totals& totals = floor.totals();
    std::printf("%llu messages, %llu records, %llu bytes, codes %llu\n",
                static_cast<unsigned long long>(totals.messages),
                static_cast<unsigned long long>(totals.records),
                static_cast<unsigned long long>(totals.bytes), static_cast<unsigned long long>(totals.codes));
    return 0;
}

} // namespace
} // namespace velmora

int main(int count, char** arguments) {
    return velmora::run(count, arguments);
}
