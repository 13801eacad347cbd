// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LTE/ConnectedModeMeasurementMisc.h"

#include "LogGenerator/LTE/Records.h"
#include "Platform/SystemLog.h"

namespace velmora {

using LTE::IntraFrequencyRecord;

namespace {

// EARFCN (3GPP TS 36.101 5.7.3), physical cell identity (TS 36.211 6.11); level and quality: see Records.h.
constexpr Field servingFields[] = {
    {"E-ARFCN", u16At(17), integer("%d"), {.role = Role::ServingChannel, .clause = "3GPP TS 36.101 5.7.3"}},
    {"Serving Physical Cell ID",
     u16At(19),
     integer("%d"),
     {.role = Role::ServingPhysicalCell, .clause = "3GPP TS 36.211 6.11"}},
    {"Subframe Number", u16At(21), integer("%d")},
    {"Serving Filtered RSRP",
     u16At(23),
     LTE::filteredRSRP,
     {.role = Role::ServingLevel, .clause = "3GPP TS 36.214 5.1.1"}},
    {"Serving Filtered RSRQ",
     u16At(25),
     LTE::filteredRSRQ,
     {.role = Role::ServingQuality, .clause = "3GPP TS 36.214 5.1.3"}},
};
constexpr Layout serving = layout(IntraFrequencyRecord::minimumLength, servingFields);

constexpr View sectionViews[] = {{IntraFrequencyRecord::code, serving}};

} // namespace

std::span<const View> ConnectedModeMeasurementMisc::views() const {
    return sectionViews;
}

} // namespace velmora
