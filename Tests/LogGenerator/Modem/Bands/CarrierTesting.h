// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Modem/Bands/Carrier.h"

#include <cstdint>
#include <span>

namespace velmora::Bands {

/// What a channel number must mean. Bands are named with a blank between, frequencies in MHz, and 0 is for
/// none.
struct CarrierRow {
    std::int64_t number;
    const char* bands;
    double downlink_MHz;
    double uplink_MHz;
    const char* overlapping = "";
};

void expectCarriers(Carrier (*carrierOf)(std::int64_t), std::span<const CarrierRow> rows);
/// Expects that these numbers, the lowest and the highest of 64 bits mean nothing at all.
void expectNoCarriers(Carrier (*carrierOf)(std::int64_t), std::span<const std::int64_t> numbers);

} // namespace velmora::Bands
