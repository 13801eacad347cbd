// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Tracks/Square.h"

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <numbers>

namespace velmora {

namespace {

constexpr double meanRadius_m = 6'371'008.8;
constexpr double radiansOfDegree = std::numbers::pi / 180;
constexpr double metresOfDegree = meanRadius_m * radiansOfDegree;

double latitudeOfRow(std::int32_t row, double size_m) {
    return std::clamp((row + 0.5) * size_m / metresOfDegree, -90.0, 90.0);
}

double columnsOfRow(std::int32_t row, double size_m) {
    const double circle_m = 360 * metresOfDegree * std::cos(latitudeOfRow(row, size_m) * radiansOfDegree);
    return std::max(1.0, std::round(circle_m / size_m));
}

} // namespace

Square Square::of(const Coordinates& place, double size_m) {
    Square square{size_m, static_cast<std::int32_t>(std::floor(place.latitude * metresOfDegree / size_m)), 0};
    const double columns = columnsOfRow(square.row, size_m);
    const double column = std::floor((place.longitude + 180) / 360 * columns);
    square.column = static_cast<std::uint32_t>(std::clamp(column, 0.0, columns - 1));
    return square;
}

Coordinates Square::centre() const {
    return {latitudeOfRow(row, size_m), (column + 0.5) / columnsOfRow(row, size_m) * 360 - 180};
}

std::string nameOf(const Square& square) {
    const Coordinates centre = square.centre();
    char text[64];
    std::snprintf(text, sizeof text, "%.6f,%.6f", centre.latitude, centre.longitude);
    return text;
}

} // namespace velmora
