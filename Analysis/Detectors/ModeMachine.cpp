// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Detectors/ModeMachine.h"

#include "Analysis/Events/NewEvent.h"
#include "Analysis/Picture/RadioPicture.h"

namespace velmora {

void ModeMachineDetector::report(const MessageReport& report, const RadioPicture& picture, EventSink& sink) {
    const std::optional<RadioMode> mode = picture.mode();
    if (!mode) {
        _since.reset(); // it may have been another one in between
        return;
    }
    if (mode == _mode)
        return;
    if (_mode) {
        Event event = newEvent(EventKind::RadioState, report, picture);
        addChange(event, std::string(nameOf(*_mode)), std::string(nameOf(*mode)));
        event.text.insert(0, std::string(_name) + ": ");
        addField(event, "machine", std::string(_name));
        if (_since)
            addDuration(event, *_since, report.time);
        addEvidence(event, _message);
        sink.happened(event);
        _since = report.time;
    }
    _mode = mode;
    _message = report.message;
}

void ModeMachineDetector::interrupt(Time, EventSink&) {
    _mode.reset();
    _since.reset();
}

} // namespace velmora
