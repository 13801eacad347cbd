// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LTE/MeasuredNeighborCells.h"

namespace velmora {

using LTE::IntraFrequencyRecord;

namespace {

// 0xB179: physical cell identity (3GPP TS 36.211 6.11); level and quality: see Records.h.
constexpr Field cellFields[] = {
    {"Physical Cell ID",
     u16At(0),
     integer("%d"),
     {.role = Role::NeighbourPhysicalCell, .clause = "3GPP TS 36.211 6.11"}},
    {"Filtered RSRP",
     u16At(2),
     LTE::filteredRSRP,
     {.role = Role::NeighbourLevel, .clause = "3GPP TS 36.214 5.1.1"}},
    {"Filtered RSRQ",
     u16At(4),
     LTE::filteredRSRQ,
     {.role = Role::NeighbourQuality, .clause = "3GPP TS 36.214 5.1.3"}},
};
constexpr Layout cell = layout(IntraFrequencyRecord::neighbourLength, cellFields);

} // namespace

MeasuredNeighborCells::MeasuredNeighborCells()
    : IntraFrequencyList(&IntraFrequencyRecord::neighbours, cell) {}

} // namespace velmora
