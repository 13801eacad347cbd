// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Tracks/TrackData.h"

#include <utility>
#include <vector>

namespace velmora {

/// Longitude and latitude, in degrees.
using LinePoint = std::pair<double, double>;

/// A line through the points, cut where it crosses the date line: to one at longitude 180 or -180 and from
/// one on the other side of it, with the latitude there. Parts of a single point are left out.
[[nodiscard]] std::vector<std::vector<LinePoint>> linesOf(const std::vector<TrackData::Point>& points);

} // namespace velmora
