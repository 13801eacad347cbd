// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Detectors/StoredAreas.h"

#include "Analysis/Events/NewEvent.h"
#include "Analysis/Picture/RadioPicture.h"

namespace velmora {

void StoredAreasDetector::report(const MessageReport& report, const RadioPicture& picture, EventSink& sink) {
    const auto isOfRow = [this](std::string_view path, std::size_t i) { return path == _rows[i].path; };
    for (const Observation& observation : report.observed.observations)
        for (const std::uint8_t i : _leaves.of(*observation.leaf, _rows.size(), isOfRow)) {
            if (observation.kind == ObservedKind::Absent)
                continue;
            Stored& stored = _stored[i];
            const bool wasKnown = stored.value.isKnown();
            if (stored.value.update(observation, _texts) && wasKnown) {
                Event event = newEvent(EventKind::AreaUpdate, report, picture);
                addChange(event, stored.value.previous(), stored.value.text());
                event.text.insert(0, std::string(_rows[i].type) + " area update: ");
                addField(event, "type", std::string(_rows[i].type));
                addField(event, "outcome", "accepted");
                addEvidence(event, stored.message);
                sink.happened(event);
            }
            stored.message = report.message;
        }
}

void StoredAreasDetector::interrupt(Time, EventSink&) {
    for (Stored& each : _stored)
        each.value.forget();
}

} // namespace velmora
