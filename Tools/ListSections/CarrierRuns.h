// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>

namespace velmora {

/// The bands and frequencies of all channel numbers, as an entry of a Lua table: for each radio technology,
/// by its number, runs of consecutive channels that have the same bands and whose frequencies ascend evenly,
/// in ascending order. A run is {first, last, bands, overlapping bands, downlink, its step, uplink, its
/// step}; frequencies are in kHz, false for none.
[[nodiscard]] std::string carrierRuns();

} // namespace velmora
