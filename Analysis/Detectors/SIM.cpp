// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Detectors/SIM.h"

#include "Analysis/Events/NewEvent.h"
#include "Analysis/Picture/RadioPicture.h"

namespace velmora {

void SIMDetector::report(const MessageReport& report, const RadioPicture& picture, EventSink& sink) {
    const auto isOfRow = [this](std::string_view path, std::size_t i) { return path == _paths[i]; };
    for (const Observation& observation : report.observed.observations) {
        if (_leaves.of(*observation.leaf, _paths.size(), isOfRow).empty() ||
            observation.kind == ObservedKind::Absent)
            continue;
        const bool wasKnown = _sim.isKnown();
        if (_sim.update(observation, _texts) && wasKnown) {
            Event event = newEvent(EventKind::SIMChange, report, picture);
            addChange(event, _sim.previous(), _sim.text());
            addEvidence(event, _message);
            sink.happened(event);
        }
        _message = report.message;
    }
}

} // namespace velmora
