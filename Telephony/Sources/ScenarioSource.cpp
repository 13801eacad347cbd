// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Sources/ScenarioSource.h"

#include <utility>

namespace velmora {

ScenarioSource::ScenarioSource(MainQueue& queue, const Clock& clock, Make make, double speed)
    : _make(std::move(make)), _technology(_make()->technology()), _player(queue, clock, speed) {}

void ScenarioSource::start(LogSink& sink) {
    _player.start(
        sink, [scenario = std::shared_ptr<Scenario>(_make())] { return std::optional(scenario->next()); });
}

} // namespace velmora
