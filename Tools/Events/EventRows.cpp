// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Events/EventRows.h"

#include "Tools/Decode/Samples/PositionCells.h"
#include "Tools/Events/EventText.h"

#include <algorithm>
#include <array>

namespace velmora {

namespace {

/// The fields that have a column of their own.
constexpr std::array<std::string_view, 5> columns{"from", "to", "value", "cause", "duration"};

} // namespace

void EventRows::begin() {
    std::string header = "time,end,state,severity,kind,technology,text";
    for (const std::string_view column : columns)
        header.append(",").append(column);
    put(header.append(",unit,fields,evidence").append(placeColumns).append(csvRowEnd));
}

void EventRows::append(const Event& event, EventState state) {
    appendTime(event.time);
    line().append(',');
    if (event.lasts && event.end)
        appendTime(*event.end);
    line().append(',');
    line().append(nameOf(state));
    line().append(',');
    line().append(nameOf(event.severity));
    for (const std::string* const text : {&event.kind, &event.technology, &event.text}) {
        line().append(',');
        appendCsvText(line(), *text, _guard);
    }
    for (const std::string_view column : columns)
        appendField(event, column);
    line().append(',');
    if (const EventField* const value = event.field("value"))
        line().append(nameOf(value->unit));
    appendOthers(event);
    appendEvidence(event);
    appendPlaceCells(line(), place());
    line().append(csvRowEnd);
}

void EventRows::appendField(const Event& event, std::string_view name) {
    line().append(',');
    const EventField* const field = event.field(name);
    if (!field)
        return;
    const std::string text = textOf(field->value);
    if (std::holds_alternative<std::string>(field->value))
        appendCsvText(line(), text, _guard);
    else
        line().append(text);
}

void EventRows::appendOthers(const Event& event) {
    std::string text;
    for (const EventField& field : event.fields) {
        if (std::find(columns.begin(), columns.end(), field.name) != columns.end())
            continue;
        text.append(text.empty() ? "" : "; ").append(field.name).append("=").append(textOf(field.value));
    }
    line().append(',');
    if (!text.empty())
        appendCsvText(line(), text, _guard);
}

void EventRows::appendEvidence(const Event& event) {
    line().append(',');
    if (!event.evidence.empty())
        appendCsvText(line(), evidenceText(event, _names), _guard);
}

} // namespace velmora
