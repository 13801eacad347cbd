// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LTE/DetectedCells.h"

namespace velmora {

using LTE::IntraFrequencyRecord;

namespace {

// 0xB179: physical cell identity (3GPP TS 36.211 6.11).
constexpr Field cellFields[] = {
    {"Physical Cell ID",
     u16At(0),
     integer("%d"),
     {.role = Role::NeighbourPhysicalCell, .clause = "3GPP TS 36.211 6.11"}},
};
constexpr Layout cell = layout(IntraFrequencyRecord::detectedLength, cellFields);

} // namespace

DetectedCells::DetectedCells() : IntraFrequencyList(&IntraFrequencyRecord::detected, cell) {}

} // namespace velmora
