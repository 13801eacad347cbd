// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/Field.h"

#include <cmath>
#include <cstdint>

namespace velmora::C2K {

/// The energy of a pilot or finger, in dB; a ratio of 0 shows "-inf dB".
inline constexpr Field pilotEnergy{"", computed, real("%+.2f dB"), {.absent = "-inf dB"}};
/// The same of the reference pilot.
inline constexpr Field referencePilotEnergy{"", computed, real("(ref pilot) %+.2f dB")};

[[nodiscard]] inline double decibels(double ratio) {
    return 10 * std::log10(ratio);
}
/// The same for energies in units of 1/512.
[[nodiscard]] inline double decibelsOf512ths(std::uint16_t energy) {
    return decibels(energy / 512.0);
}

} // namespace velmora::C2K
