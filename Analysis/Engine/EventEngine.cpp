// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Engine/EventEngine.h"

#include "Analysis/Detectors/BuiltIn.h"

#include <algorithm>
#include <utility>

namespace velmora {

EventEngine::EventEngine(const Catalogue& catalogue, EventSink& sink)
    : _picture(catalogue), _sink(sink), _checks(catalogue.technology(), sink),
      _detectors(builtInDetectors(catalogue)) {}

void EventEngine::add(std::unique_ptr<Detector> detector) {
    _detectors.push_back(std::move(detector));
}

bool EventEngine::wants(const CatalogueField& leaf) const {
    return _picture.wants(leaf) || std::any_of(_detectors.begin(), _detectors.end(),
                                               [&leaf](const auto& each) { return each->wants(leaf); });
}

void EventEngine::report(const MessageReport& report) {
    if (_checks.isInterruption(report))
        interrupt();
    _checks.report(report);
    // A malformed message may state anything.
    if (report.observed.damage != Damage::None)
        return;
    _picture.update(report);
    for (const auto& each : _detectors)
        each->report(report, _picture, _sink);
}

void EventEngine::damaged(MessageNumber message, std::string_view reason) {
    interrupt();
    _checks.damaged(message, reason);
}

void EventEngine::interrupt() {
    _picture.clear();
    if (const std::optional<Time> last = _checks.last())
        for (const auto& each : _detectors)
            each->interrupt(*last, _sink);
}

void EventEngine::finish() {
    if (const std::optional<Time> last = _checks.last())
        for (const auto& each : _detectors)
            each->finish(*last, _sink);
    _checks.finish();
}

} // namespace velmora
