// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Ports/Frame.h"

#include <cstdio>

namespace velmora {

namespace {

constexpr std::uint32_t kindBits = 7;
constexpr std::uint32_t noDataBit = 8;

void putU32(FrameHeaderBytes& bytes, std::size_t offset, std::uint32_t value) {
    for (std::size_t i = 0; i < 4; ++i)
        bytes[offset + i] = static_cast<std::uint8_t>(value >> (8 * i));
}

std::uint32_t u32(Bytes bytes, std::size_t offset) {
    std::uint32_t value = 0;
    for (std::size_t i = 0; i < 4; ++i)
        value |= std::uint32_t{bytes[offset + i]} << (8 * i);
    return value;
}

} // namespace

FrameHeaderBytes encodeFrameHeader(const Frame& frame) {
    FrameHeaderBytes bytes;
    putU32(bytes, 0, static_cast<std::uint32_t>(frame.payload.size()));
    putU32(bytes, 4, static_cast<std::uint32_t>(frame.messageId));
    putU32(bytes, 8, static_cast<std::uint32_t>(frame.kind) | (frame.hasData ? 0 : noDataBit));
    putU32(bytes, 12, frame.serial);
    return bytes;
}

Result<FrameHeader> decodeFrameHeader(Bytes bytes) {
    const std::uint32_t length = u32(bytes, 0);
    const std::uint32_t flags = u32(bytes, 8);
    const std::uint32_t kind = flags & kindBits;
    const bool hasData = (flags & noDataBit) == 0;
    // The flags are checked first: in a stream that is out of step the length is meaningless.
    if ((kind != 1 && kind != 2 && kind != 4) || (flags & ~(kindBits | noDataBit)) != 0 ||
        (!hasData && kind != static_cast<std::uint32_t>(FrameKind::Reply))) {
        char text[80];
        std::snprintf(text, sizeof text, "frame flags 0x%08X, wanted 1, 2, 4 or 0xA",
                      static_cast<unsigned>(flags));
        return Failure{text};
    }
    if (length > maximumFramePayload)
        return Failure{"a frame of " + std::to_string(length) + " bytes, wanted at most " +
                       std::to_string(maximumFramePayload)};
    if (!hasData && length != 0)
        return Failure{"a reply without data of " + std::to_string(length) + " bytes, wanted 0"};

    return FrameHeader{static_cast<FrameKind>(kind), hasData, static_cast<std::int32_t>(u32(bytes, 4)),
                       u32(bytes, 12), length};
}

} // namespace velmora
