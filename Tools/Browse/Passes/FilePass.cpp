// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/Passes/FilePass.h"

#include "Playback/QuietDecoding.h"

#include <optional>
#include <utility>

namespace velmora {

FilePass::FilePass(const BrowsedFile& file, Decoding decoding) : _file(file) {
    const QuietDecoding quiet;
    if (auto reader = file.file().from(file.index().checkpoints().front().place))
        _reader = *std::move(reader);
    if (decoding == Decoding::With)
        if (auto decoder = PlayedDecoder::make(file.index().technology(), {}))
            _decoder = *std::move(decoder);
}

FilePass::~FilePass() {
    if (_decoder)
        _decoder->decoder().setObservationSink(nullptr);
}

void FilePass::beginObserving() {
    _decoder->decoder().setObservationSink(this);
}

bool FilePass::step(std::uint64_t messages) {
    const QuietDecoding quiet;
    for (; messages > 0 && !_isDone && _position < _file.messages(); --messages) {
        std::optional<LoggedMessage> message = _reader ? _reader->next() : std::nullopt;
        while (message && !_file.index().has(*message))
            message = _reader->next();
        _isDone = !message;
        if (!message)
            break;
        if (_decoder)
            _decoder->take(*message);
        took(*message);
        ++_position;
    }
    if (_position >= _file.messages() && _file.isComplete())
        _isDone = true;
    if (_isDone)
        ended();
    return !_isDone;
}

} // namespace velmora
