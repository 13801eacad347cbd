// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Events/EventSelection.h"

#include <algorithm>

namespace velmora {

bool EventSelection::contains(const Event& event, Time first) const {
    if (!matches(event) || (range.to && event.time >= TimeRange::momentOf(*range.to, first)))
        return false;
    if (!range.from)
        return true;
    const Time end = event.end.value_or(event.lasts ? Time::max() : event.time);
    return end >= TimeRange::momentOf(*range.from, first);
}

bool EventSelection::containsBegin(const Event& event, Time first) const {
    return matches(event) && range.contains(event.time, first);
}

bool EventSelection::matches(const Event& event) const {
    return event.severity >= least &&
           (kinds.empty() || std::find(kinds.begin(), kinds.end(), event.kind) != kinds.end());
}

} // namespace velmora
