// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Detectors/Service.h"

#include "Analysis/Detectors/ReportedValue.h"
#include "Analysis/Events/NewEvent.h"
#include "Analysis/Picture/RadioPicture.h"

namespace velmora {

void ServiceDetector::report(const MessageReport& report, const RadioPicture& picture, EventSink& sink) {
    std::optional<Service> stated;
    const auto isOfRow = [this](std::string_view path, std::size_t i) { return path == _rows[i].value.path; };
    for (const Observation& observation : report.observed.observations)
        for (const std::uint8_t i : _leaves.of(*observation.leaf, _rows.size(), isOfRow))
            if (isValue(observation, _rows[i].value))
                stated = _rows[i].service;
    // A phone that is off lacks no service.
    if (!stated && _lasting && picture.mode() == RadioMode::Off)
        stated = Service::Normal;
    if (!stated || *stated == _service)
        return;
    if (_lasting) {
        addEvidence(*_lasting, report.message);
        end(report.time, sink);
    }
    _service = *stated;
    if (_service == Service::Normal)
        return;
    const bool isNone = _service == Service::None;
    Event event = newEvent(isNone ? EventKind::OutOfService : EventKind::LimitedService, report, picture);
    event.text = isNone ? "no service" : "emergency calls alone";
    sink.began(event);
    _lasting = std::move(event);
}

void ServiceDetector::end(std::optional<Time> time, EventSink& sink) {
    _lasting->end = time;
    if (time)
        addDuration(*_lasting, _lasting->time, *time);
    sink.happened(*_lasting);
    _lasting.reset();
}

void ServiceDetector::interrupt(Time, EventSink& sink) {
    if (_lasting)
        end(std::nullopt, sink);
    _service = Service::Normal;
}

} // namespace velmora
