// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Events/EventLines.h"

#include "Tools/Decode/Samples/PositionCells.h"
#include "Tools/Decode/Samples/SampleText.h"
#include "Tools/Text/JSONText.h"

#include <cmath>

namespace velmora {

namespace {

void appendValue(TextBuffer& out, const EventField::Value& value) {
    if (const auto* const number = std::get_if<double>(&value)) {
        if (std::isfinite(*number))
            appendNumber(out, *number);
        else
            out.append("null");
    } else if (const auto* const flag = std::get_if<bool>(&value)) {
        out.append(*flag ? "true" : "false");
    } else {
        appendJsonString(out, std::get<std::string>(value));
    }
}

} // namespace

void EventLines::append(const Event& event, EventState state) {
    line().append("{\"time\":\"");
    appendTime(event.time);
    line().append('"');
    if (event.lasts && event.end) {
        line().append(",\"end\":\"");
        appendTime(*event.end);
        line().append('"');
    } else if (event.lasts) {
        line().append(",\"end\":null");
    }
    line().append(",\"state\":\"");
    line().append(nameOf(state));
    line().append("\",\"kind\":");
    appendJsonString(line(), event.kind);
    line().append(",\"severity\":\"");
    line().append(nameOf(event.severity));
    line().append("\",\"technology\":");
    appendJsonString(line(), event.technology);
    line().append(",\"text\":");
    appendJsonString(line(), event.text);
    appendFields(event);
    appendEvidence(event);
    appendPlaceMembers(line(), place());
    line().append("}\n");
}

void EventLines::appendFields(const Event& event) {
    line().append(",\"fields\":{");
    for (const EventField& field : event.fields) {
        if (&field != &event.fields.front())
            line().append(',');
        appendJsonString(line(), field.name);
        line().append(':');
        appendValue(line(), field.value);
    }
    line().append("},\"units\":{");
    bool isFirst = true;
    for (const EventField& field : event.fields) {
        if (field.unit == Unit::None || !std::holds_alternative<double>(field.value))
            continue;
        if (!isFirst)
            line().append(',');
        isFirst = false;
        appendJsonString(line(), field.name);
        line().append(":\"");
        line().append(nameOf(field.unit));
        line().append('"');
    }
    line().append('}');
}

void EventLines::appendEvidence(const Event& event) {
    line().append(",\"evidence\":[");
    for (std::size_t i = 0; i < event.evidence.size(); ++i) {
        line().append(i == 0 ? "{" : ",{");
        if (const std::string_view file = _names.fileOf(event.evidence[i]); !file.empty()) {
            line().append("\"file\":");
            appendJsonString(line(), file);
            line().append(',');
        }
        line().append("\"record\":");
        appendNumber(line(), event.evidence[i].number);
        line().append('}');
    }
    line().append(']');
}

} // namespace velmora
