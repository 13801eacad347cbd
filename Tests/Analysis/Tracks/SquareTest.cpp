// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Tracks/Square.h"

#include <cmath>

#include <gtest/gtest.h>

namespace velmora {
namespace {

TEST(Square, isTheOneThatHoldsAPlace) {
    // A degree of the sphere has 111195.08 m: row floor(59.33 * 111195.08 / 50) = 131944, whose middle is at
    // 131944.5 * 50 / 111195.08 = 59.330188 degrees. The circle there has 20419011.85 m, so 408380 columns,
    // and floor(198.06 / 360 * 408380) = 224677, whose middle is at 224677.5 / 408380 * 360 - 180.
    const Square square = Square::of({59.33, 18.06}, 50);
    EXPECT_EQ(square.row, 131'944);
    EXPECT_EQ(square.column, 224'677U);
    EXPECT_EQ(nameOf(square), "59.330188,18.060385");
}

TEST(Square, hasItsSizeOnTheEllipsoid) {
    for (const Coordinates place : {Coordinates{59.33, 18.06}, Coordinates{0.001, 0.001},
                                    Coordinates{-33.9, 151.2}, Coordinates{71, 179.9999}}) {
        const Square square = Square::of(place, 50);
        const Coordinates centre = square.centre();
        Square north = square;
        ++north.row;
        Square east = square;
        east.column = east.column == 0 ? 1 : east.column - 1;
        const double height = distance_m(centre, {north.centre().latitude, centre.longitude});
        EXPECT_NEAR(height, 50, 0.35);
        EXPECT_NEAR(distance_m(centre, east.centre()), 50, 0.35);
        EXPECT_LT(distance_m(place, centre), 50 / std::sqrt(2) * 1.01);
    }
}

TEST(Square, isOneAcrossItsSidesAlone) {
    const Coordinates centre = Square::of({48.1, 11.5}, 100).centre();
    const Square square = Square::of(centre, 100);
    constexpr double degrees = 49.9 / 111'195.08;
    EXPECT_EQ(Square::of({centre.latitude + degrees, centre.longitude}, 100), square);
    EXPECT_EQ(Square::of({centre.latitude - degrees, centre.longitude}, 100), square);
    EXPECT_NE(Square::of({centre.latitude + 1.01 * degrees, centre.longitude}, 100), square);
    EXPECT_NE(Square::of({centre.latitude - 1.01 * degrees, centre.longitude}, 100), square);
}

TEST(Square, isThereAtTheLimitsOfTheEarth) {
    for (const double size : {1.0, 50.0, 100'000.0})
        for (const Coordinates place : {Coordinates{90, 0}, Coordinates{-90, 0}, Coordinates{0, -180},
                                        Coordinates{0, 179.9999999999999}}) {
            const Coordinates centre = Square::of(place, size).centre();
            EXPECT_LE(std::abs(centre.latitude), 90) << size;
            EXPECT_LE(std::abs(centre.longitude), 180) << size;
        }
    EXPECT_EQ(Square::of({-0.00001, 10}, 50).row, -1);
}

} // namespace
} // namespace velmora
