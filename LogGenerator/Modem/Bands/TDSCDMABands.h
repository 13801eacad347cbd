// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Modem/Bands/Carrier.h"

#include <cstdint>

namespace velmora::Bands {

/// What a channel number of UTRA TDD means (3GPP TS 25.102, 5.4.3 and 5.4.4, the option of 1.28 Mcps, whose
/// ranges hold those of the others). The band that the standard calls c) is named "c".
[[nodiscard]] Carrier carrierOfTDDUARFCN(std::int64_t uarfcn);

} // namespace velmora::Bands
