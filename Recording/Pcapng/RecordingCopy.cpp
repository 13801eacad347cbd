// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Pcapng/RecordingCopy.h"

#include "Platform/TelephonyService.h"
#include "Recording/Pcapng/InterfaceDescription.h"
#include "Recording/Pcapng/Pcapng.h"
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
    flush();
    return _failure ? Result<Done>(*_failure) : Done{};
}

void RecordingCopy::addOther(const PcapngReader::Block& block) {
    if (block.type == pcapng::BlockType::SectionHeader)
        add(pcapngCopy::sectionHeader(block));
    else if (block.type == pcapng::BlockType::InterfaceDescription && isRenamed(block))
        add(pcapngCopy::renamedInterface(block, _technology));
    else if (pcapngCopy::mayBeCopied(block))
        add(block.bytes);
}

/// Whether the block describes an interface of the messages that are named anew.
bool RecordingCopy::isRenamed(const PcapngReader::Block& block) const {
    if (_technology.empty())
        return false;
    const auto interface = InterfaceDescription::read(block.body(), block.bigEndian);
    if (!interface || interface->linkType != pcapng::logMessageLinkType)
        return false;
    const std::string_view name = shortTechnologyName(interface->name);
    return name != _technology && (name.empty() || name == _reader.technology());
}

void RecordingCopy::add(Bytes bytes) {
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
