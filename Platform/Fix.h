// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"

#include <optional>

namespace velmora {

/// Where a receiver was at one time, as it reported that. WGS 84. What it did not report is absent, never 0.
struct Fix {
    Time time;
    double latitude = 0;              ///< degrees, north positive
    double longitude = 0;             ///< degrees, east positive, from -180 to below 180
    std::optional<double> altitude_m; ///< above mean sea level
    std::optional<double> speed_mps;
    std::optional<double> course_degrees; ///< over ground, clockwise from true north
    std::optional<double> hdop;           ///< horizontal dilution of precision, which is no distance
    /// The receiver's own estimate of its horizontal error: one standard deviation, of latitude and longitude
    /// together.
    std::optional<double> deviation_m;
};

} // namespace velmora
