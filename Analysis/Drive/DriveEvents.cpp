// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Drive/DriveEvents.h"

#include <algorithm>

namespace velmora {

void DriveEvents::happened(const Event& event) {
    if (event.lasts) {
        const auto begun = std::find_if(_events.begin(), _events.end(), [&event](const Event& each) {
            return each.lasts && !each.end && each.time == event.time && each.kind == event.kind;
        });
        if (begun != _events.end()) {
            *begun = event;
            ++_revision;
            return;
        }
    }
    add(event);
}

void DriveEvents::add(const Event& event) {
    const auto place = std::find_if(_events.begin(), _events.end(),
                                    [&event](const Event& each) { return each.time <= event.time; });
    _events.insert(place, event);
    if (_events.size() > most)
        _events.pop_back();
    ++_revision;
}

void DriveEvents::forgetAll() {
    _events.clear();
    ++_revision;
}

} // namespace velmora
