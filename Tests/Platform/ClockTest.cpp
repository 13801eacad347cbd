// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/DateText.h"
#include "Tests/Support/FakeClock.h"

#include <gtest/gtest.h>

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

TEST(DateDescription, IsInUTCToTheSecond) {
    EXPECT_EQ(dateDescription(sys_days{year{2026} / 11 / 16} + 5h), "2026-11-16 05:00:00 +0000");
    EXPECT_EQ(dateDescription(sys_days{year{2026} / 1 / 2} + 3h + 4min + 5s + 999ms),
              "2026-01-02 03:04:05 +0000");
    EXPECT_EQ(dateDescription(Time(nanoseconds(-1))), "1969-12-31 23:59:59 +0000");
    EXPECT_EQ(dateDescription(Time()), "1970-01-01 00:00:00 +0000");
}

TEST(TimeOfDateDescription, ReadsWhatIsWritten) {
    for (const Time moment : {Time(sys_days{year{2026} / 11 / 16} + 5h), Time(), Time(seconds(-1)),
                              Time(sys_days{year{2261} / 12 / 31} + 23h + 59min + 59s),
                              Time(sys_days{year{1678} / 1 / 1}), Time(sys_days{year{2028} / 2 / 29})})
        EXPECT_EQ(timeOfDateDescription(dateDescription(moment)), moment);
}

TEST(TimeOfDateDescription, UsesTheZone) {
    const Time moment = sys_days{year{2026} / 11 / 16} + 5h;
    EXPECT_EQ(timeOfDateDescription("2026-11-16 06:30:00 +0130"), moment);
    EXPECT_EQ(timeOfDateDescription("2026-11-15 23:30:00 -0530"), moment);
}

TEST(TimeOfDateDescription, TakesNothingElse) {
    for (const char* const text :
         {"", "2026-11-16 05:00:00", "2026-11-16 05:00:00 +000", "2026-11-16 05:00:00 +00000",
          "2026-11-16T05:00:00 +0000", "2026-11-16 05:00:00 00000", "2026/11/16 05:00:00 +0000",
          "2026-13-16 05:00:00 +0000", "2026-00-16 05:00:00 +0000", "2026-11-31 05:00:00 +0000",
          "2026-02-29 05:00:00 +0000", "2026-11-16 24:00:00 +0000", "2026-11-16 05:60:00 +0000",
          "2026-11-16 05:00:60 +0000", "2026-11-16 05:00:00 +2400", "2026-11-16 05:00:00 +0060",
          "1677-11-16 05:00:00 +0000", "2262-01-01 05:00:00 +0000", "abcd-11-16 05:00:00 +0000"})
        EXPECT_FALSE(timeOfDateDescription(text)) << text;
}

TEST(LocalDateAndTime, UsesTheClocksZone) {
    FakeClock clock;
    clock.setZone({1h, false});
    EXPECT_EQ(localDateAndTime(clock, clock.now(), " at "), "2026-11-16 at 06:00:00");
    clock.setZone({-(5h + 30min), true});
    EXPECT_EQ(localDateAndTime(clock, clock.now(), " "), "2026-11-15 23:30:00");
    EXPECT_EQ(localDateAndTime(clock, clock.now(), ""), "2026-11-1523:30:00");
}

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
