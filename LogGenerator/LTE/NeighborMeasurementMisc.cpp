// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LTE/NeighborMeasurementMisc.h"

#include "LogGenerator/LTE/Records.h"
#include "Platform/SystemLog.h"

namespace velmora {

using LTE::NeighborRecord;

namespace {

// EARFCN (3GPP TS 36.101 5.7.3); Q-RxLevMin in steps of 2 dB (TS 36.331), counted from -140 dBm by the modem.
constexpr Field headerFields[] = {
    {"Version", u8At(13), integer("%d")},
    {"E-ARFCN", u16At(17), integer("%d"), {.clause = "3GPP TS 36.101 5.7.3"}},
    {"Qrxlevmin", bitsAt(19, 0, 6), integer("%d dBm", -140, 2), {.clause = "3GPP TS 36.331 6.3.1"}},
};
constexpr Layout header = layout(NeighborRecord::minimumLength, headerFields);

constexpr View sectionViews[] = {{NeighborRecord::code, header}};

} // namespace

std::span<const View> NeighborMeasurementMisc::views() const {
    return sectionViews;
}

} // namespace velmora
