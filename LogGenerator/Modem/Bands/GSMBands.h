// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Modem/Bands/Carrier.h"

#include <cstdint>

namespace velmora::Bands {

/// What a GSM channel number, 0 to 1023, means (3GPP TS 45.005, 2, table 2-2). The bands whose numbers the
/// network maps by what it broadcasts (T-GSM 380, 410, 810 and 900, GSM 710) cannot be known from a number
/// and are left out. 512 to 810 are both DCS 1800 and PCS 1900.
[[nodiscard]] Carrier carrierOfARFCN(std::int64_t arfcn);

} // namespace velmora::Bands
