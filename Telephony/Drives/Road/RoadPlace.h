// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <chrono>

namespace velmora {

/// Where a drive's car is at one time: in metres from the centre of its ring road.
struct RoadPlace {
    std::chrono::nanoseconds offset{0}; ///< from the scenario's start
    double east_m = 0;
    double north_m = 0;
};

/// On the map the ring lies in the sea, over the equator, with the zero meridian through its centre.
/// Along the equator, and the meridians near it, a degree has about that many metres.
inline constexpr double metresInDegree = 111'320;
inline constexpr double ringCentreLatitude = 0.005;

[[nodiscard]] constexpr double latitudeOf(double north_m) {
    return ringCentreLatitude + north_m / metresInDegree;
}
[[nodiscard]] constexpr double longitudeOf(double east_m) {
    return east_m / metresInDegree;
}

} // namespace velmora
