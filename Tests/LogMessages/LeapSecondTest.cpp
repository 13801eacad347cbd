// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogMessages/RecordTime.h"

#include <gtest/gtest.h>

#include <chrono>
#include <cstdint>
#include <ostream>
#include <string>

/// Every leap second since system time began. The numbers were computed with Python from the list of the IERS
/// (leap-seconds.list of the tz database): system time is TAI less 19 s, counted from 1980-01-06.

namespace velmora {
namespace {

using std::chrono::nanoseconds;
using std::chrono::seconds;

struct Leap {
    const char* date;      ///< whose midnight the leap second precedes
    std::int64_t midnight; ///< seconds since 1970
    std::uint64_t system;  ///< seconds of system time then
};

constexpr Leap leaps[] = {
    {"1981-07-01", 362'793'600, 46'828'801},      {"1982-07-01", 394'329'600, 78'364'802},
    {"1983-07-01", 425'865'600, 109'900'803},     {"1985-07-01", 489'024'000, 173'059'204},
    {"1988-01-01", 567'993'600, 252'028'805},     {"1990-01-01", 631'152'000, 315'187'206},
    {"1991-01-01", 662'688'000, 346'723'207},     {"1992-07-01", 709'948'800, 393'984'008},
    {"1993-07-01", 741'484'800, 425'520'009},     {"1994-07-01", 773'020'800, 457'056'010},
    {"1996-01-01", 820'454'400, 504'489'611},     {"1997-07-01", 867'715'200, 551'750'412},
    {"1999-01-01", 915'148'800, 599'184'013},     {"2006-01-01", 1'136'073'600, 820'108'814},
    {"2009-01-01", 1'230'768'000, 914'803'215},   {"2012-07-01", 1'341'100'800, 1'025'136'016},
    {"2015-07-01", 1'435'708'800, 1'119'744'017}, {"2017-01-01", 1'483'228'800, 1'167'264'018},
};

/// As a failing test prints it.
void PrintTo(const Leap& leap, std::ostream* out) {
    *out << leap.date;
}

/// The time stamp of a second of system time: 800 units of 1.25 ms, with 16 bits below.
constexpr std::uint64_t stampOf(std::uint64_t systemSeconds) {
    return systemSeconds * 800 << 16;
}

class LeapSecondTest : public testing::TestWithParam<Leap> {
protected:
    const std::uint64_t system = GetParam().system;
    const Time midnight = Time(seconds(GetParam().midnight));
};

TEST_P(LeapSecondTest, TheLastSecondBeforeItIsTwoBeforeMidnight) {
    EXPECT_EQ(recordTimestamp(midnight - seconds(1)), stampOf(system - 2));
    EXPECT_EQ(timeOfRecord(stampOf(system - 2)), midnight - seconds(1));
    // Its last unit, the last of the day.
    EXPECT_EQ(recordTimestamp(midnight - nanoseconds(1'250'000)), stampOf(system - 1) - 0x10000);
    EXPECT_EQ(timeOfRecord(stampOf(system - 1) - 0x10000), midnight - nanoseconds(1'250'000));
}

TEST_P(LeapSecondTest, TheLeapSecondIsShownAsTheSecondAfterIt) {
    EXPECT_EQ(timeOfRecord(stampOf(system - 1)), midnight);
    EXPECT_EQ(timeOfRecord(stampOf(system) - 0x10000), midnight + nanoseconds(998'750'000));
}

TEST_P(LeapSecondTest, TheFirstSecondAfterItIsMidnight) {
    EXPECT_EQ(recordTimestamp(midnight), stampOf(system));
    EXPECT_EQ(timeOfRecord(stampOf(system)), midnight);
    EXPECT_EQ(recordTimestamp(midnight + seconds(1)), stampOf(system + 1));
    EXPECT_EQ(timeOfRecord(stampOf(system + 1)), midnight + seconds(1));
}

INSTANTIATE_TEST_SUITE_P(, LeapSecondTest, testing::ValuesIn(leaps), [](const auto& leap) {
    std::string name = leap.param.date;
    name[4] = name[7] = '_';
    return name;
});

} // namespace
} // namespace velmora
