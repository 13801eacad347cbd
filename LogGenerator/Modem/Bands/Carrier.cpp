// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/Bands/Carrier.h"

#include <algorithm>

namespace velmora::Bands {
namespace {

std::optional<double> megahertz(const std::optional<std::int32_t>& kHz) {
    return kHz ? std::optional<double>(*kHz / 1000.0) : std::nullopt;
}

} // namespace

void Carrier::add(const CarrierBand& band) {
    if (_count < maximumBands)
        _bands[_count++] = band;
}

void Carrier::addOverlapping(std::string_view band) {
    if (_overlappingCount < maximumBands)
        _overlapping[_overlappingCount++] = band;
}

std::optional<double> Carrier::downlink_MHz() const {
    if (_count == 0)
        return megahertz(_downlink_kHz);
    const std::int32_t first = _bands[0].downlink_kHz;
    const bool agree =
        std::ranges::all_of(bands(), [first](const CarrierBand& each) { return each.downlink_kHz == first; });
    return agree ? megahertz(first) : std::nullopt;
}

std::optional<double> Carrier::uplink_MHz() const {
    if (_count == 0)
        return std::nullopt;
    const std::optional<std::int32_t> first = _bands[0].uplink_kHz;
    const bool agree =
        std::ranges::all_of(bands(), [first](const CarrierBand& each) { return each.uplink_kHz == first; });
    return agree ? megahertz(first) : std::nullopt;
}

} // namespace velmora::Bands
