// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/Bands/GSMBands.h"

namespace velmora::Bands {
namespace {

/// Consecutive numbers of a band, 200 kHz apart. The separation is that of the downlink from the uplink.
struct Range {
    std::string_view band;
    std::int32_t first;
    std::int32_t last;
    std::int32_t firstUplink_kHz;
    std::int32_t separation_kHz;
};

// E-GSM holds P-GSM, R-GSM holds E-GSM, and ER-GSM holds R-GSM: each has a row for the numbers that it adds.
constexpr Range ranges[] = {
    {"E-GSM 900", 0, 0, 890'000, 45'000},      {"P-GSM 900", 1, 124, 890'200, 45'000},
    {"GSM 850", 128, 251, 824'200, 45'000},    {"GSM 450", 259, 293, 450'600, 10'000},
    {"GSM 480", 306, 340, 479'000, 10'000},    {"GSM 750", 438, 511, 777'200, -30'000},
    {"DCS 1800", 512, 885, 1'710'200, 95'000}, {"PCS 1900", 512, 810, 1'850'200, 80'000},
    {"ER-GSM 900", 940, 954, 873'200, 45'000}, {"R-GSM 900", 955, 974, 876'200, 45'000},
    {"E-GSM 900", 975, 1023, 880'200, 45'000},
};

} // namespace

Carrier carrierOfARFCN(std::int64_t arfcn) {
    Carrier carrier;
    for (const Range& each : ranges) {
        if (arfcn < each.first || arfcn > each.last)
            continue;
        const std::int32_t uplink =
            each.firstUplink_kHz + 200 * (static_cast<std::int32_t>(arfcn) - each.first);
        carrier.add({each.band, uplink + each.separation_kHz, uplink});
    }
    return carrier;
}

} // namespace velmora::Bands
