// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Pcapng/PcapngBlocks.h"

#include "Recording/Pcapng/ByteReader.h"
#include "Recording/Pcapng/Pcapng.h"

#include <algorithm>

namespace velmora::pcapngBlocks {

namespace {

namespace BlockType = pcapng::BlockType;
namespace Option = pcapng::Option;

using Buffer = std::vector<std::uint8_t>;

constexpr std::size_t packetOverhead = 32;
constexpr std::size_t partOverhead = pcapng::blockOverhead + 4;
constexpr std::uint8_t nanosecondResolution = 9;
constexpr std::string_view application = VELMORA_RECORDING_APPLICATION;

std::size_t optionSize(std::size_t length) {
    return 4 + pcapng::padded(length);
}

void put16(Buffer& buffer, std::uint16_t value) {
    buffer.push_back(static_cast<std::uint8_t>(value));
    buffer.push_back(static_cast<std::uint8_t>(value >> 8));
}

void put32(Buffer& buffer, std::uint32_t value) {
    put16(buffer, static_cast<std::uint16_t>(value));
    put16(buffer, static_cast<std::uint16_t>(value >> 16));
}

void putPadded(Buffer& buffer, Bytes bytes) {
    buffer.insert(buffer.end(), bytes.begin(), bytes.end());
    buffer.resize(buffer.size() + pcapng::padded(bytes.size()) - bytes.size());
}

void putOption(Buffer& buffer, std::uint16_t code, Bytes value) {
    put16(buffer, code);
    put16(buffer, static_cast<std::uint16_t>(value.size()));
    putPadded(buffer, value);
}

void putOption(Buffer& buffer, std::uint16_t code, std::string_view text) {
    putOption(buffer, code, Bytes(reinterpret_cast<const std::uint8_t*>(text.data()), text.size()));
}

/// The length of the options that hold the comments.
std::size_t sizeOf(std::span<const std::string> comments) {
    std::size_t size = comments.empty() ? 0 : optionSize(0);
    for (const std::string& comment : comments)
        size += optionSize(comment.size());
    return size;
}

/// The 32-bit field at that offset of the first block. Precondition: it lies within the block.
std::uint32_t u32At(Bytes blocks, std::size_t offset) {
    return ByteReader(blocks, false).u32(offset);
}

constexpr std::size_t lengthOffset = 4;
constexpr std::size_t interfaceOffset = 8;
constexpr std::size_t originalOffset = 24;

/// The length of the first block, and of those with the rest of its message.
std::size_t firstLength(Bytes blocks) {
    std::size_t length = u32At(blocks, lengthOffset);
    while (length < blocks.size() && u32At(blocks, length) == BlockType::MessagePart)
        length += u32At(blocks, length + lengthOffset);
    return length;
}

void appendPart(Buffer& buffer, std::size_t offset, Bytes part) {
    const auto length = static_cast<std::uint32_t>(partOverhead + pcapng::padded(part.size()));
    put32(buffer, BlockType::MessagePart);
    put32(buffer, length);
    put32(buffer, static_cast<std::uint32_t>(offset));
    putPadded(buffer, part);
    put32(buffer, length);
}

void appendDescription(Buffer& buffer, std::uint16_t linkType, std::string_view name) {
    const auto interfaceLength =
        static_cast<std::uint32_t>(16 + optionSize(name.size()) + optionSize(1) + optionSize(0) + 4);
    put32(buffer, BlockType::InterfaceDescription);
    put32(buffer, interfaceLength);
    put16(buffer, linkType);
    put16(buffer, 0);
    put32(buffer, 0); // packets of any length
    putOption(buffer, Option::InterfaceName, name);
    putOption(buffer, Option::TimeResolution, Bytes(&nanosecondResolution, 1));
    putOption(buffer, Option::End, std::string_view());
    put32(buffer, interfaceLength);
}

} // namespace

void appendSection(Buffer& buffer, std::string_view comment) {
    const std::size_t commentSize = comment.empty() ? 0 : optionSize(comment.size());
    const auto sectionLength =
        static_cast<std::uint32_t>(24 + commentSize + optionSize(application.size()) + optionSize(0) + 4);
    put32(buffer, BlockType::SectionHeader);
    put32(buffer, sectionLength);
    put32(buffer, pcapng::byteOrderMagic);
    put16(buffer, 1); // format version 1.0
    put16(buffer, 0);
    put32(buffer, 0xFFFFFFFF); // the section's length is not known beforehand
    put32(buffer, 0xFFFFFFFF);
    if (!comment.empty())
        putOption(buffer, Option::Comment, comment);
    putOption(buffer, Option::SectionUserApplication, application);
    putOption(buffer, Option::End, std::string_view());
    put32(buffer, sectionLength);
}

void appendInterface(Buffer& buffer, std::string_view technology) {
    appendDescription(buffer, pcapng::logMessageLinkType, technology);
}

void appendPositionInterface(Buffer& buffer) {
    appendDescription(buffer, pcapng::positionLinkType, pcapng::positionName);
}

void appendPacket(Buffer& buffer, Time time, Bytes message, std::uint32_t interface,
                  std::span<const std::string> comments) {
    const auto stamp = static_cast<std::uint64_t>(std::max<std::int64_t>(time.time_since_epoch().count(), 0));
    const Bytes first = message.first(std::min(message.size(), pcapng::longestPart));
    const auto length =
        static_cast<std::uint32_t>(packetOverhead + pcapng::padded(first.size()) + sizeOf(comments));
    put32(buffer, BlockType::EnhancedPacket);
    put32(buffer, length);
    put32(buffer, interface);
    put32(buffer, static_cast<std::uint32_t>(stamp >> 32));
    put32(buffer, static_cast<std::uint32_t>(stamp));
    put32(buffer, static_cast<std::uint32_t>(first.size()));
    put32(buffer, static_cast<std::uint32_t>(message.size()));
    putPadded(buffer, first);
    for (const std::string& comment : comments)
        putOption(buffer, Option::Comment, comment);
    if (!comments.empty())
        putOption(buffer, Option::End, std::string_view());
    put32(buffer, length);
    for (std::size_t offset = first.size(); offset < message.size(); offset += pcapng::longestPart)
        appendPart(buffer, offset,
                   message.subspan(offset, std::min(message.size() - offset, pcapng::longestPart)));
}

void appendComment(Buffer& buffer, std::string_view comment) {
    const auto length =
        static_cast<std::uint32_t>(pcapng::blockOverhead + 12 + optionSize(comment.size()) + optionSize(0));
    put32(buffer, BlockType::InterfaceStatistics);
    put32(buffer, length);
    put32(buffer, 0); // the interface
    put32(buffer, 0); // the time, of nothing that counts
    put32(buffer, 0);
    putOption(buffer, Option::Comment, comment);
    putOption(buffer, Option::End, std::string_view());
    put32(buffer, length);
}

std::size_t packetSize(std::size_t messageSize, std::span<const std::string> comments) {
    const std::size_t parts = messageSize == 0 ? 0 : (messageSize - 1) / pcapng::longestPart;
    return packetOverhead + parts * partOverhead + pcapng::padded(messageSize) + sizeOf(comments);
}

std::size_t completeBlocks(Bytes blocks, std::size_t length) {
    std::size_t whole = 0;
    while (whole < blocks.size()) {
        const std::size_t next = whole + firstLength(blocks.subspan(whole));
        if (next > length)
            break;
        whole = next;
    }
    return whole;
}

PacketCount countPackets(Bytes blocks) {
    PacketCount count;
    for (; !blocks.empty(); blocks = blocks.subspan(firstLength(blocks))) {
        if (u32At(blocks, 0) != BlockType::EnhancedPacket || u32At(blocks, interfaceOffset) != 0)
            continue;
        ++count.messages;
        count.bytes += u32At(blocks, originalOffset);
    }
    return count;
}

} // namespace velmora::pcapngBlocks
