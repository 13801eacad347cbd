// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Platform/Clock.h"

#include <cstddef>
#include <cstdint>
#include <vector>

namespace velmora {

/// Lays a log record out field by field. Offsets count from the record's first byte, as the decoders' tables
/// do, and fields are little-endian; what no field covers is zero. The record grows to hold the fields that
/// are set. The header is filled in when the message is made.
class RecordBuilder {
public:
    /// A record of the baseband's own stream, at first of `length` bytes.
    RecordBuilder(std::uint16_t code, std::size_t length);
    /// A record of the telephony service's extra stream with this payload; `extraCode` is one of ExtraCode's.
    RecordBuilder(std::uint32_t extraCode, Bytes payload);

    /// Each stores the low bits of the value and returns the builder.
    RecordBuilder& u8(std::size_t offset, std::int64_t value) { return store(offset, 1, value); }
    RecordBuilder& u16(std::size_t offset, std::int64_t value) { return store(offset, 2, value); }
    RecordBuilder& u32(std::size_t offset, std::int64_t value) { return store(offset, 4, value); }
    /// Stores `width` bits from bit `bit` (0 to 7, 0 the least significant) of byte `byte` on, as packed
    /// fields are numbered; a field that runs on into the next byte continues with that byte's bit 0. The
    /// bytes' other bits stay.
    RecordBuilder& bits(std::size_t byte, unsigned bit, unsigned width, std::int64_t value);

    /// Truncates the record to `length` bytes, header included; the header always stays complete.
    RecordBuilder& cutTo(std::size_t length);

    [[nodiscard]] std::size_t size() const { return _bytes.size(); }
    /// Its log code, 0xFF0000 added for the extra stream.
    [[nodiscard]] std::uint32_t code() const;

    /// The message: the record with its header, of this time stamp.
    [[nodiscard]] Data message(Time moment) const;

private:
    RecordBuilder& store(std::size_t offset, std::size_t width, std::int64_t value);

    std::uint8_t _type;
    std::uint16_t _code;
    std::vector<std::uint8_t> _bytes; ///< the header's are zero
};

} // namespace velmora
