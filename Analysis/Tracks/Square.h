// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Tracks/Geodesy.h"

#include <compare>
#include <cstdint>
#include <string>

namespace velmora {

/// A square of a grid over the Earth, the same in every file. The grid lies on a sphere of 6 371 008.8 m, the
/// Earth's mean radius: rows of latitude are `size_m` high from the equator on, and each row is divided into
/// as many columns of the same width, from longitude -180 on, as come nearest to that size at the latitude of
/// its middle. On the ellipsoid the sides differ from the size by less than 0.7 %, but for the rows at the
/// poles.
struct Square {
    double size_m = 0;
    std::int32_t row = 0;
    std::uint32_t column = 0;

    friend auto operator<=>(const Square&, const Square&) = default;

    /// Precondition: the size is at least 1 m.
    [[nodiscard]] static Square of(const Coordinates& place, double size_m);
    [[nodiscard]] Coordinates centre() const;
};

/// Its centre, which names it: "59.330123,18.060264".
[[nodiscard]] std::string nameOf(const Square& square);

} // namespace velmora
