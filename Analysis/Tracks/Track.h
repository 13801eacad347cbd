// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Tracks/Position.h"
#include "Platform/Clock.h"
#include "Platform/Fix.h"

#include <chrono>
#include <deque>
#include <optional>
#include <vector>

namespace velmora {

/// Fixes in the order of their times, and the positions between them: a whole drive's, or the latest ones of
/// a stream, where the earlier are discarded.
class Track {
public:
    static constexpr std::chrono::nanoseconds defaultGap = std::chrono::seconds(2);

    /// `maximumGap`: between fixes that are further apart there is no position.
    explicit Track(std::chrono::nanoseconds maximumGap = defaultGap) : _maximumGap(maximumGap) {}
    /// Of fixes in any order, of which the first counts where several have the same time.
    [[nodiscard]] static Track ofFixes(std::vector<Fix> fixes,
                                       std::chrono::nanoseconds maximumGap = defaultGap);

    /// Adds a later fix. One that is not later than the latest is left out.
    void add(const Fix& fix);
    /// The position at a time; none before the first fix, after the last, and in gaps.
    [[nodiscard]] std::optional<Position> at(Time time) const;
    /// Whether a fix that is yet to come, after all that are here, might change the position at that time.
    [[nodiscard]] bool isOpenAt(Time time) const;
    /// Forgets the fixes that no position at that time or later depends on.
    void discardBefore(Time time);

    [[nodiscard]] const std::deque<Fix>& fixes() const { return _fixes; }
    [[nodiscard]] std::chrono::nanoseconds maximumGap() const { return _maximumGap; }
    /// The way from fix to fix, without gaps, in metres.
    [[nodiscard]] double length_m() const;

private:
    std::chrono::nanoseconds _maximumGap;
    std::deque<Fix> _fixes;
};

} // namespace velmora
