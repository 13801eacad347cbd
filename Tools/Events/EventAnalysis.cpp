// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Events/EventAnalysis.h"

namespace velmora {

void EventAnalysis::reportUndecoded(const UndecodedReport& report) {
    ObservedMessage nothing{};
    nothing.number = report.message.number;
    nothing.arrival = report.arrival;
    nothing.damage = Damage::Unreadable;
    _engine.report({report.message, report.time, nothing});
}

} // namespace velmora
