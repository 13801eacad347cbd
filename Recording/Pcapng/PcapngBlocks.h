// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Platform/Clock.h"

#include <cstddef>
#include <cstdint>
#include <span>
#include <string>
#include <string_view>
#include <vector>

/// The blocks of a recording as they are written: little-endian pcapng, one section with one interface (link
/// type 147, nanoseconds, the technology as its name), then one Enhanced Packet Block a message, with the
/// rest of a long one in blocks after it.
namespace velmora::pcapngBlocks {

/// Adds the section header, with a comment of at most 65535 bytes where that is not empty.
void appendSection(std::vector<std::uint8_t>& buffer, std::string_view comment = {});

/// Adds the interface description. Precondition: `technology` has at most 65535 bytes.
void appendInterface(std::vector<std::uint8_t>& buffer, std::string_view technology);
/// Adds that of an interface of NMEA sentences.
void appendPositionInterface(std::vector<std::uint8_t>& buffer);

/// Adds a message's block, and those of its further parts where it is long (see pcapng::longestPart). A time
/// before 1970 cannot be written and becomes 1970-01-01. Precondition: the message is not above
/// `maximumMessageSize`. `interface`: the number of its interface description, from 0.
/// `comments`: options of the block, of at most 65535 bytes each.
void appendPacket(std::vector<std::uint8_t>& buffer, Time time, Bytes message, std::uint32_t interface = 0,
                  std::span<const std::string> comments = {});

/// Adds a block of statistics of the first interface, which holds nothing but a comment. Precondition: that
/// has at most 65535 bytes.
void appendComment(std::vector<std::uint8_t>& buffer, std::string_view comment);

/// The length of a message's blocks.
[[nodiscard]] std::size_t packetSize(std::size_t messageSize, std::span<const std::string> comments = {});

/// Of blocks as the functions above make them: the length of those that lie wholly within the first `length`
/// bytes, a message's blocks counting as one.
[[nodiscard]] std::size_t completeBlocks(Bytes blocks, std::size_t length);

struct PacketCount {
    std::uint64_t messages = 0;
    std::uint64_t bytes = 0; ///< of the messages themselves
};

/// What such blocks hold on the first interface.
[[nodiscard]] PacketCount countPackets(Bytes blocks);

} // namespace velmora::pcapngBlocks
