// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogMessages/Record.h"

#include <cstddef>
#include <cstdint>

namespace velmora {

/// Where a field lies in its record or entry, and how its bits are read. Made by the functions below; the
/// default is for a value that a section computes.
struct Place {
    std::uint16_t offset = 0; ///< of the byte that holds the lowest bit (of the first byte, big-endian)
    std::uint8_t bit = 0;     ///< the lowest bit's number in that byte
    std::uint8_t width = 0;   ///< in bits; 0 for a computed value
    bool isSigned = false;    ///< two's complement; whole bytes only
    bool isBigEndian = false; ///< 16-bit only

    [[nodiscard]] constexpr bool isComputed() const { return width == 0; }
    /// The first offset past the field.
    [[nodiscard]] constexpr std::size_t end() const { return offset + (bit + width + 7u) / 8u; }
    /// Preconditions: it is not computed, and the record reaches to `end()`.
    [[nodiscard]] std::int64_t read(const Record& record) const {
        if (isBigEndian)
            return record.u16BigEndian(offset);
        if (bit == 0) {
            switch (width) {
            case 8: return isSigned ? std::int64_t{record.i8(offset)} : record.u8(offset);
            case 16: return isSigned ? std::int64_t{record.i16(offset)} : record.u16(offset);
            case 32: return isSigned ? std::int64_t{record.i32(offset)} : record.u32(offset);
            default: break;
            }
        }
        return record.bits(offset, bit, width);
    }
};

/// For a value that is not in the record as it is shown.
inline constexpr Place computed{};

consteval Place u8At(std::uint16_t offset) {
    return {offset, 0, 8, false, false};
}
consteval Place i8At(std::uint16_t offset) {
    return {offset, 0, 8, true, false};
}
consteval Place u16At(std::uint16_t offset) {
    return {offset, 0, 16, false, false};
}
consteval Place i16At(std::uint16_t offset) {
    return {offset, 0, 16, true, false};
}
consteval Place u32At(std::uint16_t offset) {
    return {offset, 0, 32, false, false};
}
consteval Place i32At(std::uint16_t offset) {
    return {offset, 0, 32, true, false};
}
consteval Place u16BigEndianAt(std::uint16_t offset) {
    return {offset, 0, 16, false, true};
}
consteval Place bitsAt(std::uint16_t byte, std::uint8_t bit, std::uint8_t width) {
    if (bit > 7 || width < 1 || bit + width > 32 || width > 25)
        throw "a bit field that the record cannot read";
    return {byte, bit, width, false, false};
}

} // namespace velmora
