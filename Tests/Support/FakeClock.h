// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"

#include <chrono>

namespace velmora {

/// A clock that stands still until it is set: at 2026-11-16 05:00:00 UTC, in a zone that is UTC.
class FakeClock final : public Clock {
public:
    [[nodiscard]] static Time defaultNow() {
        using namespace std::chrono;
        return sys_days{year{2026} / November / 16} + hours{5};
    }

    [[nodiscard]] Time now() const override { return _now; }
    [[nodiscard]] ZoneState zoneAt(Time) const override { return _zone; }

    void setNow(Time now) { _now = now; }
    void advance(std::chrono::nanoseconds duration) { _now += duration; }
    /// The zone's state at every moment.
    void setZone(ZoneState zone) { _zone = zone; }

private:
    Time _now = defaultNow();
    ZoneState _zone;
};

} // namespace velmora
