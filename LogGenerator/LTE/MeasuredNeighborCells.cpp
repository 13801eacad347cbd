// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LTE/MeasuredNeighborCells.h"

namespace velmora {

using LTE::IntraFrequencyRecord;

namespace {

// 0xB179: physical cell identity (3GPP TS 36.211 6.11); level and quality: see Records.h.
constexpr Field cellFields[] = {
    {"Physical Cell ID", u16At(0), integer("%d")},
    {"Filtered RSRP", u16At(2), LTE::filteredRSRP},
    {"Filtered RSRQ", u16At(4), LTE::filteredRSRQ},
};
constexpr Layout cell = layout(IntraFrequencyRecord::neighbourLength, cellFields);

} // namespace

MeasuredNeighborCells::MeasuredNeighborCells()
    : IntraFrequencyList(&IntraFrequencyRecord::neighbours, cell) {}

} // namespace velmora
