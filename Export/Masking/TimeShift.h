// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"

#include <algorithm>
#include <chrono>
#include <cstdint>

namespace velmora {

/// Moves the times of a file so that its first message arrives at an epoch that all masked files have.
class TimeShift {
public:
    TimeShift() = default;
    /// By so much instead.
    explicit TimeShift(std::chrono::nanoseconds shift) : _hasBegun(true), _shift(shift) {}

    /// 2000-01-01 00:00:00 UTC.
    static constexpr Time epoch = std::chrono::sys_days(std::chrono::year(2000) / 1 / 1);

    /// The first message's time decides; later calls have no effect. One before 1970 counts as that.
    void begin(Time first) {
        if (!_hasBegun)
            _shift = std::max(first, Time()) - epoch;
        _hasBegun = true;
    }
    [[nodiscard]] bool hasBegun() const { return _hasBegun; }
    /// What is subtracted from each time.
    [[nodiscard]] std::chrono::nanoseconds shift() const { return _shift; }
    /// As far as there are times.
    [[nodiscard]] Time shifted(Time time) const {
        if (_shift.count() < 0)
            return time > Time::max() + _shift ? Time::max() : time - _shift;
        return time < Time::min() + _shift ? Time::min() : time - _shift;
    }
    /// A record's time stamp; 0 for one that denotes no time.
    [[nodiscard]] std::uint64_t shiftedStamp(std::uint64_t stamp) const;

private:
    bool _hasBegun = false;
    std::chrono::nanoseconds _shift{};
};

} // namespace velmora
