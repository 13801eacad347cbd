// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Detectors/Calls.h"

#include "Analysis/Detectors/ReportedValue.h"
#include "Analysis/Events/NewEvent.h"
#include "Analysis/Picture/RadioPicture.h"

#include <algorithm>

namespace velmora {

CallsDetector::CallsDetector(const Catalogue& catalogue, const DetectorTable& table)
    : _rows(table.calls), _leaves(catalogue) {
    for (const CallRow& row : _rows)
        if (std::none_of(_sources.begin(), _sources.end(),
                         [&row](const Source& each) { return each.path == row.value.path; }))
            _sources.push_back({row.value.path});
}

void CallsDetector::update(const Observation& observation) {
    const auto isOfSource = [this](std::string_view path, std::size_t i) { return path == _sources[i].path; };
    for (const std::uint8_t i : _leaves.of(*observation.leaf, _sources.size(), isOfSource)) {
        Source& source = _sources[i];
        source = {source.path};
        if (observation.kind == ObservedKind::Absent)
            continue;
        source.isKnown = true;
        for (const CallRow& row : _rows)
            if (row.value.path == source.path && isValue(observation, row.value))
                (row.state == CallState::Active ? source.isActive : source.isReestablishing) = true;
    }
}

CallsDetector::State CallsDetector::stateOfAll() const {
    const auto any = [this](auto member) {
        return std::any_of(_sources.begin(), _sources.end(),
                           [member](const Source& each) { return each.*member; });
    };
    if (any(&Source::isReestablishing))
        return State::Reestablishing;
    if (any(&Source::isActive))
        return State::Active;
    return any(&Source::isKnown) ? State::None : State::Unknown;
}

void CallsDetector::report(const MessageReport& report, const RadioPicture& picture, EventSink& sink) {
    if (_rows.empty())
        return;
    for (const Observation& each : report.observed.observations)
        update(each);
    if (_state == State::Active && picture.mode() == RadioMode::Searching)
        _hasLostRadio = true;
    if (const State state = stateOfAll(); state != _state)
        change(state, report, picture, sink);
}

void CallsDetector::change(State state, const MessageReport& report, const RadioPicture& picture,
                           EventSink& sink) {
    const State before = _state;
    _state = state;
    if (before == State::Unknown || state == State::Unknown) {
        _since.reset();
        _hasLostRadio = false;
        _message = report.message;
        return;
    }
    if (state == State::Reestablishing) {
        Event event = newEvent(EventKind::Reestablishment, report, picture);
        event.text = "the phone tries to re-establish its connection";
        sink.happened(event);
    } else if (state == State::None) {
        end(report, picture, sink, before == State::Reestablishing || _hasLostRadio);
    } else if (before == State::None) {
        Event event = newEvent(EventKind::CallSetup, report, picture);
        event.text = "connection active";
        sink.happened(event);
        _since = report.time;
        _message = report.message;
        _hasLostRadio = false;
    }
}

void CallsDetector::end(const MessageReport& report, const RadioPicture& picture, EventSink& sink,
                        bool isLost) {
    Event event = newEvent(isLost ? EventKind::CallLost : EventKind::CallEnd, report, picture);
    event.text = isLost ? "connection lost" : "connection ended";
    if (_since)
        addDuration(event, *_since, report.time);
    addEvidence(event, _message);
    sink.happened(event);
    _since.reset();
    _hasLostRadio = false;
}

void CallsDetector::interrupt(Time, EventSink&) {
    for (Source& each : _sources)
        each = {each.path};
    _state = State::Unknown;
    _since.reset();
    _hasLostRadio = false;
}

} // namespace velmora
