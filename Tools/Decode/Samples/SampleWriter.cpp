// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Samples/SampleWriter.h"

#include "LogMessages/RecordTime.h"

namespace velmora {

SampleWriter::SampleWriter(Output& output, bool isLive, const DecodeOptions& options, LeafTexts::Form form)
    : LineWriter(output, isLive), _options(options), _form(form), _isLive(isLive) {}

void SampleWriter::didMakeDecoder(LogGenerator& decoder) {
    decoder.setObservationSink(this);
    decoder.setWantedPaths({}); // no display is shown
}

void SampleWriter::willConcern(const Decoded& decoded) {
    const auto entry = _technologies.try_emplace(decoded.technology, _options, _form).first;
    _technology = &entry->second;
    _technology->text = textOf(decoded);
}

void SampleWriter::willDecode(const LoggedMessage& message) {
    _record = message.number;
    _isWanted = true;
}

void SampleWriter::didDecode(const LoggedMessage&, LogGenerator&, Dictionary&) {
    if (_isLive)
        flush();
}

std::optional<Time> SampleWriter::modemTime(const ObservedMessage& message) {
    return message.timestamp && isRecordTime(*message.timestamp) ? timeOfRecord(*message.timestamp)
                                                                 : std::nullopt;
}

} // namespace velmora
