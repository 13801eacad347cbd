// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogMessages/LogMessage.h"
#include "Platform/Bytes.h"
#include "Recording/DLF/RecordWeights.h"

#include <cstddef>
#include <cstdint>
#include <optional>

namespace velmora {

/// The bytes before a record's length field in raw messages or a DLF log.
enum class Framing : std::uint8_t {
    Type,          ///< the type, of either stream
    Prefix,        ///< a prefix and the type
    Nothing,       ///< the type byte has been left out; DLF only
    PartialPrefix, ///< the prefix's second byte, and the type; DLF only
    OtherType,     ///< a type that is neither stream's
};

inline constexpr Framing allFramings[] = {Framing::Type, Framing::Prefix, Framing::Nothing,
                                          Framing::PartialPrefix, Framing::OtherType};

/// Bytes that the framing takes.
[[nodiscard]] constexpr std::size_t sizeOf(Framing framing) {
    switch (framing) {
    case Framing::Nothing: return 0;
    case Framing::Type:
    case Framing::OtherType: return 1;
    case Framing::PartialPrefix: return LogMessage::prefixLength;
    case Framing::Prefix: return LogMessage::prefixLength + 1;
    }
    return 0;
}

/// A possible record at some bytes, and how strong the evidence for it is.
struct RecordCandidate {
    /// A record's header less its type byte: length, code, time stamp.
    static constexpr std::size_t bareHeaderLength = LogMessage::headerLength - 1;

    Framing framing = Framing::Type;
    std::size_t size = 0; ///< in the input, framing included
    std::uint16_t length = 0;
    std::uint16_t code = 0;
    std::uint64_t timestamp = 0;
    int score = 0;         ///< from its own header, in bits (see RecordWeights)
    int followerScore = 0; ///< from what follows it; set by RecordChain

    /// The record that begins at the first byte with that framing; none where the bytes are too few for its
    /// header or cannot be one. `nearby` is the time stamp of a record close to it.
    [[nodiscard]] static std::optional<RecordCandidate>
    read(Bytes bytes, Framing framing, std::optional<std::uint64_t> nearby, const RecordWeights& weights);

    [[nodiscard]] int total() const { return score + followerScore; }
    /// Whether its time stamp denotes a time; 0 does not.
    [[nodiscard]] bool hasTime() const;
    [[nodiscard]] bool isVersionReport() const;
    /// The first byte of the message that is missing in the input; none where it is all there.
    [[nodiscard]] std::optional<std::uint8_t> missingByte() const;
};

} // namespace velmora
