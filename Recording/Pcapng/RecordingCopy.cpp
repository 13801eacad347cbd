// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Pcapng/RecordingCopy.h"

#include "Platform/TelephonyService.h"
#include "Recording/Pcapng/InterfaceDescription.h"
#include "Recording/Pcapng/Pcapng.h"
#include "Recording/Pcapng/PcapngBlocks.h"
#include "Recording/Pcapng/PcapngCopy.h"

#include <system_error>
#include <utility>

namespace velmora {

namespace {

constexpr std::size_t flushThreshold = std::size_t{64} << 10;

} // namespace

RecordingCopy::RecordingCopy(PcapngReader& reader, std::unique_ptr<OutputFile> file, std::string name,
                             std::string technology)
    : _reader(reader), _file(std::move(file)), _name(std::move(name)), _technology(std::move(technology)) {
    reader.setOtherBlocks([this](const PcapngReader::Block& block) { addOther(block); });
}

Result<Done> RecordingCopy::addMessage() {
    add(_reader.block().bytes);
    return _failure ? Result<Done>(*_failure) : Done{};
}

Result<Done> RecordingCopy::finish() {
    add({});
    if (!_hasInterface && !_technology.empty())
        pcapngBlocks::appendInterface(_buffer, _technology);
    flush();
    return _failure ? Result<Done>(*_failure) : Done{};
}

void RecordingCopy::addOther(const PcapngReader::Block& block) {
    if (block.type == pcapng::BlockType::SectionHeader) {
        _hasSection = true;
        add(pcapngCopy::sectionHeader(block));
    } else if (block.type == pcapng::BlockType::InterfaceDescription) {
        addInterface(block);
    } else if (pcapngCopy::mayBeCopied(block)) {
        add(block.bytes);
    }
}

void RecordingCopy::addInterface(const PcapngReader::Block& block) {
    const auto interface = InterfaceDescription::read(block.body(), block.bigEndian);
    const bool isOfMessages = interface && interface->linkType == pcapng::logMessageLinkType;
    _hasInterface = _hasInterface || isOfMessages;
    const std::string_view name = isOfMessages ? shortTechnologyName(interface->name) : std::string_view();
    // Interfaces of another technology, whose packets are no messages of the reader's, keep their names.
    const bool isReaders = isOfMessages && (name.empty() || name == _reader.technology());
    if (isReaders && !_technology.empty() && name != _technology)
        add(pcapngCopy::renamedInterface(block, _technology));
    else
        add(block.bytes);
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
