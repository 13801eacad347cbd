// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LTE/ReselectionCandidatesMisc.h"

#include "LogGenerator/LTE/Records.h"
#include "Platform/SystemLog.h"

namespace velmora {

using LTE::ReselectionRecord;

namespace {

// EARFCN (3GPP TS 36.101 5.7.3), physical cell identity (TS 36.211 6.11).
constexpr Field headerFields[] = {
    {"Version", u8At(13), integer("%d")},
    {"Serving EARFCN",
     u16At(15),
     integer("%d"),
     {.role = Role::ServingChannel, .clause = "3GPP TS 36.101 5.7.3"}},
    {"Serving Cell ID",
     u16At(17),
     integer("%d"),
     {.role = Role::ServingPhysicalCell, .clause = "3GPP TS 36.211 6.11"}},
};
constexpr Layout header = layout(ReselectionRecord::minimumLength, headerFields);

constexpr View sectionViews[] = {{ReselectionRecord::code, header}};

} // namespace

std::span<const View> ReselectionCandidatesMisc::views() const {
    return sectionViews;
}

} // namespace velmora
