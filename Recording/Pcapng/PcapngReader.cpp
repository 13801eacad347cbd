// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Pcapng/PcapngReader.h"

#include "Platform/TelephonyService.h"
#include "Recording/Files/FileSource.h"
#include "Recording/Pcapng/ByteReader.h"
#include "Recording/Pcapng/OptionReader.h"
#include "Recording/Pcapng/Pcapng.h"

#include <algorithm>

namespace velmora {

namespace {

namespace BlockType = pcapng::BlockType;

/// More interfaces than this in one section are not kept, so that a file of nothing else needs no memory.
constexpr std::size_t maximumInterfaces = 65'536;
constexpr std::uint16_t supportedMajorVersion = 1;
constexpr std::size_t versionOffset = 12;
constexpr std::size_t sectionOptionsOffset = 24;
constexpr std::size_t interfaceOptionsOffset = 16;
/// How much is read to open a file, in bytes of blocks, which are kept for `setOtherBlocks`.
constexpr std::size_t maximumHead = std::size_t{1} << 20;

bool holdsPacket(std::uint32_t type) {
    return type == BlockType::EnhancedPacket || type == BlockType::SimplePacket || type == BlockType::Packet;
}

} // namespace

Result<std::unique_ptr<PcapngReader>> PcapngReader::open(const std::string& path) {
    Result<std::unique_ptr<ByteSource>> source = FileSource::open(path);
    if (!source)
        return Failure{source.reason()};
    return open(ChunkedInput(*std::move(source)));
}

Result<std::unique_ptr<PcapngReader>> PcapngReader::open(ChunkedInput input) {
    std::unique_ptr<PcapngReader> reader(new PcapngReader(std::move(input)));
    if (const Result<Done> section = reader->_blocks.expectSection(); !section)
        return Failure{section.reason()};
    while (!reader->_foundInterface && reader->_headSize < maximumHead) {
        const Block* const block = reader->nextBlock();
        if (!block)
            break;
        if (holdsPacket(block->type)) {
            reader->_waiting = block;
            break;
        }
        reader->readBlock(*block);
    }
    reader->_isOpening = false;
    return reader;
}

void PcapngReader::setOtherBlocks(std::function<void(const Block&)> otherBlocks) {
    _otherBlocks = std::move(otherBlocks);
    for (auto& [block, bytes] : std::exchange(_head, {})) {
        block.bytes = bytes;
        _otherBlocks(block);
    }
}

void PcapngReader::passOn(const Block& block) {
    if (_otherBlocks) {
        _otherBlocks(block);
    } else if (_isOpening) {
        _head.emplace_back(block, std::vector(block.bytes.begin(), block.bytes.end()));
        _headSize += block.bytes.size();
    }
}

std::optional<LoggedMessage> PcapngReader::next() {
    _head.clear();
    std::optional<LoggedMessage> message; // made where it is returned: there are millions of them
    while (!message) {
        const Block* const block = _waiting ? std::exchange(_waiting, nullptr) : nextBlock();
        if (!block)
            break;
        if (holdsPacket(block->type))
            readMessage(*block, message);
        else
            readBlock(*block);
    }
    return message;
}

const PcapngReader::Block* PcapngReader::nextBlock() {
    const Block* const block = _blocks.next();
    if (_blocks.hasLoss()) {
        Loss loss = *_blocks.takeLoss();
        loss.recordNumber = _packets + 1;
        addLoss(std::move(loss));
    }
    return block;
}

void PcapngReader::readBlock(const Block& block) {
    if (block.type == BlockType::InterfaceDescription) {
        addInterface(block);
    } else if (block.type == BlockType::SectionHeader) {
        _interfaces.clear();
        readComments(block, sectionOptionsOffset, Comment::About::Section, ++_sectionCount);
        ByteReader fields(block.bytes, block.bigEndian);
        // What follows is read as far as it can be understood all the same.
        if (const std::uint16_t major = fields.u16(versionOffset); major != supportedMajorVersion)
            addLossOf(block, _packets + 1,
                      "section of format version " + std::to_string(major) + ", wanted " +
                          std::to_string(supportedMajorVersion));
    }
    passOn(block);
}

void PcapngReader::readComments(const Block& block, std::size_t options, Comment::About about,
                                std::uint64_t number) {
    const std::size_t end = block.length - 4;
    if (options >= end)
        return;
    OptionReader reader(block.bytes.first(end).subspan(options), block.bigEndian);
    while (const auto option = reader.next())
        if (option->code == pcapng::Option::Comment)
            addComment(
                {about, number, block.offset, std::string(option->value.begin(), option->value.end())});
}

void PcapngReader::addInterface(const Block& block) {
    using Use = Interface::Use;
    readComments(block, interfaceOptionsOffset, Comment::About::Interface, ++_interfaceCount);
    if (_interfaces.size() == maximumInterfaces) {
        addLossOf(block, _packets + 1,
                  "more than " + std::to_string(maximumInterfaces) + " interfaces in a section");
        return;
    }
    Interface& interface = _interfaces.emplace_back();
    std::optional<InterfaceDescription> description =
        InterfaceDescription::read(block.body(), block.bigEndian);
    if (!description) {
        interface.use = Use::Unreadable;
        addLossOf(block, _packets + 1,
                  "description of interface " + std::to_string(_interfaces.size() - 1) +
                      " does not hold its fields");
        return;
    }
    interface.description = *std::move(description);
    if (interface.description.linkType == pcapng::positionLinkType &&
        interface.description.name == pcapng::positionName) {
        interface.use = Use::Positions;
        return;
    }
    if (interface.description.linkType != pcapng::logMessageLinkType) {
        interface.use = Use::OtherLinkType;
        ++_passedOver.interfaces;
        return;
    }
    _foundInterface = true;
    const std::optional<std::uint32_t> technology =
        technologyIndex(shortTechnologyName(interface.description.name));
    if (technology)
        interface.technology = *technology;
    else
        interface.use = Use::OtherTechnology;
}

std::optional<std::uint32_t> PcapngReader::technologyIndex(std::string_view name) {
    if (name.empty())
        return 0;
    if (_technologies.front().empty())
        _technologies.front() = name;
    const auto found = std::find(_technologies.begin(), _technologies.end(), name);
    const auto index = static_cast<std::uint32_t>(found - _technologies.begin());
    if (found == _technologies.end()) {
        if (_technologies.size() == maximumTechnologies)
            return std::nullopt;
        _technologies.emplace_back(name);
    }
    return index;
}

std::vector<std::string> PcapngReader::technologies() const {
    return technology().empty() ? std::vector<std::string>() : _technologies;
}

void PcapngReader::readMessage(const Block& block, std::optional<LoggedMessage>& message) {
    using Use = Interface::Use;
    const std::uint64_t number = ++_packets;
    const Packet packet = packetOf(block);
    const Interface* interface =
        packet.interface < _interfaces.size() ? &_interfaces[packet.interface] : nullptr;
    if (interface != nullptr && interface->use == Use::OtherLinkType) {
        ++_passedOver.packets;
        passOn(block);
        return;
    }
    if (interface != nullptr && interface->use == Use::Positions) {
        readSentence(block, packet, interface->description);
        passOn(block);
        return;
    }
    const bool isOther = interface != nullptr && (interface->use == Use::OtherTechnology ||
                                                  (interface->technology != 0 && !_readsAllTechnologies));
    if (isOther)
        passOn(block);
    const std::size_t room = block.length - 4;
    const bool hasParts =
        block.type == BlockType::EnhancedPacket && JoinedMessage::hasParts(packet.captured, packet.original);
    const bool whole = packet.offset <= room && packet.captured <= room - packet.offset &&
                       (packet.captured == packet.original || hasParts) &&
                       packet.captured <= maximumMessageSize;
    std::optional<Time> time;
    if (interface != nullptr && interface->use == Use::Messages && whole && !isOther)
        time = packet.hasStamp ? interface->description.time(packet.stamp) : _lastTime;
    if (!time) {
        // Thousands of these are possible; only those that are kept need a reason.
        addLossOf(block, number, keepsLoss() ? packetProblem(packet, block) : std::string());
        return;
    }
    // Most packets have no options.
    const std::size_t options = packet.offset + pcapng::padded(packet.captured);
    if (block.type != BlockType::SimplePacket && options < room)
        readComments(block, options, Comment::About::Message, number);
    _lastTime = *time;
    LoggedMessage& made = message.emplace();
    made.time = *time;
    made.number = number;
    made.offset = block.offset;
    made.technology = interface->technology;
    if (hasParts) {
        const Block first = block; // which is another after the next is read
        if (!join(block, packet)) {
            message.reset();
            addLossOf(first, number, packetProblem(packet, first));
            return;
        }
        made.message = _joined->takeMessage();
        _messageBlock = &_joined->block();
    } else {
        made.message = _blocks.part(packet.offset, packet.captured);
        _messageBlock = &block;
    }
}

void PcapngReader::readSentence(const Block& block, const Packet& packet,
                                const InterfaceDescription& interface) {
    const std::size_t room = block.length - 4;
    if (!_sentences || packet.offset > room || packet.captured > room - packet.offset)
        return;
    const std::optional<Time> time = packet.hasStamp ? interface.time(packet.stamp) : _lastTime;
    const Bytes text = block.bytes.subspan(packet.offset, packet.captured);
    if (time)
        _sentences(
            {*time, std::string_view(reinterpret_cast<const char*>(text.data()), text.size()), _packets});
}

/// Reads the blocks with the other parts of the packet's message. False if one is missing.
bool PcapngReader::join(const Block& block, const Packet& packet) {
    _joined.emplace(block, block.bytes.subspan(packet.offset, packet.captured), packet.original);
    while (!_joined->isComplete()) {
        const Block* const next = nextBlock();
        if (next && _joined->add(*next))
            continue;
        _waiting = next;
        return false;
    }
    return true;
}

/// Fields that the block is too short for read as 0, and its bytes then begin past its end.
PcapngReader::Packet PcapngReader::packetOf(const Block& block) const {
    ByteReader fields(block.bytes.first(block.length - 4), block.bigEndian);
    Packet packet;
    if (block.type == BlockType::SimplePacket) {
        // Interface 0, no time stamp, no captured length: what is missing follows from the interface's limit.
        packet.offset = 12;
        packet.original = fields.u32(8);
        packet.captured = packet.original;
        if (!_interfaces.empty() && _interfaces[0].description.snapLength != 0)
            packet.captured = std::min(packet.captured, _interfaces[0].description.snapLength);
        return packet;
    }
    packet.offset = 28;
    // The obsolete block has a 16-bit interface, and a count of dropped packets where the others have its
    // top.
    packet.interface = block.type == BlockType::Packet ? fields.u16(8) : fields.u32(8);
    packet.hasStamp = true;
    packet.stamp = std::uint64_t{fields.u32(12)} << 32 | fields.u32(16);
    packet.captured = fields.u32(20);
    packet.original = fields.u32(24);
    return packet;
}

std::string PcapngReader::packetProblem(const Packet& packet, const Block& block) const {
    using Use = Interface::Use;
    const std::size_t room = block.length - 4;
    if (packet.offset > room)
        return "packet block of " + std::to_string(block.length) + " bytes, wanted " +
               std::to_string(packet.offset + 4) + " at least";
    if (packet.interface >= _interfaces.size())
        return "message of interface " + std::to_string(packet.interface) + ", of which the section has " +
               std::to_string(_interfaces.size());
    const Interface& interface = _interfaces[packet.interface];
    if (interface.use == Use::Unreadable)
        return "message of interface " + std::to_string(packet.interface) +
               ", whose description was not readable";
    if (interface.use == Use::OtherTechnology || (interface.technology != 0 && !_readsAllTechnologies))
        return "message of " + std::string(shortTechnologyName(interface.description.name)) +
               " in a recording of " + technology();
    if (packet.captured > room - packet.offset)
        return "message of " + std::to_string(packet.captured) + " bytes in a block with room for " +
               std::to_string(room - packet.offset);
    if (packet.captured != packet.original)
        return "message cut short when it was captured: " + std::to_string(packet.captured) + " of " +
               std::to_string(packet.original) + " bytes";
    if (packet.captured > maximumMessageSize)
        return "message of " + std::to_string(packet.captured) + " bytes, wanted at most " +
               std::to_string(maximumMessageSize);
    return "time stamp " + std::to_string(packet.stamp) + " lies outside of the years 1678 to 2262";
}

void PcapngReader::addLossOf(const Block& block, std::uint64_t number, std::string reason) {
    addLoss({block.offset, block.length, number, std::move(reason), false});
}

} // namespace velmora
