// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/MaskedRecording.h"

#include "Recording/Pcapng/Pcapng.h"
#include "Recording/Pcapng/PcapngBlocks.h"
#include "Recording/Positions/NMEASentence.h"

#include <algorithm>
#include <system_error>
#include <utility>

namespace velmora {

namespace {

constexpr std::size_t flushThreshold = std::size_t{256} << 10;

} // namespace

MaskedRecording::MaskedRecording(std::unique_ptr<OutputFile> file, std::string name, MaskSeal seal)
    : _file(std::move(file)), _name(std::move(name)), _seal(std::move(seal)) {
    pcapngBlocks::appendSection(_buffer, _seal.text());
}

std::uint32_t MaskedRecording::interfaceOf(std::string_view technology) {
    const auto found = std::ranges::find(_interfaces, technology);
    const auto index = static_cast<std::uint32_t>(found - _interfaces.begin());
    if (found == _interfaces.end()) {
        pcapngBlocks::appendInterface(_buffer, technology);
        _interfaces.emplace_back(technology);
    }
    return index;
}

Result<Done> MaskedRecording::add(Time time, Bytes message, std::string_view technology,
                                  std::span<const std::string> comments) {
    _digest.add(technology, message);
    pcapngBlocks::appendPacket(_buffer, time, message, interfaceOf(technology), comments);
    return _buffer.size() < flushThreshold ? Result<Done>(Done{}) : flush();
}

void MaskedRecording::addSentence(Time time, std::string_view sentence) {
    if (_interfaces.empty())
        return;
    _sentences.addSentence(sentence);
    const auto found = std::ranges::find(_interfaces, pcapng::positionName);
    const auto index = static_cast<std::uint32_t>(found - _interfaces.begin());
    if (found == _interfaces.end()) {
        pcapngBlocks::appendPositionInterface(_buffer);
        _interfaces.emplace_back(pcapng::positionName);
    }
    pcapngBlocks::appendPacket(
        _buffer, time, Bytes(reinterpret_cast<const std::uint8_t*>(sentence.data()), sentence.size()), index);
}

void MaskedRecording::addSentencesOf(MessageReader& reader) {
    // A sentence without a kind is a maker's own, and may hold the receiver's number.
    if (_seal.level != MaskLevel::All)
        reader.setSentences([this](const PositionSentence& each) {
            if (const auto sentence = NMEASentence::parse(each.text); sentence && !sentence->kind().empty())
                addSentence(each.time, each.text);
        });
}

Result<Done> MaskedRecording::finish(std::string_view technology) {
    if (_interfaces.empty())
        static_cast<void>(interfaceOf(technology));
    _seal.digest = _digest.text();
    _seal.positions = _sentences.text();
    pcapngBlocks::appendComment(_buffer, _seal.text());
    return flush();
}

Result<Done> MaskedRecording::flush() {
    for (Bytes rest = _buffer; !rest.empty();) {
        const OutputFile::Written written = _file->write(rest);
        if (written.error != 0)
            return Failure{"cannot write " + _name + ": " + std::generic_category().message(written.error)};
        rest = rest.subspan(written.bytes);
    }
    _buffer.clear();
    return Done{};
}

} // namespace velmora
