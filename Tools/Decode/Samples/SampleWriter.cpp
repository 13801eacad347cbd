// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Samples/SampleWriter.h"

#include "LogMessages/RecordTime.h"
#include "Tools/Decode/Samples/SampleText.h"
#include "Tools/Text/CSVText.h"
#include "Tools/Text/JSONText.h"

namespace velmora {

SampleWriter::SampleWriter(Output& output, bool isLive, const DecodeOptions& options, const std::string& file)
    : LineWriter(output, isLive), _options(options), _selected(options.selection), _file(file),
      _isLive(isLive) {}

void SampleWriter::didMakeDecoder(LogGenerator& decoder) {
    LineWriter::didMakeDecoder(decoder);
    decoder.setObservationSink(this);
}

void SampleWriter::willDecode(const LoggedMessage& message) {
    _arrival = message.time;
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

SampleLines::SampleLines(Output& output, bool isLive, const DecodeOptions& options, const std::string& file)
    : SampleWriter(output, isLive, options, file), _leaves(options.selection, LeafTexts::Form::JSON) {
    TextBuffer text;
    text.append('{');
    if (!file.empty()) {
        text.append("\"file\":");
        appendJsonString(text, file);
        text.append(',');
    }
    text.append("\"time\":\"");
    _begin = text.view();
}

void SampleLines::write(const ObservedMessage& message) {
    _head.clear();
    for (const Observation& observation : message.observations) {
        const SelectedLeaves::Choice* const choice = selected().of(observation);
        if (!choice)
            continue;
        if (_head.size() == 0) {
            _head.append(_begin);
            appendTime(_head, arrival());
            _head.append('"');
            if (const std::optional<Time> own = modemTime(message)) {
                _head.append(",\"modemTime\":\"");
                appendTime(_head, *own);
                _head.append('"');
            }
            _tail.clear();
            _tail.append(",\"code\":");
            if (message.code)
                appendNumber(_tail, std::uint64_t{*message.code});
            else
                _tail.append("null");
            _tail.append(",\"record\":");
            appendNumber(_tail, record());
            _tail.append("}\n");
        }
        line().append(_head.view());
        _leaves.append(line(), observation, choice->path);
        if (!observation.rowKey.empty()) {
            line().append(",\"row\":");
            appendJsonString(line(), observation.rowKey);
        }
        line().append(",\"value\":");
        appendValue(observation);
        if (observation.kind == ObservedKind::Number && observation.leaf->unit != Unit::None) {
            line().append(",\"unit\":\"");
            line().append(nameOf(observation.leaf->unit));
            line().append('"');
        }
        line().append(",\"text\":");
        appendJsonString(line(), _text.of(observation));
        endLine(_tail.view());
    }
}

void SampleLines::appendValue(const Observation& observation) {
    switch (observation.kind) {
    case ObservedKind::Number: appendNumber(line(), observation.number); break;
    case ObservedKind::Enumeration: appendJson(line(), observation.raw); break;
    case ObservedKind::Flag: line().append(observation.raw != 0 ? "true" : "false"); break;
    case ObservedKind::Text: appendJsonString(line(), observation.words); break;
    case ObservedKind::Binary:
        line().append('"');
        appendCsvValue(line(), observation);
        line().append('"');
        break;
    case ObservedKind::Absent: line().append("null"); break;
    }
}

SampleRows::SampleRows(Output& output, bool isLive, const DecodeOptions& options, const std::string& file)
    : SampleWriter(output, isLive, options, file), _leaves(options.selection, LeafTexts::Form::CSV) {
    if (file.empty())
        return;
    TextBuffer cell;
    cell.append(',');
    appendCsvText(cell, file);
    _fileCell = cell.view();
}

std::string SampleRows::header(const DecodeOptions& options) {
    return std::string(options.files.size() > 1 ? "time,file" : "time") +
           ",modem_time,path,row,value,unit,text,code,record" + std::string(csvRowEnd);
}

void SampleRows::write(const ObservedMessage& message) {
    _head.clear();
    for (const Observation& observation : message.observations) {
        const SelectedLeaves::Choice* const choice = selected().of(observation);
        if (!choice)
            continue;
        if (_head.size() == 0) {
            appendTime(_head, arrival());
            _head.append(_fileCell);
            _head.append(',');
            if (const std::optional<Time> own = modemTime(message))
                appendTime(_head, *own);
            _head.append(',');
            _tail.clear();
            _tail.append(',');
            appendLogCode(_tail, message.code);
            _tail.append(',');
            appendNumber(_tail, record());
            _tail.append(csvRowEnd);
        }
        line().append(_head.view());
        _leaves.append(line(), observation, choice->path);
        line().append(',');
        if (!observation.rowKey.empty())
            appendCsvText(line(), observation.rowKey);
        line().append(',');
        appendCsvValue(line(), observation);
        line().append(',');
        if (observation.kind == ObservedKind::Number)
            line().append(nameOf(observation.leaf->unit));
        line().append(',');
        appendCsvText(line(), _text.of(observation));
        endLine(_tail.view());
    }
}

} // namespace velmora
