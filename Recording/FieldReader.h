#pragma once

#include "Platform/Bytes.h"

#include <cstddef>
#include <cstdint>

namespace velmora {

/// Reads numbers of one byte order out of bytes that somebody else owns, never past their end: such a read
/// gives 0, and `isGood` is false from then on. Ask before what was read is believed.
class FieldReader {
public:
    FieldReader(Bytes bytes, bool bigEndian) : _bytes(bytes), _bigEndian(bigEndian) {}

    [[nodiscard]] std::uint16_t u16(std::size_t offset) { return number<std::uint16_t, 2>(offset); }
    [[nodiscard]] std::uint32_t u32(std::size_t offset) { return number<std::uint32_t, 4>(offset); }
    [[nodiscard]] std::uint64_t u64(std::size_t offset) { return number<std::uint64_t, 8>(offset); }
    [[nodiscard]] bool isGood() const { return _good; }

private:
    template <class Number, std::size_t width>
    [[nodiscard]] Number number(std::size_t offset) {
        if (offset > _bytes.size() || width > _bytes.size() - offset) {
            _good = false;
            return 0;
        }
        const auto bytes = _bytes.subspan(offset).template first<width>();
        std::uint64_t value = 0;
        // Two loops, each of which compilers turn into one load.
        if (_bigEndian) {
            for (std::size_t i = 0; i < width; ++i)
                value |= std::uint64_t{bytes[i]} << 8 * (width - 1 - i);
        } else {
            for (std::size_t i = 0; i < width; ++i)
                value |= std::uint64_t{bytes[i]} << 8 * i;
        }
        return static_cast<Number>(value);
    }

    Bytes _bytes;
    bool _bigEndian;
    bool _good = true;
};

} // namespace velmora
