// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Playback/PlaybackEvents.h"

#include <algorithm>

namespace velmora {

PlaybackEvents::PlaybackEvents(LogGenerator& decoder)
    : _decoder(decoder), _engine(decoder.catalogue(), *this) {
    decoder.setObservationSink(this);
}

PlaybackEvents::~PlaybackEvents() {
    _decoder.setObservationSink(nullptr);
}

void PlaybackEvents::observed(const ObservedMessage& message) {
    _engine.report({{0, message.number}, message.arrival, message});
}

void PlaybackEvents::happened(const Event& event) {
    if (_all.size() == most)
        return;
    // Most come in the order of their times.
    const auto place = std::upper_bound(_all.begin(), _all.end(), event.time,
                                        [](Time time, const Found& each) { return time < each.time; });
    _all.insert(place, {event.time, event.kind + ": " + event.text});
}

const PlaybackEvents::Found* PlaybackEvents::after(Time time) const {
    const auto found = std::upper_bound(_all.begin(), _all.end(), time,
                                        [](Time moment, const Found& each) { return moment < each.time; });
    return found == _all.end() ? nullptr : &*found;
}

const PlaybackEvents::Found* PlaybackEvents::before(Time time) const {
    const auto found = std::lower_bound(_all.begin(), _all.end(), time,
                                        [](const Found& each, Time moment) { return each.time < moment; });
    return found == _all.begin() ? nullptr : &*(found - 1);
}

} // namespace velmora
