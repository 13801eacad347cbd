// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/DriveView/EventRows.h"

#include "App/DriveView/DriveText.h"

#include <string>

namespace velmora {

namespace {

Color colorOf(Severity severity) {
    switch (severity) {
    case Severity::Info: return Color::secondary;
    case Severity::Warning: return Color::fair;
    case Severity::Critical: break;
    }
    return Color::poor;
}

} // namespace

std::vector<GridColumn> eventColumns() {
    return {{"Time", "23:59:59"}, {"Severity", "warning"}, {"Event", ""}};
}

std::string eventText(const Event& event) {
    return event.kind + (event.text.empty() ? "" : ": " + event.text) +
           (event.lasts && !event.end ? " (lasts)" : "");
}

EventRows eventRows(const std::deque<Event>& events, const SeverityFilter& filter, const Clock& clock,
                    std::size_t most) {
    EventRows made;
    for (const Event& each : events) {
        if (!filter[static_cast<std::size_t>(each.severity)])
            continue;
        if (made.rows.size() == most)
            break;
        const std::string text = eventText(each);
        made.rows.push_back({{clockText(each.time, clock), {}, Color::automatic, {}},
                             {std::string(nameOf(each.severity)), {}, colorOf(each.severity), {}},
                             {text, {}, Color::automatic, {}}});
        made.times.push_back(each.time);
    }
    return made;
}

} // namespace velmora
