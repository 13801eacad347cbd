// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/DecimalDegrees.h"

#include <gtest/gtest.h>

namespace velmora {
namespace {

TEST(DecimalDegrees, areDegreesWithSevenDecimals) {
    Fix fix;
    fix.latitude = 48.12345674;
    fix.longitude = -11.50000006;
    EXPECT_EQ(decimalDegreesOf(fix).latitude, 481234567);
    EXPECT_EQ(decimalDegreesOf(fix).longitude, -115000001);
}

TEST(DecimalDegrees, holdTheEndsOfTheEarth) {
    Fix fix;
    fix.latitude = -90;
    fix.longitude = -180;
    EXPECT_EQ(decimalDegreesOf(fix).latitude, -900000000);
    EXPECT_EQ(decimalDegreesOf(fix).longitude, -1800000000);
}

TEST(Rounded, isTheDoubleOfTheDecimalNumber) {
    EXPECT_EQ(rounded(13.256, 2), 13.26);
    EXPECT_EQ(rounded(-0.1234, 3), -0.123);
    EXPECT_EQ(rounded(0.1 + 0.2, 2), 0.3);
}

} // namespace
} // namespace velmora
