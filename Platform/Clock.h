#pragma once

#include <chrono>
#include <optional>
#include <string>
#include <string_view>

namespace velmora {

/// A moment, to the nanosecond (recordings keep that much).
using Time = std::chrono::sys_time<std::chrono::nanoseconds>;

/// How local time stands to UTC at some moment.
struct ZoneState {
    std::chrono::seconds offset{0}; ///< east of UTC positive, daylight-saving time included
    bool daylightSaving = false;
};

/// The wall clock and the local zone: the machine's, a recording's, or a test's.
class Clock {
public:
    virtual ~Clock() = default;
    [[nodiscard]] virtual Time now() const = 0;
    [[nodiscard]] virtual ZoneState zoneAt(Time moment) const = 0;
};

/// The machine's clock, and the zone that TZ and /etc/localtime name.
class MachineClock final : public Clock {
public:
    [[nodiscard]] Time now() const override;
    [[nodiscard]] ZoneState zoneAt(Time moment) const override;
};

/// The date description without locale: "2026-11-16 05:00:00 +0000", UTC, sortable as text.
[[nodiscard]] std::string dateDescription(Time moment);

/// The moment that a date description names, whatever its zone; none for any other text, and for years that
/// lie outside of 1678 to 2261.
[[nodiscard]] std::optional<Time> timeOfDateDescription(std::string_view text);

/// Local date and time through the clock's zone: "2026-11-16 at 06:00:00" with the separator " at ".
[[nodiscard]] std::string localDateAndTime(const Clock& clock, Time moment, const char* separator);

} // namespace velmora
