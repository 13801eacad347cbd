// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Pcapng/RecordingCopy.h"

#include "Platform/TelephonyService.h"
#include "Recording/Pcapng/InterfaceDescription.h"
#include "Recording/Pcapng/Pcapng.h"
#include "Recording/Pcapng/PcapngBlocks.h"
#include "Recording/Pcapng/PcapngCopy.h"
#include "Recording/Positions/NMEAWriter.h"

#include <system_error>
#include <utility>

namespace velmora {

namespace {

constexpr std::size_t flushThreshold = std::size_t{64} << 10;

} // namespace

RecordingCopy::RecordingCopy(PcapngReader& reader, std::unique_ptr<OutputFile> file, std::string name,
                             Names names)
    : _reader(reader), _file(std::move(file)), _name(std::move(name)), _names(std::move(names)) {
    reader.setOtherBlocks([this](const PcapngReader::Block& block) { addOther(block); });
}

void RecordingCopy::setPositionRange(SentencesOfRange::SideOf sideOf) {
    _range.emplace(std::move(sideOf), [this](SentencesOfRange::Block block) { addBlock(std::move(block)); });
    _reader.setSentences([this](const PositionSentence& sentence) {
        _sentenceText = sentence.text;
        _sentence = {sentence.time, _sentenceText, sentence.number};
    });
}

Result<Done> RecordingCopy::addMessage(std::span<const std::string> comments) {
    std::vector<std::uint8_t> packet = pcapngCopy::readablePacket(_reader.block());
    if (!comments.empty() && !pcapngCopy::addComments(packet, comments, _reader.block().bigEndian))
        return Failure{"a packet of this kind cannot have a comment"};
    if (_range)
        _range->addMessage();
    addBlock(std::move(packet));
    return _failure ? Result<Done>(*_failure) : Done{};
}

Result<Done> RecordingCopy::addFix(const Fix& fix) {
    if (_hasPositions)
        return Failure{"the recording has positions already"};
    if (_isBigEndian)
        return Failure{"positions cannot be added to a big-endian recording"};
    add({});
    if (!_positionInterface) {
        _positionInterface = _interfaces++;
        pcapngBlocks::appendPositionInterface(_buffer);
    }
    for (const std::string& sentence : nmeaSentences(fix))
        pcapngBlocks::appendPacket(
            _buffer, fix.time, Bytes(reinterpret_cast<const std::uint8_t*>(sentence.data()), sentence.size()),
            *_positionInterface);
    return _failure ? Result<Done>(*_failure) : Done{};
}

Result<Done> RecordingCopy::finish() {
    if (_range)
        _range->endSection();
    add({});
    if (!_hasInterface && !_names.technology.empty())
        pcapngBlocks::appendInterface(_buffer, _names.technology);
    flush();
    return _failure ? Result<Done>(*_failure) : Done{};
}

void RecordingCopy::addOther(const PcapngReader::Block& block) {
    if (block.type == pcapng::BlockType::SectionHeader) {
        if (_range)
            _range->endSection();
        _hasSection = true;
        _isBigEndian = block.bigEndian;
        _interfaces = 0;
        _positionInterface.reset();
        add(pcapngCopy::sectionHeader(block));
    } else if (block.type == pcapng::BlockType::InterfaceDescription) {
        addInterface(block);
    } else if (_sentence) {
        addSentence(block);
    } else if (pcapngCopy::mayBeCopied(block)) {
        addBlock({block.bytes.begin(), block.bytes.end()});
    }
}

void RecordingCopy::addSentence(const PcapngReader::Block& block) {
    _range->add(*_sentence, {block.bytes.begin(), block.bytes.end()});
    _sentence.reset();
}

void RecordingCopy::addInterface(const PcapngReader::Block& block) {
    const auto interface = InterfaceDescription::read(block.body(), block.bigEndian);
    ++_interfaces;
    _hasPositions = _hasPositions || (interface && interface->linkType == pcapng::positionLinkType &&
                                      interface->name == pcapng::positionName);
    const bool isOfMessages = interface && interface->linkType == pcapng::logMessageLinkType;
    _hasInterface = _hasInterface || isOfMessages;
    const std::optional<std::string> name =
        isOfMessages ? newName(shortTechnologyName(interface->name)) : std::nullopt;
    if (name)
        add(pcapngCopy::renamedInterface(block, *name));
    else
        add(block.bytes);
}

std::optional<std::string> RecordingCopy::newName(std::string_view name) const {
    if (!_names.only.empty() && name != _names.only && !name.empty())
        return std::string();
    const bool isFirst = name.empty() || name == _reader.technology();
    if (!_names.technology.empty() && name != _names.technology && isFirst)
        return _names.technology;
    return std::nullopt;
}

/// Interfaces after the one of added positions have other numbers in the copy.
void RecordingCopy::addBlock(std::vector<std::uint8_t> block) {
    if (_positionInterface && *_positionInterface + 1 < _interfaces)
        pcapngCopy::shiftInterface(block, *_positionInterface);
    add(block);
}

void RecordingCopy::add(Bytes bytes) {
    // Where the recording's own is damaged, what follows is little-endian to its reader.
    if (!std::exchange(_hasSection, true))
        pcapngBlocks::appendSection(_buffer);
    _buffer.insert(_buffer.end(), bytes.begin(), bytes.end());
    if (_buffer.size() >= flushThreshold)
        flush();
}

void RecordingCopy::flush() {
    for (Bytes rest = _buffer; !rest.empty() && !_failure;) {
        const OutputFile::Written written = _file->write(rest);
        if (written.error != 0)
            _failure =
                Failure{"cannot write " + _name + ": " + std::generic_category().message(written.error)};
        rest = rest.subspan(written.bytes);
    }
    _buffer.clear();
}

} // namespace velmora
