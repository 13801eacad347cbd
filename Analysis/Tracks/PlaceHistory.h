// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Tracks/Position.h"
#include "Analysis/Tracks/Track.h"
#include "Platform/Clock.h"
#include "Platform/Fix.h"

#include <chrono>
#include <cstddef>
#include <optional>

namespace velmora {

/// Where the receiver was, for what becomes known later than it happened, as an event that lasts is when it
/// ends. Its memory is bounded: of more fixes the earliest are forgotten.
class PlaceHistory {
public:
    /// Two days of a fix a second.
    static constexpr std::size_t mostFixes = 200'000;

    explicit PlaceHistory(std::chrono::nanoseconds maximumGap = Track::defaultGap) : _track(maximumGap) {}

    /// The next one. Where the clock was set back, or another file begins earlier, those before are
    /// forgotten.
    void add(const Fix& fix);
    [[nodiscard]] std::optional<Position> at(Time time) const { return _track.at(time); }

private:
    Track _track;
};

} // namespace velmora
