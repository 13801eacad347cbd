// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <vector>

namespace velmora {

/// Appends numbers of a fixed width in bits, the lowest bit first, without gaps.
class BitPacker {
public:
    explicit BitPacker(std::vector<std::uint8_t>& out) : _out(out) {}

    /// Precondition: the value fits in `width` bits, at most 64.
    void put(std::uint64_t value, unsigned width) {
        if (_bits == 0 && width % 8 == 0) { // whole bytes, as most are
            for (; width > 0; width -= 8, value >>= 8)
                _out.push_back(static_cast<std::uint8_t>(value));
            return;
        }
        _pending |= static_cast<Wide>(value) << _bits;
        _bits += width;
        while (_bits >= 8) {
            _out.push_back(static_cast<std::uint8_t>(_pending));
            _pending >>= 8;
            _bits -= 8;
        }
    }
    /// Fills the last byte with zeros.
    void finish() {
        if (_bits > 0)
            _out.push_back(static_cast<std::uint8_t>(_pending));
        _pending = 0;
        _bits = 0;
    }

private:
    __extension__ using Wide = unsigned __int128;

    std::vector<std::uint8_t>& _out;
    Wide _pending = 0;
    unsigned _bits = 0;
};

/// A number of seven bits a byte, the lowest first; the top bit says that another follows (ULEB128).
inline void appendVariable(std::vector<std::uint8_t>& out, std::uint64_t value) {
    for (; value >= 0x80; value >>= 7)
        out.push_back(static_cast<std::uint8_t>(value | 0x80));
    out.push_back(static_cast<std::uint8_t>(value));
}

/// Little-endian.
template <class Number>
void appendFixed(std::vector<std::uint8_t>& out, Number value) {
    std::array<std::uint8_t, sizeof value> bytes{};
    for (std::size_t i = 0; i < bytes.size(); ++i)
        bytes[i] = static_cast<std::uint8_t>(value >> (8 * i));
    out.insert(out.end(), bytes.begin(), bytes.end());
}

} // namespace velmora
