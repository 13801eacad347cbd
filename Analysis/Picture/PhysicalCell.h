// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Observation.h"

#include <optional>
#include <string_view>

namespace velmora {

/// The number of a physical cell. A BSIC that is a text of its two colour codes, "7-0", is 8 times the
/// network's plus the base station's (3GPP TS 23.003 4.3.2). Absent for any other text.
[[nodiscard]] std::optional<double> physicalCellOf(const Observation& observation);

} // namespace velmora
