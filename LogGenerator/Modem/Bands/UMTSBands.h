// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Modem/Bands/Carrier.h"

#include <cstdint>

namespace velmora::Bands {

/// What a downlink channel number of UTRA FDD means (3GPP TS 25.101, 5.4.3 and 5.4.4), the additional
/// channels included.
[[nodiscard]] Carrier carrierOfUARFCN(std::int64_t uarfcn);

} // namespace velmora::Bands
