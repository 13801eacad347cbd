// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Events/NewEvent.h"

#include "Analysis/Picture/RadioPicture.h"

#include <algorithm>
#include <chrono>
#include <utility>

namespace velmora {

namespace {

std::string dotted(std::string_view name, std::string_view part) {
    return std::string(name) + '.' + std::string(part);
}

void addNumber(Event& event, std::string_view name, std::string_view part,
               const std::optional<double>& number) {
    if (number)
        event.fields.push_back({dotted(name, part), *number, Unit::None});
}

} // namespace

Event newEvent(EventKind kind, const MessageReport& report, const RadioPicture& picture) {
    const EventKindRow& row = rowOf(kind);
    Event event;
    event.time = report.time;
    event.lasts = row.lasts;
    event.kind = row.name;
    event.severity = row.severity;
    event.technology = picture.catalogue().technology();
    event.evidence.push_back(report.message);
    return event;
}

void addField(Event& event, std::string_view name, std::string text) {
    if (!text.empty())
        event.fields.push_back({std::string(name), std::move(text), Unit::None});
}

void addField(Event& event, std::string_view name, double number, Unit unit) {
    event.fields.push_back({std::string(name), number, unit});
}

void addField(Event& event, std::string_view name, const CellIdentity& cell) {
    addField(event, name, nameOf(cell));
    if (cell.technology)
        addField(event, dotted(name, "technology"), std::string(nameOf(*cell.technology)));
    addNumber(event, name, "cell", cell.cell);
    addNumber(event, name, "channel", cell.channel);
    addNumber(event, name, "physical-cell", cell.physicalCell);
    addNumber(event, name, "area", cell.area);
    addField(event, dotted(name, "network"), cell.network);
}

void addChange(Event& event, const std::string& from, const std::string& to) {
    addField(event, "from", from);
    addField(event, "to", to);
    event.text = from + " to " + to;
}

void addDuration(Event& event, Time from, Time to) {
    const double seconds = std::chrono::duration<double>(to - from).count();
    addField(event, "duration", std::max(seconds, 0.0), Unit::Second);
}

void addEvidence(Event& event, MessageNumber message) {
    const auto place = std::lower_bound(event.evidence.begin(), event.evidence.end(), message);
    if (place != event.evidence.end() && *place == message)
        return;
    event.evidence.insert(place, message);
    // The first and the latest ones are kept.
    if (event.evidence.size() > Event::mostEvidence)
        event.evidence.erase(event.evidence.begin() + Event::mostEvidence / 2);
}

} // namespace velmora
