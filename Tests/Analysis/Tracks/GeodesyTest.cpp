// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Tracks/Geodesy.h"

#include <cmath>

#include <gtest/gtest.h>

namespace velmora {
namespace {

/// Geodesics on WGS 84 by Vincenty's direct solution: where one that begins at a place leads.
struct Geodesic {
    const char* name;
    Coordinates from;
    double length_m;
    Coordinates middle; ///< after half of it; only where `length_m` is 50
    Coordinates to;
};

constexpr Geodesic geodesics[] = {
    {"Stockholm, azimuth 37",
     {59.33, 18.06},
     50,
     {59.33017922540, 18.06026430596},
     {59.33035845026, 18.06052861471}},
    {"Sydney, azimuth 250",
     {-33.9, 151.2},
     50,
     {-33.90007708646, 151.19974600930},
     {-33.90015417239, 151.19949201815}},
    {"equator, azimuth 90", {0, 0}, 50, {0, 0.00022457882}, {0, 0.00044915764}},
    {"across the date line",
     {71, 179.9997},
     50,
     {70.99999999873, -179.99961226142},
     {70.99999999491, -179.99892452283}},
    {"across the south pole", {-89.9999, 10}, 50, {-89.99987617415, -170}, {-89.99965234830, -170}},
};

constexpr Geodesic longer[] = {
    {"Stockholm, azimuth 37", {59.33, 18.06}, 10'000, {}, {59.40164690162, 18.16594492814}},
    {"Sydney, azimuth 250", {-33.9, 151.2}, 10'000, {}, {-33.93079269165, 151.09836725280}},
    {"across the date line", {71, 179.9997}, 10'000, {}, {70.99979656113, -179.72520645622}},
};

TEST(Geodesy, isGoodToACentimetreAtFiftyMetres) {
    for (const Geodesic& each : geodesics) {
        EXPECT_NEAR(distance_m(each.from, each.to), each.length_m, 0.01) << each.name;
        EXPECT_NEAR(distance_m(each.to, each.from), each.length_m, 0.01) << each.name;
        EXPECT_NEAR(distance_m(placeBetween(each.from, each.to, 0.5), each.middle), 0, 0.01) << each.name;
        EXPECT_NEAR(distance_m(placeBetween(each.from, each.to, 0), each.from), 0, 0.001) << each.name;
        EXPECT_NEAR(distance_m(placeBetween(each.from, each.to, 1), each.to), 0, 0.001) << each.name;
    }
}

TEST(Geodesy, isGoodToACentimetreAtTenKilometres) {
    for (const Geodesic& each : longer)
        EXPECT_NEAR(distance_m(each.from, each.to), each.length_m, 0.01) << each.name;
    EXPECT_NEAR(distance_m({59.33, 18.06}, {60.04247374227, 19.13992593454}), 100'000, 1);
}

TEST(Geodesy, hasLongitudesFrom180Below180) {
    EXPECT_EQ(placeBetween({0, 179.9999}, {0, -179.9999}, 0.5).longitude, -180);
    EXPECT_LT(placeBetween({10, 179.9999}, {10, -179.9999}, 0.25).longitude, 180);
    EXPECT_GT(placeBetween({10, 179.9999}, {10, -179.9999}, 0.25).longitude, 179.9999);
}

} // namespace
} // namespace velmora
