// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/RecordBuilder.h"

#include "LogMessages/RecordHeader.h"
#include "LogMessages/RecordTime.h"

#include <algorithm>
#include <utility>

namespace velmora {
RecordBuilder::RecordBuilder(std::uint16_t code, std::size_t length)
    : _bytes(std::max(length, headerLength)) {
    u8(0, RecordHeader::basebandType);
    u16(3, code);
}

RecordBuilder::RecordBuilder(std::uint16_t extraCode, Bytes payload) : _bytes(headerLength) {
    u8(0, RecordHeader::extraType);
    u16(3, extraCode);
    _bytes.insert(_bytes.end(), payload.begin(), payload.end());
}

RecordBuilder& RecordBuilder::cutTo(std::size_t length) {
    _bytes.resize(std::clamp(length, headerLength, _bytes.size()));
    return *this;
}

RecordBuilder& RecordBuilder::store(std::size_t offset, std::size_t width, std::int64_t value) {
    if (offset + width > _bytes.size())
        _bytes.resize(offset + width);
    for (std::size_t i = 0; i < width; ++i)
        _bytes[offset + i] = static_cast<std::uint8_t>(value >> (8 * i));
    return *this;
}

RecordBuilder& RecordBuilder::bits(std::size_t byte, unsigned bit, unsigned width, std::int64_t value) {
    if (const std::size_t end = byte + (bit + width + 7) / 8; end > _bytes.size())
        _bytes.resize(end);
    for (unsigned i = 0; i < width; ++i) {
        const unsigned mask = 1U << (bit + i) % 8;
        std::uint8_t& at = _bytes[byte + (bit + i) / 8];
        at = static_cast<std::uint8_t>(value >> i & 1 ? at | mask : at & ~mask);
    }
    return *this;
}

Data RecordBuilder::message(Time moment) const {
    RecordBuilder record = *this;
    record.u16(1, static_cast<std::int64_t>(std::min<std::size_t>(_bytes.size() - 1, 0xFFFF)));
    const std::uint64_t timestamp = recordTimestamp(moment);
    record.u32(5, static_cast<std::int64_t>(timestamp & 0xFFFFFFFF));
    record.u32(9, static_cast<std::int64_t>(timestamp >> 32));
    return Data(std::move(record._bytes));
}

} // namespace velmora
