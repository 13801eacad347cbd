// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Tracks/Geodesy.h"

#include <algorithm>
#include <cmath>
#include <numbers>

namespace velmora {

namespace {

constexpr double equatorialRadius_m = 6'378'137;
constexpr double flattening = 1 / 298.257223563;
constexpr double eccentricitySquared = flattening * (2 - flattening);
constexpr double meanRadius_m = 6'371'008.8;
constexpr double radiansOfDegree = std::numbers::pi / 180;

/// Earth-centred: x through longitude 0, z through the north pole; in metres.
struct Point {
    double x = 0;
    double y = 0;
    double z = 0;
};

Point pointOf(const Coordinates& place) {
    const double latitude = place.latitude * radiansOfDegree;
    const double longitude = place.longitude * radiansOfDegree;
    const double sine = std::sin(latitude);
    const double normal = equatorialRadius_m / std::sqrt(1 - eccentricitySquared * sine * sine);
    return {normal * std::cos(latitude) * std::cos(longitude),
            normal * std::cos(latitude) * std::sin(longitude), normal * (1 - eccentricitySquared) * sine};
}

/// The place that the line from the Earth's centre through the point leads to.
Coordinates placeOf(const Point& point) {
    // A point on the ellipsoid has tan(latitude) = z / ((1 - e^2) p). One a little below, as those of chords
    // are, is moved out to it along the line from the centre.
    const double latitude = std::atan2(point.z, (1 - eccentricitySquared) * std::hypot(point.x, point.y));
    double longitude = std::atan2(point.y, point.x) / radiansOfDegree;
    if (longitude >= 180)
        longitude -= 360;
    return {latitude / radiansOfDegree, longitude};
}

} // namespace

double distance_m(const Coordinates& from, const Coordinates& to) {
    const Point a = pointOf(from);
    const Point b = pointOf(to);
    const double chord = std::hypot(a.x - b.x, a.y - b.y, a.z - b.z);
    const double diameter = 2 * meanRadius_m;
    return diameter * std::asin(std::min(chord / diameter, 1.0));
}

Coordinates placeBetween(const Coordinates& from, const Coordinates& to, double part) {
    const Point a = pointOf(from);
    const Point b = pointOf(to);
    return placeOf({std::lerp(a.x, b.x, part), std::lerp(a.y, b.y, part), std::lerp(a.z, b.z, part)});
}

} // namespace velmora
