// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/DecimalDegrees.h"

#include "Export/Columns/Parquet/ColumnSchema.h"

#include <cmath>

namespace velmora {

DecimalDegrees decimalDegreesOf(const Fix& fix) {
    const double unit = std::pow(10.0, degreePlaces);
    return {std::llround(fix.latitude * unit), std::llround(fix.longitude * unit)};
}

double rounded(double number, int decimals) {
    const double unit = std::pow(10.0, decimals);
    return std::round(number * unit) / unit;
}

} // namespace velmora
