// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <string_view>

/// Constants of the pcapng capture file format, in which recordings are written. Every block is a type, a
/// total length, a body padded to 32 bits, and the total length again, all in the byte order of its section.
namespace velmora::pcapng {

namespace BlockType {
inline constexpr std::uint32_t SectionHeader = 0x0A0D0D0A; ///< reads the same in both byte orders
inline constexpr std::uint32_t InterfaceDescription = 1;
inline constexpr std::uint32_t Packet = 2; ///< obsolete, found in old captures
inline constexpr std::uint32_t SimplePacket = 3;
inline constexpr std::uint32_t NameResolution = 4;
inline constexpr std::uint32_t InterfaceStatistics = 5;
inline constexpr std::uint32_t EnhancedPacket = 6;
inline constexpr std::uint32_t SystemdJournal = 9;
inline constexpr std::uint32_t DecryptionSecrets = 10;
inline constexpr std::uint32_t Custom = 0x00000BAD;
inline constexpr std::uint32_t CustomNotCopied = 0x40000BAD;
/// Of those for local use, and ours: a further part of the message before it. Its body is the part's offset
/// in the message, 32 bits, and the part.
inline constexpr std::uint32_t MessagePart = 0x80564C4D;
} // namespace BlockType

namespace Option {
inline constexpr std::uint16_t End = 0;
inline constexpr std::uint16_t Comment = 1;
inline constexpr std::uint16_t SectionUserApplication = 4;
inline constexpr std::uint16_t InterfaceName = 2;
inline constexpr std::uint16_t TimeResolution = 9;
inline constexpr std::uint16_t TimeOffset = 14;
} // namespace Option

/// The section header's third word, as its own section reads it.
inline constexpr std::uint32_t byteOrderMagic = 0x1A2B3C4D;
/// The first of the link types that are free for private use; an interface of log messages has it.
inline constexpr std::uint16_t logMessageLinkType = 147;
/// The second of them: an interface of NMEA 0183 sentences, one a packet, has it and this name.
inline constexpr std::uint16_t positionLinkType = 148;
inline constexpr std::string_view positionName = "NMEA";

/// The most bytes of a packet that capture tools read: at a longer one they give up the rest of the file,
/// whatever the interface's limit is. Blocks of types that they do not know they skip. So a longer message
/// has its first part in its packet and the others in blocks after that.
inline constexpr std::size_t longestPart = std::size_t{256} << 10;

/// Type, length, and the length again.
inline constexpr std::size_t blockOverhead = 12;
/// Where a block's body begins.
inline constexpr std::size_t bodyOffset = 8;

[[nodiscard]] constexpr std::size_t padded(std::size_t length) {
    return (length + 3) & ~std::size_t{3};
}

} // namespace velmora::pcapng
