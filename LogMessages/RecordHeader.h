// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <cstddef>
#include <cstdint>
#include <optional>

namespace velmora {

/// The header of a binary log message, as tools show it. (Serialized-object messages have none.)
struct RecordHeader {
    /// Type, length, code and time stamp.
    static constexpr std::size_t size = 13;
    static constexpr std::uint8_t prefixMarker = 0x81;
    static constexpr std::size_t prefixSize = 2;
    static constexpr std::uint8_t basebandType = 1;
    static constexpr std::uint8_t extraType = 0xFF;

    bool prefixed = false;    ///< two bytes that begin 0x81 stand before the record
    std::uint8_t type = 0;    ///< 1: the baseband's own stream, 0xFF: the telephony service's extra stream
    std::uint16_t length = 0; ///< the length field as it stands; nothing depends on it
    std::uint16_t code = 0;   ///< the 16-bit log code as it stands
    std::optional<std::uint64_t>
        timestamp; ///< absent where a prefixed record ends within it (see RecordTime.h)
    Bytes record;  ///< the message less its prefix

    /// The code under which decoders subscribe: 0xFF0000 is added for the extra stream.
    [[nodiscard]] std::uint32_t logCode() const { return (type == extraType ? 0xFF0000U : 0U) + code; }
};

/// Reads the header of a message as it arrived; none for one shorter than 13 bytes. That is the length as it
/// arrived, prefix included, so that a prefixed record may be as short as 11 bytes. The type is not judged.
/// The header's `record` is a view of the message's bytes.
[[nodiscard]] std::optional<RecordHeader> recordHeader(Bytes message);

} // namespace velmora
