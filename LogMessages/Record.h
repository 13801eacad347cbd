// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <bit>
#include <cstddef>
#include <cstdint>
#include <stdexcept>

namespace velmora {

/// Raised by the view of a counted list for an entry at or beyond its count.
class ArrayOutOfBoundsException : public std::exception {
public:
    [[nodiscard]] const char* what() const noexcept override { return "array index out of bounds"; }
};

/// The bytes of one log record (or of one entry in it), read by offset. Multi-byte fields are little-endian
/// unless the name says otherwise. Non-owning.
///
/// Precondition of every read: the field lies inside the record. Sections ensure that by their minimum
/// length; a read outside is a programming error and throws std::out_of_range before any byte is read.
class Record {
public:
    explicit Record(Bytes bytes) : _bytes(bytes) {}
    explicit Record(const Data& data) : _bytes(data.bytes()) {}

    [[nodiscard]] std::size_t size() const { return _bytes.size(); }
    [[nodiscard]] Bytes bytes() const { return _bytes; }
    [[nodiscard]] bool has(std::size_t offset, std::size_t length) const {
        return offset <= size() && length <= size() - offset;
    }
    /// The entry of `length` bytes at `offset`, as a record of its own.
    [[nodiscard]] Record part(std::size_t offset, std::size_t length) const {
        expect(offset, length);
        return Record(_bytes.subspan(offset, length));
    }

    [[nodiscard]] std::uint8_t u8(std::size_t offset) const {
        expect(offset, 1);
        return _bytes[offset];
    }
    [[nodiscard]] std::int8_t i8(std::size_t offset) const { return static_cast<std::int8_t>(u8(offset)); }
    [[nodiscard]] std::uint16_t u16(std::size_t offset) const {
        expect(offset, 2);
        return numberAt<std::uint16_t>(&_bytes[offset], std::endian::little);
    }
    [[nodiscard]] std::int16_t i16(std::size_t offset) const {
        return static_cast<std::int16_t>(u16(offset));
    }
    [[nodiscard]] std::uint32_t u32(std::size_t offset) const {
        expect(offset, 4);
        return numberAt<std::uint32_t>(&_bytes[offset], std::endian::little);
    }
    [[nodiscard]] std::int32_t i32(std::size_t offset) const {
        return static_cast<std::int32_t>(u32(offset));
    }
    [[nodiscard]] std::uint64_t u64(std::size_t offset) const {
        expect(offset, 8);
        return numberAt<std::uint64_t>(&_bytes[offset], std::endian::little);
    }
    [[nodiscard]] std::uint16_t u16BigEndian(std::size_t offset) const {
        return static_cast<std::uint16_t>(u8(offset) << 8 | u8(offset + 1));
    }

    /// `width` bits (1 to 25) from bit `bit` (0 to 7, 0 the least significant) of byte `byte` on; a field
    /// that runs on into the next byte continues with that byte's bit 0.
    [[nodiscard]] std::uint32_t bits(std::size_t byte, unsigned bit, unsigned width) const {
        const std::uint32_t raw = littleEndian(byte, (bit + width + 7) / 8);
        return raw >> bit & ((std::uint32_t{1} << width) - 1);
    }

private:
    void expect(std::size_t offset, std::size_t length) const {
        if (!has(offset, length))
            throw std::out_of_range("a field lies outside its record");
    }
    /// Up to four bytes as one number.
    [[nodiscard]] std::uint32_t littleEndian(std::size_t offset, std::size_t length) const {
        expect(offset, length);
        std::uint32_t value = 0;
        for (std::size_t i = length; i > 0; --i)
            value = value << 8 | _bytes[offset + i - 1];
        return value;
    }

    Bytes _bytes;
};

/// The entries of a counted list: entry i lies `stride` bytes times i after `first` and is `entryLength`
/// bytes long (which may exceed the stride, where entries overlap).
class CountedList {
public:
    CountedList(const Record& record, std::size_t first, std::size_t stride, std::size_t entryLength,
                std::size_t count)
        : _record(record), _first(first), _stride(stride), _entryLength(entryLength), _count(count) {}

    /// A list whose entries are contiguous.
    CountedList(const Record& record, std::size_t first, std::size_t entryLength, std::size_t count)
        : CountedList(record, first, entryLength, entryLength, count) {}

    /// The count in the record.
    [[nodiscard]] std::size_t count() const { return _count; }

    /// Whether all of them lie inside the record, which takes no division.
    [[nodiscard]] bool isComplete() const {
        return _count == 0 || _record.has(_first + _stride * (_count - 1), _entryLength);
    }
    /// How many of them, from the first on, lie completely inside the record.
    [[nodiscard]] std::size_t completeCount() const {
        if (!_record.has(_first, _entryLength))
            return 0;
        const std::size_t fitting = 1 + (_record.size() - _first - _entryLength) / _stride;
        return fitting < _count ? fitting : _count;
    }

    /// Entry `index`. Raises ArrayOutOfBoundsException for one at or beyond the count, and for one that the
    /// record does not hold.
    [[nodiscard]] Record operator[](std::size_t index) const {
        // One that lies in the record has all before it there: that takes no division.
        const std::size_t offset = _first + _stride * index;
        if (index >= _count || !_record.has(offset, _entryLength))
            throw ArrayOutOfBoundsException();
        return Record(_record.bytes().subspan(offset, _entryLength));
    }

    /// The distance between the starts of two entries.
    [[nodiscard]] std::size_t stride() const { return _stride; }
    /// The record's bytes from the first entry to the end of the last complete one.
    [[nodiscard]] Record entries() const {
        const std::size_t count = completeCount();
        return count == 0 ? Record(Bytes()) : _record.part(_first, _stride * (count - 1) + _entryLength);
    }

private:
    Record _record;
    std::size_t _first;
    std::size_t _stride;
    std::size_t _entryLength;
    std::size_t _count;
};

} // namespace velmora
