// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Events/Event.h"
#include "Tests/Tools/ToolFixture.h"

#include <string>

namespace velmora {

/// One that happens so many milliseconds after the time that tests begin at.
[[nodiscard]] inline Event eventAt(std::int64_t milliseconds, std::string kind = "handover",
                                   Severity severity = Severity::Info) {
    Event event;
    event.time = at(milliseconds);
    event.kind = std::move(kind);
    event.severity = severity;
    event.technology = "Ostrel_LTE";
    return event;
}

/// One that lasts, from one time to the other.
[[nodiscard]] inline Event lastingEvent(std::int64_t from, std::int64_t to,
                                        std::string kind = "weak-coverage") {
    Event event = eventAt(from, std::move(kind), Severity::Warning);
    event.lasts = true;
    event.end = at(to);
    return event;
}

} // namespace velmora
