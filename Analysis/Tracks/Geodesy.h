// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

namespace velmora {

/// A place on the ellipsoid of WGS 84, in degrees: north and east positive.
struct Coordinates {
    double latitude = 0;
    double longitude = 0;
};

/// The distance over the ellipsoid in metres. Good to a millimetre up to 10 km, to a metre up to 100 km: the
/// chord, and the arc above it.
[[nodiscard]] double distance_m(const Coordinates& from, const Coordinates& to);

/// The place at that part of the way, from 0 to 1: along the plane through both and the Earth's centre.
/// Precondition: they are not antipodes.
[[nodiscard]] Coordinates placeBetween(const Coordinates& from, const Coordinates& to, double part);

} // namespace velmora
