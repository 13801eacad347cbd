// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <span>
#include <vector>

namespace velmora {

/// Reads bits and seven-bit numbers as the Parquet format describes them, apart from what writes them. Past
/// the end it reads zeros and says so.
class EncodedNumbers {
public:
    explicit EncodedNumbers(std::span<const std::uint8_t> bytes) : _bytes(bytes) {}

    [[nodiscard]] bool isPastEnd() const { return _isPastEnd; }
    [[nodiscard]] std::size_t left() const { return _bytes.size() - _at; }

    std::uint8_t byte() {
        if (_at < _bytes.size())
            return _bytes[_at++];
        _isPastEnd = true;
        return 0;
    }
    std::uint64_t variable() {
        std::uint64_t value = 0;
        for (unsigned shift = 0; shift < 64; shift += 7) {
            const std::uint8_t next = byte();
            value |= static_cast<std::uint64_t>(next & 0x7F) << shift;
            if (next < 0x80)
                break;
        }
        return value;
    }
    std::int64_t zigzag() {
        const std::uint64_t value = variable();
        return static_cast<std::int64_t>(value >> 1) ^ -static_cast<std::int64_t>(value & 1);
    }
    /// So many numbers of so many bits, the lowest bit first; they end with a byte.
    std::vector<std::uint64_t> packed(std::size_t count, unsigned width) {
        std::vector<std::uint64_t> values(count);
        std::uint8_t current = 0;
        for (std::size_t bit = 0; bit < count * width; ++bit) {
            if (bit % 8 == 0)
                current = byte();
            if ((current >> (bit % 8) & 1) != 0)
                values[bit / width] |= std::uint64_t{1} << (bit % width);
        }
        return values;
    }

private:
    std::span<const std::uint8_t> _bytes;
    std::size_t _at = 0;
    bool _isPastEnd = false;
};

} // namespace velmora
