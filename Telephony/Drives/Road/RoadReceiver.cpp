// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/Road/RoadReceiver.h"

#include <cmath>
#include <numbers>

namespace velmora {

namespace {

constexpr double altitude_m = 12.5;
constexpr double hdop = 0.9;
constexpr double deviation_m = 2.83;

} // namespace

std::vector<Fix> RoadReceiver::drivenTo(const RoadPlace& place) {
    const RoadPlace from = _last.value_or(place);
    const double duration_s = std::chrono::duration<double>(place.offset - from.offset).count();
    const double east_m = place.east_m - from.east_m;
    const double north_m = place.north_m - from.north_m;
    std::vector<Fix> fixes;
    for (; _next <= place.offset; _next += std::chrono::seconds(1)) {
        const double part =
            duration_s > 0 ? std::chrono::duration<double>(_next - from.offset).count() / duration_s : 0;
        Fix& fix = fixes.emplace_back();
        fix.time = _start + _next;
        fix.latitude = latitudeOf(std::lerp(from.north_m, place.north_m, part));
        fix.longitude = longitudeOf(std::lerp(from.east_m, place.east_m, part));
        fix.altitude_m = altitude_m;
        fix.hdop = hdop;
        fix.deviation_m = deviation_m;
        fix.speed_mps = duration_s > 0 ? std::hypot(east_m, north_m) / duration_s : 0;
        if (*fix.speed_mps > 0)
            fix.course_degrees = std::fmod(std::atan2(east_m, north_m) * 180 / std::numbers::pi + 360, 360);
    }
    _last = place;
    return fixes;
}

} // namespace velmora
