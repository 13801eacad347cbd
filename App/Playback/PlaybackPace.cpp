// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/Playback/PlaybackPace.h"

#include <chrono>
#include <cmath>

namespace velmora {

void PlaybackPace::beginAt(Time moment, Time now) {
    _from = moment;
    _since = now;
}

Time PlaybackPace::dueAt(Time now) const {
    const double elapsed = static_cast<double>((now - _since).count()) * playbackSpeeds[_speed].factor;
    return _from + std::chrono::nanoseconds(std::llround(elapsed));
}

} // namespace velmora
