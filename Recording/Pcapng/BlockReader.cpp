// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Pcapng/BlockReader.h"

#include "Recording/Files/InputStart.h"
#include "Recording/Pcapng/ByteReader.h"
#include "Recording/Pcapng/Pcapng.h"

#include <algorithm>
#include <array>
#include <cstring>
#include <limits>

namespace velmora {

using pcapng::BlockType::SectionHeader;

namespace {

constexpr std::size_t magicOffset = 8;
constexpr std::array<std::uint8_t, 4> sectionHeaderWord{0x0A, 0x0D, 0x0D, 0x0A};
constexpr std::array<std::uint8_t, 4> bigEndianMagic{0x1A, 0x2B, 0x3C, 0x4D};
constexpr std::array<std::uint8_t, 4> littleEndianMagic{0x4D, 0x3C, 0x2B, 0x1A};

bool startsWith(Bytes bytes, const std::array<std::uint8_t, 4>& word) {
    return bytes.size() >= word.size() && std::equal(word.begin(), word.end(), bytes.begin());
}

/// How many bytes of the zeros that the input begins with can be skipped: no block begins with four of them,
/// and the position within a word stays. A hole of a sparse file is many zeros.
std::size_t skippableZeros(Bytes bytes) {
    constexpr std::array<std::uint8_t, 1024> zeros{};
    std::size_t count = 0;
    while (bytes.size() - count >= zeros.size() &&
           std::memcmp(bytes.data() + count, zeros.data(), zeros.size()) == 0)
        count += zeros.size();
    return count == 0 ? 0 : count - 4;
}

/// The least length of a block that damage may be left at; types that are not known are not trusted there.
std::size_t leastLength(std::uint32_t type) {
    switch (type) {
    case SectionHeader: return 28;
    case pcapng::BlockType::InterfaceDescription:
    case pcapng::BlockType::DecryptionSecrets: return 20;
    case pcapng::BlockType::Packet:
    case pcapng::BlockType::EnhancedPacket: return 32;
    case pcapng::BlockType::SimplePacket:
    case pcapng::BlockType::NameResolution:
    case pcapng::BlockType::SystemdJournal:
    case pcapng::BlockType::Custom:
    case pcapng::BlockType::CustomNotCopied: return 16;
    case pcapng::BlockType::InterfaceStatistics: return 24;
    default: return std::numeric_limits<std::size_t>::max();
    }
}

} // namespace

Bytes BlockReader::Block::body() const {
    return bytes.subspan(pcapng::bodyOffset, bytes.size() - pcapng::blockOverhead);
}

Result<Done> BlockReader::expectSection() {
    const bool whole = _input.ensure(pcapng::blockOverhead);
    const Bytes begin = _input.available();
    if (_input.failure())
        return *_input.failure();
    Block block;
    if (!whole || ByteReader(begin, false).u32(0) != SectionHeader || checkBlock(block) == Fault::NoByteOrder)
        return Failure{unexpectedStart(begin, "a pcapng section header")};
    return Done{};
}

const BlockReader::Block* BlockReader::next() {
    _input.skip(std::exchange(_present.length, 0));
    for (;;) {
        if (!_input.ensure(1))
            return nullptr;
        const Fault fault = checkBlock(_present);
        if (fault == Fault::None) {
            _bigEndian = _present.bigEndian;
            return &_present;
        }
        skipDamage(fault, std::exchange(_present, Block()));
    }
}

/// Checks the block at the input's position, and reads as much of it as its length says.
BlockReader::Fault BlockReader::checkBlock(Block& block) {
    block.offset = _input.offset();
    block.length = 0;
    if (!_input.ensure(pcapng::blockOverhead))
        return Fault::Truncated;
    const Bytes header = _input.available();
    block.bigEndian = _bigEndian;
    block.type = ByteReader(header, _bigEndian).u32(0);
    if (block.type == SectionHeader) {
        const Bytes magic = header.subspan(magicOffset);
        block.bigEndian = startsWith(magic, bigEndianMagic);
        if (!block.bigEndian && !startsWith(magic, littleEndianMagic))
            return Fault::NoByteOrder;
    }
    block.length = ByteReader(header, block.bigEndian).u32(4);
    if (block.length < pcapng::blockOverhead || block.length % 4 != 0 || block.length > maximumBlockSize)
        return Fault::Length;
    if (!_input.ensure(block.length))
        return Fault::Truncated;
    block.bytes = _input.available().first(block.length);
    if (ByteReader(block.bytes, block.bigEndian).u32(block.length - 4) != block.length)
        return Fault::TrailingLength;
    return Fault::None;
}

std::string BlockReader::describe(Fault fault, const Block& block) const {
    switch (fault) {
    case Fault::None: break;
    case Fault::Truncated:
        return std::string(block.length == 0 ? "block header" : "block") + " cut off after " +
               std::to_string(_input.available().size()) + " of " +
               std::to_string(block.length == 0 ? pcapng::blockOverhead : block.length) + " bytes";
    case Fault::NoByteOrder: return "section header without a byte-order magic";
    case Fault::Length:
        return "block length " + std::to_string(block.length) + ", wanted a multiple of 4 from " +
               std::to_string(pcapng::blockOverhead) + " to " + std::to_string(maximumBlockSize);
    case Fault::TrailingLength:
        return "trailing block length " +
               std::to_string(ByteReader(block.bytes, block.bigEndian).u32(block.length - 4)) + ", wanted " +
               std::to_string(block.length);
    }
    return {};
}

/// Passes over a block that does not hold together, and all up to the next that does.
void BlockReader::skipDamage(Fault fault, const Block& block) {
    Loss loss;
    loss.offset = block.offset;
    loss.reason = describe(fault, block);
    bool found = false;
    for (unsigned phase = 1; !found && _input.ensure(1); phase = (phase + 1) % 4) {
        _input.skip(skippableZeros(_input.available()));
        _input.skip(1);
        if (phase == 0 || startsWith(_input.available(), sectionHeaderWord))
            found = isAtBlock();
    }
    if (!found)
        _input.skip(_input.available().size());
    loss.bytes = _input.offset() - block.offset;
    // Where a complete block follows, it was the length that was damaged.
    loss.isTruncation = !found && fault == Fault::Truncated && !_input.failure();
    _loss = std::move(loss);
}

bool BlockReader::isAtBlock() {
    if (!_input.ensure(pcapng::blockOverhead))
        return false;
    const Bytes header = _input.available();
    const std::uint32_t type = ByteReader(header, _bigEndian).u32(0);
    Block block;
    // The cheap tests come first: this is called for every word of what may be much input.
    if (leastLength(type) > maximumBlockSize)
        return false;
    if (type != SectionHeader && ByteReader(header, _bigEndian).u32(4) < leastLength(type))
        return false;
    return checkBlock(block) == Fault::None && block.length >= leastLength(type);
}

} // namespace velmora
