// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Drive/DriveEvents.h"

#include <algorithm>

namespace velmora {

namespace {

Event listed(const Event& event) {
    Event kept = event;
    kept.fields = {};
    kept.evidence = {};
    return kept;
}

} // namespace

void DriveEvents::happened(const Event& event) {
    if (event.lasts) {
        const auto isBefore = [](const Event& each, Time time) { return each.time > time; };
        auto begun = std::lower_bound(_events.begin(), _events.end(), event.time, isBefore);
        while (begun != _events.end() && begun->time == event.time &&
               !(begun->lasts && !begun->end && begun->kind == event.kind))
            ++begun;
        if (begun != _events.end() && begun->time == event.time) {
            *begun = listed(event);
            ++_revision;
            return;
        }
    }
    add(event);
}

void DriveEvents::add(const Event& event) {
    const auto place = std::find_if(_events.begin(), _events.end(), [&event](const Event& each) {
        return each.time < event.time || (each.time == event.time && each.kind <= event.kind);
    });
    _events.insert(place, listed(event));
    if (_events.size() > _limit)
        _events.pop_back();
    ++_revision;
}

void DriveEvents::forgetAll() {
    _events.clear();
    ++_revision;
}

} // namespace velmora
