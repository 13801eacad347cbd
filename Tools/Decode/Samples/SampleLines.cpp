// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Samples/SampleLines.h"

#include "Tools/Decode/Samples/PositionCells.h"
#include "Tools/Decode/Samples/SampleText.h"
#include "Tools/Text/JSONText.h"

namespace velmora {

SampleLines::SampleLines(Output& output, bool isLive, const DecodeOptions& options, const std::string& file)
    : SampleWriter(output, isLive, options, LeafTexts::Form::JSON) {
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

std::string SampleLines::textOf(const Decoded& decoded) const {
    return decoded.isOneOfSeveral ? ",\"technology\":\"" + decoded.technology + "\"" : std::string();
}

void SampleLines::begin(const ObservedMessage& message) {
    _head.append(_begin);
    appendTime(_head, message.arrival);
    _head.append('"');
    if (const std::optional<Time> own = modemTime(message)) {
        _head.append(",\"modemTime\":\"");
        appendTime(_head, *own);
        _head.append('"');
    }
    _head.append(technology().text);
    _tail.clear();
    _tail.append(",\"code\":");
    if (message.code)
        appendNumber(_tail, std::uint64_t{*message.code});
    else
        _tail.append("null");
    _tail.append(",\"record\":");
    appendNumber(_tail, record());
    if (hasPositions())
        appendPositionMembers(_tail, position());
    _tail.append("}\n");
}

void SampleLines::write(const ObservedMessage& message) {
    _head.clear();
    for (const Observation& observation : message.observations) {
        const SelectedLeaves::Choice* const choice = technology().selected.of(observation);
        if (!choice)
            continue;
        if (_head.size() == 0)
            begin(message);
        line().append(_head.view());
        technology().leaves.append(line(), observation, choice->path);
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
        appendHexadecimal(line(), observation.bytes);
        line().append('"');
        break;
    case ObservedKind::Absent: line().append("null"); break;
    }
}

} // namespace velmora
