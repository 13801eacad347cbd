// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/Bands/UMTSBands.h"

namespace velmora::Bands {
namespace {

/// Downlink numbers of a band, so many apart: the frequency is 200 kHz times the number, and the offset. The
/// separation is that of the downlink from the uplink.
struct Range {
    std::string_view band;
    std::int32_t first;
    std::int32_t last;
    std::int32_t step;
    std::int32_t offset_kHz;
    std::int32_t separation_kHz;
};

/// Of a band that is used for carrier aggregation only.
constexpr std::int32_t noUplink = 0;

// Each band's general channels, then its additional ones, which lie 100 kHz off.
constexpr Range ranges[] = {
    {"I", 10562, 10838, 1, 0, 190'000},
    {"II", 9662, 9938, 1, 0, 80'000},
    {"II", 412, 687, 25, 1'850'100, 80'000},
    {"III", 1162, 1513, 1, 1'575'000, 95'000},
    {"IV", 1537, 1738, 1, 1'805'000, 400'000},
    {"IV", 1887, 2087, 25, 1'735'100, 400'000},
    {"V", 4357, 4458, 1, 0, 45'000},
    {"V", 1007, 1012, 5, 670'100, 45'000},
    {"V", 1032, 1037, 5, 670'100, 45'000},
    {"V", 1062, 1087, 25, 670'100, 45'000},
    {"VI", 4387, 4413, 1, 0, 45'000},
    {"VI", 1037, 1062, 25, 670'100, 45'000},
    {"VII", 2237, 2563, 1, 2'175'000, 120'000},
    {"VII", 2587, 2912, 25, 2'105'100, 120'000},
    {"VIII", 2937, 3088, 1, 340'000, 45'000},
    {"IX", 9237, 9387, 1, 0, 95'000},
    {"X", 3112, 3388, 1, 1'490'000, 400'000},
    {"X", 3412, 3687, 25, 1'430'100, 400'000},
    {"XI", 3712, 3787, 1, 736'000, 48'000},
    {"XII", 3842, 3903, 1, -37'000, 30'000},
    {"XII", 3932, 3932, 1, -54'900, 30'000},
    {"XII", 3957, 3962, 5, -54'900, 30'000},
    {"XII", 3987, 3992, 5, -54'900, 30'000},
    {"XIII", 4017, 4043, 1, -55'000, -31'000},
    {"XIII", 4067, 4092, 25, -64'900, -31'000},
    {"XIV", 4117, 4143, 1, -63'000, -30'000},
    {"XIV", 4167, 4192, 25, -72'900, -30'000},
    {"XIX", 712, 763, 1, 735'000, 45'000},
    {"XIX", 787, 837, 25, 720'100, 45'000},
    {"XX", 4512, 4638, 1, -109'000, -41'000},
    {"XXI", 862, 912, 1, 1'326'000, 48'000},
    {"XXII", 4662, 5038, 1, 2'580'000, 100'000},
    {"XXV", 5112, 5413, 1, 910'000, 80'000},
    {"XXV", 5437, 5737, 25, 845'100, 80'000},
    {"XXVI", 5762, 5913, 1, -291'000, 45'000},
    {"XXVI", 5937, 5987, 25, -325'900, 45'000},
    {"XXVI", 5992, 5992, 1, -325'900, 45'000},
    {"XXVI", 6012, 6017, 5, -325'900, 45'000},
    {"XXVI", 6037, 6042, 5, -325'900, 45'000},
    {"XXVI", 6062, 6067, 5, -325'900, 45'000},
    {"XXVI", 6087, 6087, 1, -325'900, 45'000},
    {"XXXII", 6617, 6813, 1, 131'000, noUplink},
    {"XXXII", 6837, 7012, 25, 87'100, noUplink},
};

} // namespace

Carrier carrierOfUARFCN(std::int64_t uarfcn) {
    Carrier carrier;
    for (const Range& each : ranges) {
        if (uarfcn < each.first || uarfcn > each.last || (uarfcn - each.first) % each.step != 0)
            continue;
        const std::int32_t downlink = 200 * static_cast<std::int32_t>(uarfcn) + each.offset_kHz;
        CarrierBand band{each.band, downlink, std::nullopt};
        if (each.separation_kHz != noUplink)
            band.uplink_kHz = downlink - each.separation_kHz;
        carrier.add(band);
    }
    return carrier;
}

} // namespace velmora::Bands
