// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Info/MessageSummary.h"

#include "LogMessages/LogMessage.h"

#include <algorithm>

namespace velmora {

namespace {

void count(MessageSummary::Count& counted, const LoggedMessage& message) {
    if (counted.messages++ == 0) {
        counted.firstNumber = message.number;
        counted.firstOffset = message.offset;
    }
}

} // namespace

std::optional<std::uint32_t> MessageSummary::add(const LoggedMessage& message) {
    ++_messages;
    _bytes += message.message.size();
    _first = _first ? std::min(*_first, message.time) : message.time;
    _last = _last ? std::max(*_last, message.time) : message.time;
    if (!_binary)
        return std::nullopt;
    const std::optional<LogMessage> header = LogMessage::parse(message.message.bytes());
    if (!header) {
        count(_tooShort, message);
        return std::nullopt;
    }
    if (header->prefixed)
        count(_prefixed, message);
    if (header->type != LogMessage::basebandType && header->type != LogMessage::extraType) {
        count(_wrongType, message);
        return std::nullopt;
    }
    count(_codes[header->logCode()], message);
    return header->logCode();
}

void MessageSummary::addUndecoded(const LoggedMessage& message) {
    count(_undecoded, message);
}

} // namespace velmora
