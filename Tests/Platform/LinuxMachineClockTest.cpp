// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/MachineClock.h"

#include "Platform/DateText.h"

#include <gtest/gtest.h>

#include <chrono>
#include <cstdlib>
#include <optional>
#include <string>

namespace velmora {
namespace {

using namespace std::chrono;

/// Sets TZ and puts the earlier one back.
class ZoneSetting {
public:
    explicit ZoneSetting(const char* zone) {
        if (const char* earlier = std::getenv("TZ"))
            _earlier = earlier;
        ::setenv("TZ", zone, 1);
    }
    ~ZoneSetting() {
        if (_earlier)
            ::setenv("TZ", _earlier->c_str(), 1);
        else
            ::unsetenv("TZ");
    }
    ZoneSetting(const ZoneSetting&) = delete;
    ZoneSetting& operator=(const ZoneSetting&) = delete;

private:
    std::optional<std::string> _earlier;
};

// Central Europe, spelled out so that no zone database is needed.
constexpr const char* centralEurope = "CET-1CEST,M3.5.0,M10.5.0/3";

TEST(MachineClock, IsTheSystemsClock) {
    const Time before = time_point_cast<nanoseconds>(system_clock::now());
    const Time now = MachineClock().now();
    EXPECT_GE(now, before);
    EXPECT_LE(now, time_point_cast<nanoseconds>(system_clock::now()));
}

TEST(MachineClock, FollowsDaylightSavingTime) {
    const ZoneSetting zone(centralEurope);
    const MachineClock clock;
    const ZoneState winter = clock.zoneAt(sys_days{year{2026} / 11 / 16});
    EXPECT_EQ(winter.offset, 1h);
    EXPECT_FALSE(winter.daylightSaving);
    const ZoneState summer = clock.zoneAt(sys_days{year{2026} / 7 / 1});
    EXPECT_EQ(summer.offset, 2h);
    EXPECT_TRUE(summer.daylightSaving);
}

TEST(MachineClock, ChangesAtTheVerySecond) {
    const ZoneSetting zone(centralEurope);
    const MachineClock clock;
    const Time change = sys_days{year{2026} / 3 / 29} + 1h; // the last Sunday of March, 02:00 local
    EXPECT_EQ(clock.zoneAt(change - 1ns).offset, 1h);
    EXPECT_EQ(clock.zoneAt(change).offset, 2h);
}

TEST(MachineClock, FollowsAZoneThatIsChangedWhileItRuns) {
    const MachineClock clock;
    const Time moment = sys_days{year{2026} / 11 / 16} + 5h;
    {
        const ZoneSetting zone("UTC0");
        EXPECT_EQ(clock.zoneAt(moment).offset, 0h);
    }
    const ZoneSetting zone("EST5");
    EXPECT_EQ(clock.zoneAt(moment).offset, -5h);
    EXPECT_EQ(localDateAndTime(clock, moment, " at "), "2026-11-16 at 00:00:00");
}

} // namespace
} // namespace velmora
