// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/UnusualMessages.h"

#include "LogMessages/LogMessage.h"

#include <vector>

namespace velmora {
namespace {

std::vector<std::uint8_t> bytesOf(const Data& message) {
    return {message.bytes().begin(), message.bytes().end()};
}

} // namespace

std::optional<Data> unusualMessage(UnusualMessage damage, const UnusualMessageParts& material, Time moment) {
    switch (damage) {
    case UnusualMessage::Truncated: {
        std::vector<std::uint8_t> bytes = bytesOf(material.good.message(moment));
        bytes.resize(5);
        return Data(std::move(bytes));
    }
    case UnusualMessage::WrongType: {
        std::vector<std::uint8_t> bytes = bytesOf(material.good.message(moment));
        bytes[0] = 2;
        return Data(std::move(bytes));
    }
    case UnusualMessage::BelowMinimum: return material.belowMinimum.message(moment);
    case UnusualMessage::Prefixed: {
        std::vector<std::uint8_t> bytes = bytesOf(material.good.message(moment));
        bytes.insert(bytes.begin(), {LogMessage::prefixMarker, 0});
        return Data(std::move(bytes));
    }
    case UnusualMessage::CountOverrun:
        if (!material.overrun)
            return std::nullopt;
        return material.overrun->message(moment);
    case UnusualMessage::UnknownCode:
        return RecordBuilder(0x1375, 24).u32(LogMessage::headerLength, material.noise).message(moment);
    }
    return std::nullopt;
}

} // namespace velmora
