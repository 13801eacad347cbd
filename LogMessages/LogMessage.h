// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <array>
#include <bit>
#include <cstddef>
#include <cstdint>
#include <optional>

namespace velmora {

/// A binary log message as it arrives at the port: an optional prefix of two bytes, then the record. A record
/// begins with a header of 13 bytes, all of it little-endian:
///
///     offset 0   type        8 bits   which stream the record belongs to
///     offset 1   length     16 bits   of the record less its type byte; no reader depends on it
///     offset 3   code       16 bits   the log code within the stream
///     offset 5   time stamp 64 bits   see RecordTime.h
///     offset 13  payload
///
/// A LogMessage is a view: it allocates nothing and does not own the
/// bytes. (The messages of the IFX technology are property lists and have no header.)
struct LogMessage {
    static constexpr std::size_t prefixLength = 2;
    static constexpr std::uint8_t prefixMarker = 0x81; ///< the first byte of a prefix; the second may be any

    static constexpr std::size_t headerLength = 13;
    static constexpr std::size_t lengthOffset = 1;
    static constexpr std::size_t codeOffset = 3;
    static constexpr std::size_t timestampOffset = 5;

    static constexpr std::uint8_t basebandType = 1; ///< the baseband's own stream
    static constexpr std::uint8_t extraType = 0xFF; ///< the telephony service's extra stream

    /// Decoders subscribe to both streams by one number: the code of an extra record plus this.
    static constexpr std::uint32_t firstExtraCode = 0xFF0000;

    bool prefixed = false;
    std::uint8_t type = 0;  ///< unchanged: `parse` does not check it
    std::uint16_t code = 0; ///< without the extra stream's 0xFF0000
    Bytes record;           ///< the message without its prefix

    /// Reads a message; none where it is shorter than a header. That is its length as it arrived, prefix
    /// included, so that a prefixed message may have a record of 11 bytes, which ends within the time stamp.
    [[nodiscard]] static std::optional<LogMessage> parse(Bytes message) {
        if (message.size() < headerLength)
            return std::nullopt;
        LogMessage parsed;
        parsed.prefixed = message[0] == prefixMarker;
        parsed.record = message.subspan(parsed.prefixed ? prefixLength : 0);
        parsed.type = parsed.record[0];
        parsed.code = numberAt<std::uint16_t>(&parsed.record[codeOffset], std::endian::little);
        return parsed;
    }

    /// The header of a record, as `parse` reads it. The length field shows its largest value for a payload
    /// that is too long for it.
    [[nodiscard]] static std::array<std::uint8_t, headerLength>
    header(std::uint8_t type, std::uint16_t code, std::size_t payloadLength, std::uint64_t timestamp = 0);

    /// The code by which decoders subscribe.
    [[nodiscard]] std::uint32_t logCode() const { return (type == extraType ? firstExtraCode : 0) + code; }

    /// The length field, unchecked.
    [[nodiscard]] std::uint16_t length() const {
        return numberAt<std::uint16_t>(&record[lengthOffset], std::endian::little);
    }

    /// The time stamp; none where the record ends within it.
    [[nodiscard]] std::optional<std::uint64_t> timestamp() const {
        if (record.size() < headerLength)
            return std::nullopt;
        return numberAt<std::uint64_t>(&record[timestampOffset], std::endian::little);
    }

    /// What follows the header; empty where the record ends with it or within it.
    [[nodiscard]] Bytes payload() const {
        return record.size() > headerLength ? record.subspan(headerLength) : Bytes();
    }
};

/// The log codes of the extra stream.
namespace ExtraCode {

inline constexpr std::uint32_t simFiles = LogMessage::firstExtraCode + 0; ///< the files of the SIM
inline constexpr std::uint32_t cellInformation = LogMessage::firstExtraCode + 1;
inline constexpr std::uint32_t packetDataContexts = LogMessage::firstExtraCode + 2;

} // namespace ExtraCode

} // namespace velmora
