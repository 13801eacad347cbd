// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Pcapng/PcapngCopy.h"

#include "Recording/Pcapng/ByteReader.h"
#include "Recording/Pcapng/OptionReader.h"
#include "Recording/Pcapng/Pcapng.h"

#include <algorithm>

namespace velmora::pcapngCopy {

namespace {

using Buffer = std::vector<std::uint8_t>;

constexpr std::size_t sectionLengthOffset = 16;
constexpr std::size_t interfaceOptionsOffset = 16;
constexpr std::size_t capturedOffset = 20;
constexpr std::size_t packetDataOffset = 28;

/// Appends a number in the block's byte order.
void put(Buffer& buffer, std::uint32_t value, std::size_t width, bool bigEndian) {
    for (std::size_t i = 0; i < width; ++i) {
        const std::size_t shift = 8 * (bigEndian ? width - 1 - i : i);
        buffer.push_back(static_cast<std::uint8_t>(value >> shift));
    }
}

void putOption(Buffer& buffer, std::uint16_t code, Bytes value, bool bigEndian) {
    put(buffer, code, 2, bigEndian);
    put(buffer, static_cast<std::uint32_t>(value.size()), 2, bigEndian);
    buffer.insert(buffer.end(), value.begin(), value.end());
    buffer.resize(buffer.size() + pcapng::padded(value.size()) - value.size());
}

/// Ends the block that begins there: writes its length, in both places.
void closeBlock(Buffer& buffer, std::size_t begin, bool bigEndian) {
    put(buffer, static_cast<std::uint32_t>(buffer.size() - begin + 4), 4, bigEndian);
    std::copy(buffer.end() - 4, buffer.end(), buffer.begin() + static_cast<std::ptrdiff_t>(begin) + 4);
}

void append(Buffer& buffer, Bytes bytes) {
    buffer.insert(buffer.end(), bytes.begin(), bytes.end());
    buffer.resize(pcapng::padded(buffer.size()));
}

} // namespace

bool mayBeCopied(const BlockReader::Block& block) {
    return block.type != pcapng::BlockType::CustomNotCopied;
}

Buffer sectionHeader(const BlockReader::Block& block) {
    Buffer copy(block.bytes.begin(), block.bytes.end());
    if (copy.size() >= sectionLengthOffset + 8 + 4)
        std::fill_n(copy.begin() + sectionLengthOffset, 8, std::uint8_t{0xFF});
    return copy;
}

Buffer renamedInterface(const BlockReader::Block& block, std::string_view name) {
    const Bytes fixed = block.bytes.first(interfaceOptionsOffset);
    Buffer copy(fixed.begin(), fixed.end());
    putOption(copy, pcapng::Option::InterfaceName,
              Bytes(reinterpret_cast<const std::uint8_t*>(name.data()), name.size()), block.bigEndian);
    OptionReader options(block.bytes.first(block.bytes.size() - 4).subspan(interfaceOptionsOffset),
                         block.bigEndian);
    while (const auto option = options.next())
        if (option->code != pcapng::Option::InterfaceName)
            putOption(copy, option->code, option->value, block.bigEndian);
    putOption(copy, pcapng::Option::End, {}, block.bigEndian);
    closeBlock(copy, 0, block.bigEndian);
    return copy;
}

Buffer readablePacket(const BlockReader::Block& block) {
    const std::size_t captured = block.type == pcapng::BlockType::EnhancedPacket
                                     ? ByteReader(block.bytes, block.bigEndian).u32(capturedOffset)
                                     : 0;
    if (captured <= pcapng::longestPart)
        return {block.bytes.begin(), block.bytes.end()};
    const Bytes message = block.bytes.subspan(packetDataOffset, captured);
    const Bytes options =
        block.bytes.first(block.length - 4).subspan(packetDataOffset + pcapng::padded(captured));
    Buffer copy;
    append(copy, block.bytes.first(capturedOffset));
    put(copy, pcapng::longestPart, 4, block.bigEndian);
    put(copy, static_cast<std::uint32_t>(captured), 4, block.bigEndian);
    append(copy, message.first(pcapng::longestPart));
    append(copy, options);
    closeBlock(copy, 0, block.bigEndian);
    for (std::size_t offset = pcapng::longestPart; offset < captured; offset += pcapng::longestPart) {
        const std::size_t begin = copy.size();
        put(copy, pcapng::BlockType::MessagePart, 4, block.bigEndian);
        put(copy, 0, 4, block.bigEndian); // the length, which follows
        put(copy, static_cast<std::uint32_t>(offset), 4, block.bigEndian);
        append(copy, message.subspan(offset, std::min(captured - offset, pcapng::longestPart)));
        closeBlock(copy, begin, block.bigEndian);
    }
    return copy;
}

bool addComments(Buffer& packet, std::span<const std::string> comments, bool bigEndian) {
    ByteReader fields(packet, bigEndian);
    const std::size_t length = fields.u32(4);
    const std::size_t options = packetDataOffset + pcapng::padded(fields.u32(capturedOffset));
    if (fields.u32(0) != pcapng::BlockType::EnhancedPacket || !fields.isGood() || options + 4 > length)
        return false;
    Buffer added;
    for (const std::string& comment : comments)
        putOption(added, pcapng::Option::Comment,
                  Bytes(reinterpret_cast<const std::uint8_t*>(comment.data()), comment.size()), bigEndian);
    if (options + 4 == length)
        putOption(added, pcapng::Option::End, {}, bigEndian);
    // What follows may be further parts of a long message.
    packet.insert(packet.begin() + static_cast<std::ptrdiff_t>(options), added.begin(), added.end());
    Buffer number;
    put(number, static_cast<std::uint32_t>(length + added.size()), 4, bigEndian);
    std::copy(number.begin(), number.end(), packet.begin() + 4);
    std::copy(number.begin(), number.end(),
              packet.begin() + static_cast<std::ptrdiff_t>(length + added.size() - 4));
    return true;
}

void shiftInterface(Buffer& block, std::uint32_t from) {
    namespace BlockType = pcapng::BlockType;
    constexpr std::size_t interfaceOffset = pcapng::bodyOffset;
    ByteReader fields(block, false);
    const std::uint32_t type = fields.u32(0);
    const bool isShort = type == BlockType::Packet;
    const std::uint32_t interface = isShort ? fields.u16(interfaceOffset) : fields.u32(interfaceOffset);
    const bool hasInterface =
        isShort || type == BlockType::EnhancedPacket || type == BlockType::InterfaceStatistics;
    if (!fields.isGood() || !hasInterface || interface < from)
        return;
    Buffer number;
    put(number, interface + 1, isShort ? 2 : 4, false);
    std::copy(number.begin(), number.end(), block.begin() + interfaceOffset);
}

} // namespace velmora::pcapngCopy
