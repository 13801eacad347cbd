// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Modem/Bands/Carrier.h"

#include <cstdint>

namespace velmora::Bands {

/// What a channel number of NR's global raster, 0 to 3279165, means: its frequency (3GPP TS 38.104, 5.4.2.1)
/// and the bands whose downlink holds it (TS 38.101-1 and 38.101-2, 5.2 and 5.4.2.3). A modem may report the
/// channel of the synchronization signals, which is not on the bands' own raster, so that steps within a band
/// are not looked at. Satellite bands (TS 38.101-5) and bands above n109 in FR1 are not known here.
[[nodiscard]] Carrier carrierOfNRARFCN(std::int64_t nrarfcn);

} // namespace velmora::Bands
