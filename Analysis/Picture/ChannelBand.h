// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Picture/RadioTechnology.h"

#include <string>

namespace velmora {

/// The band of a downlink channel: "band 20 (800 MHz)", "GSM 900". Empty where the number is of none, on NR,
/// whose bands overlap, and for CDMA2000, whose channel numbers say nothing without a band class.
[[nodiscard]] std::string bandOf(RadioTechnology technology, double channel);

} // namespace velmora
