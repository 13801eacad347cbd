// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Fix.h"

#include <cstdint>

namespace velmora {

/// A place on the ground as columns have it: degrees of WGS 84 as decimal numbers, of which these are the
/// units of the last place (`degreePlaces`).
struct DecimalDegrees {
    std::int64_t latitude = 0;
    std::int64_t longitude = 0;
};

[[nodiscard]] DecimalDegrees decimalDegreesOf(const Fix& fix);

/// The number with so many decimals, which is what a receiver can mean: columns of few different numbers are
/// small.
[[nodiscard]] double rounded(double number, int decimals);

} // namespace velmora
