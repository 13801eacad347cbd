// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/RecordBuilder.h"

#include "LogMessages/LogMessage.h"
#include "LogMessages/RecordTime.h"

#include <algorithm>
#include <utility>

namespace velmora {
RecordBuilder::RecordBuilder(std::uint16_t code, std::size_t length)
    : _type(LogMessage::basebandType), _code(code), _bytes(std::max(length, LogMessage::headerLength)) {}

RecordBuilder::RecordBuilder(std::uint32_t extraCode, Bytes payload)
    : _type(LogMessage::extraType), _code(static_cast<std::uint16_t>(extraCode - LogMessage::firstExtraCode)),
      _bytes(LogMessage::headerLength + payload.size()) {
    std::copy_backward(payload.begin(), payload.end(), _bytes.end());
}

std::uint32_t RecordBuilder::code() const {
    return (_type == LogMessage::extraType ? LogMessage::firstExtraCode : 0) + _code;
}

RecordBuilder& RecordBuilder::cutTo(std::size_t length) {
    _bytes.resize(std::clamp(length, LogMessage::headerLength, _bytes.size()));
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
    const std::size_t payloadLength = _bytes.size() - LogMessage::headerLength;
    const auto header = LogMessage::header(_type, _code, payloadLength, recordTimestamp(moment));
    std::vector<std::uint8_t> bytes = _bytes;
    std::copy(header.begin(), header.end(), bytes.begin());
    return Data(std::move(bytes));
}

} // namespace velmora
