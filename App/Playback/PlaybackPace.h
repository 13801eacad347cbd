// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "App/Playback/PlaybackSpeeds.h"
#include "Platform/Clock.h"

#include <cstddef>

namespace velmora {

/// Which moment of a recording is due while it is played: as long after the moment where playing began as
/// that is ago, times the speed.
class PlaybackPace {
public:
    /// Playing begins, or goes on, at that moment of the recording. `now` is the time of the clock.
    void beginAt(Time moment, Time now);
    [[nodiscard]] Time dueAt(Time now) const;
    /// An index of `playbackSpeeds`. It counts from where playing began, so begin again after a change.
    void setSpeed(std::size_t index) { _speed = index; }
    [[nodiscard]] std::size_t speed() const { return _speed; }

private:
    std::size_t _speed = normalPlaybackSpeed;
    Time _from{};  ///< in the recording ...
    Time _since{}; ///< ... at this time of the clock
};

} // namespace velmora
