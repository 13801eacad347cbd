// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Positions/NMEAWriter.h"

#include <chrono>

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace velmora {
namespace {

using namespace std::chrono;
using testing::ElementsAre;

// The checksums are the exclusive or of the characters between "$" and "*".

TEST(NMEAWriter, writesWhatThereIs) {
    Fix fix;
    fix.time = sys_days(November / 22 / 2026) + 9h + 5min + 7s + 250ms;
    fix.latitude = -33.5;
    fix.longitude = 151.25;
    EXPECT_THAT(nmeaSentences(fix),
                ElementsAre("$GNGGA,090507.250,3330.00000,S,15115.00000,E,1,,,,,,,,*4F\r\n",
                            "$GNRMC,090507.250,A,3330.00000,S,15115.00000,E,,,221126,,,A*67\r\n"));
}

TEST(NMEAWriter, writesAllOfAFix) {
    Fix fix;
    fix.time = sys_days(January / 5 / 2026) + 8h;
    fix.latitude = 59.3301792;
    fix.longitude = -18.0602643;
    fix.altitude_m = 12.5;
    fix.speed_mps = 23;
    fix.course_degrees = 37.25;
    fix.hdop = 0.9;
    fix.deviation_m = 2.8284271;
    EXPECT_THAT(nmeaSentences(fix),
                ElementsAre("$GNGGA,080000.000,5919.81075,N,01803.61586,W,1,,0.90,12.50,M,,,,*3D\r\n",
                            "$GNRMC,080000.000,A,5919.81075,N,01803.61586,W,44.71,37.25,050126,,,A*66\r\n",
                            "$GNGST,080000.000,,,,,2.00,2.00,*5F\r\n"));
}

TEST(NMEAWriter, hasNoSixtyMinutes) {
    Fix fix;
    fix.latitude = 9.99999999999;
    fix.longitude = -180;
    EXPECT_THAT(nmeaSentences(fix).front(),
                testing::StartsWith("$GNGGA,000000.000,1000.00000,N,18000.00000,W,"));
}

} // namespace
} // namespace velmora
