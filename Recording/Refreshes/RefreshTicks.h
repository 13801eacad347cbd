// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"

#include <chrono>
#include <optional>

namespace velmora {

/// The clock of a recording that is being decoded: the time of the current message or tick, in UTC.
class MessageClock final : public Clock {
public:
    [[nodiscard]] Time now() const override { return _now; }
    [[nodiscard]] ZoneState zoneAt(Time) const override { return {}; }
    void setNow(Time now) { _now = now; }

private:
    Time _now{};
};

/// The refreshes of a recording, at the application's interval: ticks lie every 2 s of recorded time from the
/// first message on, and a tick with messages since the last one refreshes. Time stamps that go back cause no
/// tick; a jump ahead of any length takes constant time.
class RefreshTicks {
public:
    static constexpr std::chrono::nanoseconds interval = std::chrono::seconds(2);

    /// A message with this time stamp comes next. Returns the tick that refreshes before it, if any.
    [[nodiscard]] std::optional<Time> tickBefore(Time message) {
        if (_started && (_exhausted || message < _next))
            return std::nullopt;
        return advanceTo(message);
    }
    /// The last tick, which follows the last message; none where there was no message.
    [[nodiscard]] std::optional<Time> last() const;

private:
    [[nodiscard]] std::optional<Time> advanceTo(Time message);
    void advancePast(Time message);

    bool _started = false;
    Time _next{};            ///< the next tick
    bool _exhausted = false; ///< the next tick would lie past the end of time; `_next` is that end
};

} // namespace velmora
