// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Detectors/ServingCell.h"

#include "Analysis/Events/NewEvent.h"
#include "Analysis/Picture/RadioPicture.h"

namespace velmora {

namespace {

EventKind kindOf(const ServingChange& change) {
    if (!change.isMovedByNetwork)
        return EventKind::CellChange;
    return *change.isMovedByNetwork ? EventKind::Handover : EventKind::CellReselection;
}

Event changeOf(EventKind kind, const ServingChange& change, const MessageReport& report,
               const RadioPicture& picture) {
    Event event = newEvent(kind, report, picture);
    event.text = nameOf(change.from) + " to " + nameOf(change.to);
    addField(event, "from", change.from);
    addField(event, "to", change.to);
    addEvidence(event, change.lastOfOld);
    return event;
}

} // namespace

void ServingCellDetector::report(const MessageReport& report, const RadioPicture& picture, EventSink& sink) {
    const ServingChange* const change = picture.servingChange();
    if (!change)
        return;
    Event moved = changeOf(kindOf(*change), *change, report, picture);
    if (change->mode)
        addField(moved, "mode", std::string(nameOf(*change->mode)));
    if (change->since)
        addDuration(moved, *change->since, report.time);
    sink.happened(moved);
    const auto& from = change->from.technology;
    const auto& to = change->to.technology;
    if (from && to && *from != *to) {
        Event event = newEvent(EventKind::TechnologyChange, report, picture);
        addChange(event, std::string(nameOf(*from)), std::string(nameOf(*to)));
        addEvidence(event, change->lastOfOld);
        sink.happened(event);
    }
    if (change->before && change->since && report.time - *change->since <= pingPongTime &&
        areSameCell(*change->before, change->to) == true) {
        Event event = changeOf(EventKind::PingPong, *change, report, picture);
        event.text = "back to " + nameOf(change->to) + " from " + nameOf(change->from);
        addDuration(event, *change->since, report.time);
        addEvidence(event, change->firstOfOld);
        sink.happened(event);
    }
}

} // namespace velmora
