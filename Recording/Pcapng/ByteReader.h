// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <bit>
#include <cstddef>
#include <cstdint>

namespace velmora {

/// Reads numbers of one byte order out of bytes that it does not own, never past their end: such a read
/// returns 0, and `isGood` is false from then on. Check it before using what was read.
class ByteReader {
public:
    ByteReader(Bytes bytes, bool bigEndian) : _bytes(bytes), _bigEndian(bigEndian) {}

    [[nodiscard]] std::uint16_t u16(std::size_t offset) { return number<std::uint16_t>(offset); }
    [[nodiscard]] std::uint32_t u32(std::size_t offset) { return number<std::uint32_t>(offset); }
    [[nodiscard]] std::uint64_t u64(std::size_t offset) { return number<std::uint64_t>(offset); }
    [[nodiscard]] bool isGood() const { return _good; }

private:
    template <class Number>
    [[nodiscard]] Number number(std::size_t offset) {
        if (offset > _bytes.size() || sizeof(Number) > _bytes.size() - offset) {
            _good = false;
            return 0;
        }
        return numberAt<Number>(&_bytes[offset], _bigEndian ? std::endian::big : std::endian::little);
    }

    Bytes _bytes;
    bool _bigEndian;
    bool _good = true;
};

} // namespace velmora
