// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Engine/EventEngine.h"

#include <utility>

namespace velmora {

EventEngine::EventEngine(const Catalogue& catalogue, EventSink& sink) : _picture(catalogue), _sink(sink) {}

void EventEngine::add(std::unique_ptr<Detector> detector) {
    _detectors.push_back(std::move(detector));
}

void EventEngine::report(const MessageReport& report) {
    _last = report.time;
    _picture.update(report);
    for (const auto& each : _detectors)
        each->report(report, _picture, _sink);
}

void EventEngine::finish() {
    if (!_last)
        return;
    for (const auto& each : _detectors)
        each->finish(*_last, _sink);
    _last.reset();
}

} // namespace velmora
