// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Recording/Pcapng/BlockReader.h"

#include <cstdint>
#include <span>
#include <string>
#include <string_view>
#include <vector>

/// Blocks as they are written to another recording. What is not known in them is kept, byte for byte.
namespace velmora::pcapngCopy {

/// Whether another file may have it: not a custom block that its maker wants to stay in this one.
[[nodiscard]] bool mayBeCopied(const BlockReader::Block& block);

/// The section header with its section's length left open, since the copy may lack blocks.
[[nodiscard]] std::vector<std::uint8_t> sectionHeader(const BlockReader::Block& block);

/// The interface description with another name, and all its other options. Precondition: it holds its fields,
/// and the name has at most 255 bytes.
[[nodiscard]] std::vector<std::uint8_t> renamedInterface(const BlockReader::Block& block,
                                                         std::string_view name);

/// The packet as capture tools read it: a message that is too long for them in one block is put into several
/// (see pcapng::longestPart). All others stay as they are.
[[nodiscard]] std::vector<std::uint8_t> readablePacket(const BlockReader::Block& block);

/// Adds comments to a packet as `readablePacket` returns it, before its other options. False where it is of a
/// kind that has no options like these; it is not changed then. Precondition: each has at most 65535 bytes.
[[nodiscard]] bool addComments(std::vector<std::uint8_t>& packet, std::span<const std::string> comments,
                               bool bigEndian);

/// Makes room for an interface of that number: higher and equal numbers in a little-endian packet or block of
/// statistics grow by one.
void shiftInterface(std::vector<std::uint8_t>& block, std::uint32_t from);

} // namespace velmora::pcapngCopy
