// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Statistics/ClockMinute.h"
#include "Analysis/Statistics/ValueCounts.h"
#include "LogGenerator/Fields/Role.h"
#include "Platform/Clock.h"

#include <chrono>
#include <cstddef>
#include <cstdint>
#include <optional>

namespace velmora {

/// Searches the values of a role for their worst minute: of those of the clock (UTC) with at least
/// `fewestSamples` values, the one with the lowest median level or quality, or with the highest mean of error
/// rates; of several the earliest. Values must come in the order of their times; a minute ends when one of
/// another minute comes.
class WorstMinute {
public:
    /// Fewer values say little of a minute.
    static constexpr std::uint64_t fewestSamples = 5;

    enum class Measure : std::uint8_t { LowestMedian, HighestMean };
    /// Absent for a role that has no worse and better: an identity, a neighbour, and a data rate, which is
    /// low where nothing was to be sent, too.
    [[nodiscard]] static std::optional<Measure> measureOf(Role role);

    explicit WorstMinute(Measure measure) : _measure(measure) {}

    void add(Time time, double value) {
        // Without a division for most values.
        if (time < _minute || durationBetween(_minute, time) >= std::chrono::minutes(1))
            beginMinute(minuteOf(time));
        _values.add(value);
    }

    struct Minute {
        Time begin;
        double figure; ///< its median or mean
        std::uint64_t samples;
    };
    /// Absent where no minute has enough samples. The latest minute counts.
    [[nodiscard]] std::optional<Minute> worst() const;
    [[nodiscard]] Measure measure() const { return _measure; }
    /// The worse of two, the earlier one where they are the same.
    [[nodiscard]] static std::optional<Minute> worse(Measure measure, const std::optional<Minute>& a,
                                                     const std::optional<Minute>& b);

private:
    static constexpr std::size_t mostValues = 512;

    void beginMinute(Time minute);

    Measure _measure;
    Time _minute{};                  ///< its begin
    ValueCounts _values{mostValues}; ///< of the latest minute
    std::optional<Minute> _worst;    ///< of the earlier ones
};

} // namespace velmora
