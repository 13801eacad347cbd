// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Fuzz/Decoders/MessageScript.h"

#include "LogMessages/LogMessage.h"

#include <algorithm>
#include <array>

namespace velmora {

namespace {

enum StepByte : std::uint8_t { Baseband, Extra, Prefixed, Raw, Redraw, Reconnect, stepBytes };

constexpr std::array<std::uint8_t, LogMessage::prefixLength> prefix = {LogMessage::prefixMarker, 0};

void putU16(std::vector<std::uint8_t>& bytes, std::size_t value) {
    bytes.push_back(static_cast<std::uint8_t>(value));
    bytes.push_back(static_cast<std::uint8_t>(value >> 8));
}

Data recordMessage(std::uint8_t kind, std::uint16_t code, Bytes payload) {
    std::vector<std::uint8_t> bytes;
    const auto type = kind == Extra ? LogMessage::extraType : LogMessage::basebandType;
    const auto header = LogMessage::header(type, code, payload.size());
    bytes.reserve(prefix.size() + header.size() + payload.size());
    if (kind == Prefixed)
        bytes.insert(bytes.end(), prefix.begin(), prefix.end());
    bytes.insert(bytes.end(), header.begin(), header.end());
    bytes.insert(bytes.end(), payload.begin(), payload.end());
    return Data(std::move(bytes));
}

/// Which of the steps makes such a record; none where only a raw message does.
std::optional<std::uint8_t> recordKind(const std::optional<LogMessage>& header) {
    if (!header || header->record.size() < LogMessage::headerLength)
        return std::nullopt;
    if (header->type == LogMessage::basebandType)
        return header->prefixed ? Prefixed : Baseband;
    if (header->type == LogMessage::extraType && !header->prefixed)
        return Extra;
    return std::nullopt;
}

} // namespace

std::uint8_t MessageScript::takeByte() {
    if (_rest.empty())
        return 0;
    const std::uint8_t byte = _rest.front();
    _rest = _rest.subspan(1);
    return byte;
}

std::uint16_t MessageScript::takeU16() {
    const std::uint8_t low = takeByte();
    return static_cast<std::uint16_t>(low | takeByte() << 8);
}

Bytes MessageScript::takeBytes() {
    const std::size_t length = takeU16();
    const Bytes bytes = _rest.first(std::min(length, _rest.size()));
    _rest = _rest.subspan(bytes.size());
    return bytes;
}

std::optional<MessageScript::Step> MessageScript::next() {
    if (_rest.empty())
        return std::nullopt;
    const auto kind = static_cast<std::uint8_t>(takeByte() % stepBytes);
    switch (kind) {
    case Redraw: return Step{Kind::Redraw, {}};
    case Reconnect: return Step{Kind::Reconnect, {}};
    case Raw: return Step{Kind::Message, Data::copyOf(takeBytes())};
    default: break;
    }
    const std::uint16_t code = takeU16();
    return Step{Kind::Message, recordMessage(kind, code, takeBytes())};
}

std::vector<std::uint8_t> MessageScript::encode(const Step& step) {
    if (step.kind != Kind::Message)
        return {step.kind == Kind::Redraw ? Redraw : Reconnect};
    std::vector<std::uint8_t> bytes;
    Bytes content = step.message.bytes();
    const std::optional<LogMessage> record = LogMessage::parse(content);
    if (const std::optional<std::uint8_t> kind = recordKind(record)) {
        bytes.push_back(*kind);
        putU16(bytes, record->code);
        content = record->payload();
    } else {
        bytes.push_back(Raw);
    }
    putU16(bytes, content.size());
    bytes.insert(bytes.end(), content.begin(), content.end());
    return bytes;
}

} // namespace velmora
