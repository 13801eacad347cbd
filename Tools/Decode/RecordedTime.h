// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"

#include <chrono>
#include <optional>

namespace velmora {

/// The clock of a recording that is being decoded: it shows the time of the message or tick at hand, in UTC.
class RecordedClock final : public Clock {
public:
    [[nodiscard]] Time now() const override { return _now; }
    [[nodiscard]] ZoneState zoneAt(Time) const override { return {}; }
    void setNow(Time now) { _now = now; }

private:
    Time _now{};
};

/// The refreshes of a recording, at the pace of the application's: ticks lie every 2 s of recorded time from
/// the first message on, and a tick that has had messages since the last one refreshes. Time stamps may go
/// back, which makes no tick due, and ahead by any span, which costs no more than a small one.
class RecordedTicks {
public:
    static constexpr std::chrono::nanoseconds interval = std::chrono::seconds(2);

    /// Takes in that a message with this time stamp comes next. Gives the tick that refreshes before it, if
    /// any.
    [[nodiscard]] std::optional<Time> before(Time message) {
        if (_started && (_exhausted || message < _next))
            return std::nullopt;
        return reach(message);
    }
    /// The last tick, which follows the last message; none where there was no message.
    [[nodiscard]] std::optional<Time> last() const;

private:
    [[nodiscard]] std::optional<Time> reach(Time message);
    void advancePast(Time message);

    bool _started = false;
    Time _next{};            ///< the next tick
    bool _exhausted = false; ///< the next tick would lie past the end of time; `_next` is that end
};

} // namespace velmora
