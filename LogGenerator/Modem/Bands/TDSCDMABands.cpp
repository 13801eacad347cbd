// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/Bands/TDSCDMABands.h"

namespace velmora::Bands {
namespace {

/// Consecutive numbers of a band, each five times its frequency in MHz.
struct Range {
    std::string_view band;
    std::int32_t first;
    std::int32_t last;
};

constexpr Range ranges[] = {
    {"a", 9504, 9596}, {"a", 10054, 10121}, {"b", 9254, 9546},   {"b", 9654, 9946},
    {"c", 9554, 9646}, {"d", 12854, 13096}, {"e", 11504, 11996}, {"f", 9404, 9596},
};

} // namespace

Carrier carrierOfTDDUARFCN(std::int64_t uarfcn) {
    Carrier carrier;
    for (const Range& each : ranges)
        if (uarfcn >= each.first && uarfcn <= each.last)
            carrier.add({each.band, 200 * static_cast<std::int32_t>(uarfcn), std::nullopt});
    return carrier;
}

} // namespace velmora::Bands
