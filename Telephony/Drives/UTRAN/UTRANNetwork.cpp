// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/UTRAN/UTRANNetwork.h"

#include <cstddef>
#include <iterator>

namespace velmora {
namespace {

constexpr int carriers[] = {10054, 10062, 10070, 10079, 10087, 10095, 10104, 10112, 10121};
constexpr int parameterIdCount = 128;

/// Nine and 128 have no divisor in common: two scrambling codes, which are below 512, never give the same
/// carrier and cell parameter id.
UTRANCell cellInPlaceOf(const UMTSCell& cell) {
    const auto code = static_cast<std::size_t>(cell.scramblingCode);
    return {carriers[code % std::size(carriers)], cell.scramblingCode % parameterIdCount, cell.cellId,
            cell.area};
}

} // namespace

void UTRANNetwork::drive(double seconds) {
    _network.drive(seconds);
    measure();
}

void UTRANNetwork::measure() {
    _cells.clear();
    for (const UMTSMeasurement& each : _network.umts())
        _cells.push_back({cellInPlaceOf(*each.cell), each.rscp_dBm});
}

} // namespace velmora
