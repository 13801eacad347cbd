// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Modem/Bands/Carrier.h"

#include <cstdint>

namespace velmora::Bands {

/// What a downlink channel number of E-UTRA means (3GPP TS 36.101, 5.7.3 and 5.7.4). Each number belongs to
/// one band; the bands of the same duplex that hold its frequency under another number are
/// its overlapping bands. The broadcast bands 107 and 108 and band 111 are not known here.
[[nodiscard]] Carrier carrierOfEARFCN(std::int64_t earfcn);

} // namespace velmora::Bands
