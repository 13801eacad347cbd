// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogMessages/LogMessage.h"

#include <algorithm>
#include <limits>

namespace velmora {

namespace {

template <class Number>
void put(std::uint8_t* bytes, Number number) {
    for (std::size_t i = 0; i < sizeof number; ++i)
        bytes[i] = static_cast<std::uint8_t>(number >> (8 * i));
}

} // namespace

std::array<std::uint8_t, LogMessage::headerLength> LogMessage::header(std::uint8_t type, std::uint16_t code,
                                                                      std::size_t payloadLength,
                                                                      std::uint64_t timestamp) {
    constexpr std::size_t longest = std::numeric_limits<std::uint16_t>::max();
    const std::size_t length = std::min(headerLength - lengthOffset + payloadLength, longest);
    std::array<std::uint8_t, headerLength> bytes{type};
    put(&bytes[lengthOffset], static_cast<std::uint16_t>(length));
    put(&bytes[codeOffset], code);
    put(&bytes[timestampOffset], timestamp);
    return bytes;
}

} // namespace velmora
