// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Tracks/Position.h"

#include "Analysis/Tracks/Geodesy.h"

#include <algorithm>
#include <cmath>

namespace velmora {

namespace {

std::optional<double> between(std::optional<double> before, std::optional<double> after, double part) {
    return before && after ? std::optional(std::lerp(*before, *after, part)) : std::nullopt;
}

/// The shorter way round.
std::optional<double> courseBetween(std::optional<double> before, std::optional<double> after, double part) {
    if (!before || !after)
        return std::nullopt;
    const double course = *before + std::remainder(*after - *before, 360.0) * part;
    return course < 0 ? course + 360 : std::fmod(course, 360.0);
}

std::optional<double> larger(std::optional<double> before, std::optional<double> after) {
    return before && after ? std::optional(std::max(*before, *after)) : std::nullopt;
}

Coordinates placeOf(const Fix& fix) {
    return {fix.latitude, fix.longitude};
}

} // namespace

Position positionBetween(const Fix& before, const Fix& after, Time time) {
    if (time == before.time)
        return {before, {}};
    if (time == after.time)
        return {after, {}};
    const double part = std::chrono::duration<double>(time - before.time) / (after.time - before.time);
    const Coordinates place = placeBetween(placeOf(before), placeOf(after), part);
    Position position;
    position.age = time - before.time;
    Fix& fix = position.fix;
    fix.time = time;
    fix.latitude = place.latitude;
    fix.longitude = place.longitude;
    fix.altitude_m = between(before.altitude_m, after.altitude_m, part);
    fix.speed_mps = between(before.speed_mps, after.speed_mps, part);
    fix.course_degrees = courseBetween(before.course_degrees, after.course_degrees, part);
    fix.hdop = larger(before.hdop, after.hdop);
    fix.deviation_m = larger(before.deviation_m, after.deviation_m);
    return position;
}

double distance_m(const Fix& from, const Fix& to) {
    return distance_m(placeOf(from), placeOf(to));
}

} // namespace velmora
