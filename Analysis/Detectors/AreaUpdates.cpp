// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Detectors/AreaUpdates.h"

#include "Analysis/Events/NewEvent.h"
#include "Analysis/Picture/RadioPicture.h"

#include <algorithm>

namespace velmora {

AreaUpdatesDetector::AreaUpdatesDetector(const Catalogue& catalogue, const DetectorTable& table)
    : _rows(table.areaUpdates), _leaves(catalogue), _procedures(_rows.size()) {}

void AreaUpdatesDetector::update(const Observation& observation) {
    const auto isOfRow = [this](std::string_view path, std::size_t i) {
        return path == _rows[i].statePath || path == _rows[i].statusPath;
    };
    for (const std::uint8_t i : _leaves.of(*observation.leaf, _rows.size(), isOfRow)) {
        Procedure& procedure = _procedures[i];
        if (observation.kind == ObservedKind::Absent)
            continue;
        if (observation.leaf->path == _rows[i].statePath) {
            procedure.state = observation.raw;
        } else {
            procedure.status = observation.raw;
            if (procedure.isUpdating)
                procedure.statusText = _texts.of(observation);
        }
    }
}

void AreaUpdatesDetector::report(const MessageReport& report, const RadioPicture& picture, EventSink& sink) {
    for (const Observation& each : report.observed.observations)
        update(each);
    for (std::size_t i = 0; i < _rows.size(); ++i) {
        Procedure& procedure = _procedures[i];
        if (!procedure.state)
            continue;
        const bool isUpdating = *procedure.state == _rows[i].updating;
        if (isUpdating && !procedure.isUpdating) {
            procedure.since = procedure.isStateKnown ? std::optional(report.time) : std::nullopt;
            procedure.message = report.message;
        } else if (!isUpdating && procedure.isUpdating) {
            end(_rows[i], procedure, report, picture, sink);
        }
        procedure.isUpdating = isUpdating;
        procedure.isStateKnown = true;
        procedure.state.reset(), procedure.status.reset();
    }
}

void AreaUpdatesDetector::end(const AreaUpdateRow& row, const Procedure& procedure,
                              const MessageReport& report, const RadioPicture& picture,
                              EventSink& sink) const {
    const auto isRefused = [&row](std::int64_t status) {
        return std::find(row.refused.begin(), row.refused.end(), status) != row.refused.end();
    };
    const bool isRejected =
        *procedure.state == row.rejected || (procedure.status && isRefused(*procedure.status));
    const bool isAccepted = !isRejected && procedure.status == row.accepted;
    Event event = newEvent(EventKind::AreaUpdate, report, picture);
    const std::string outcome = isRejected ? "rejected" : isAccepted ? "accepted" : "unknown";
    addField(event, "type", std::string(row.type));
    addField(event, "outcome", outcome);
    if (isRejected) {
        event.severity = Severity::Warning;
        addField(event, "cause", procedure.statusText);
    }
    event.text = std::string(row.type) + " area update: " + outcome;
    if (procedure.since)
        addDuration(event, *procedure.since, report.time);
    addEvidence(event, procedure.message);
    sink.happened(event);
}

void AreaUpdatesDetector::interrupt(Time, EventSink&) {
    std::fill(_procedures.begin(), _procedures.end(), Procedure());
}

} // namespace velmora
