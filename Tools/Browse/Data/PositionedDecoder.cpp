// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/Data/PositionedDecoder.h"

#include <algorithm>
#include <string>
#include <utility>

namespace velmora {

PositionedDecoder::~PositionedDecoder() {
    end();
}

void PositionedDecoder::end() {
    if (_decoder)
        _decoder->decoder().setObservationSink(nullptr);
    _decoder.reset();
}

Result<bool> PositionedDecoder::standBefore(std::uint64_t position, std::uint64_t lead) {
    const RecordingIndex::Checkpoint& checkpoint =
        _file.index().beforeMessage(position - std::min(position, lead));
    if (_decoder && _decoder->messages() <= position && checkpoint.messages() <= _decoder->messages())
        return false;
    end();
    const std::string& technology = _file.index().technology();
    Result<std::unique_ptr<PlayedDecoder>> decoder =
        checkpoint.decoder ? PlayedDecoder::make(technology, {}, *checkpoint.decoder)
                           : PlayedDecoder::make(technology, {});
    if (!decoder)
        return Failure{decoder.reason()};
    _decoder = *std::move(decoder);
    _beginning = checkpoint.latest;
    _decoder->decoder().setObservationSink(&_sink);
    return true;
}

} // namespace velmora
