// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/GSM/GSMRRInfo.h"

#include "Platform/SystemLog.h"

namespace velmora {

namespace {

// 0x512C: states of the radio-resource layer, as the modem reports them. The blanks inside 13, 19 and 21 are
// part of the texts.
constexpr EnumText rrStateRows[] = {
    {0, "RR_INACTIVE"},
    {1, "RR_GOING_ACTIVE"},
    {2, "RR_GOING_INACTIVE"},
    {3, "RR_CELL_SELECTION"},
    {4, "RR_PLMN_LIST_CONSTRUCTION"},
    {5, "RR_IDLE"},
    {6, "RR_CELL_RESELECTION"},
    {7, "RR_CONNECTION_PENDING"},
    {8, "RR_CHOOSE_CELL"},
    {9, "RR_DATA_TRANSFER"},
    {10, "RR_NO_CHANNELS"},
    {11, "RR_CONNECTION_RELEASE"},
    {12, "RR_EARLY_CAMPED_WAIT_FOR_SI"},
    {13, "RR_W2G_INTERRAT_HANDOVER_ PROGRESS"},
    {14, "RR_W2G_INTERRAT_RESELECTION_PROGRESS"},
    {15, "RR_WAIT_FOR_EARLY_PSCAN"},
    {16, "GRR51"},
    {17, "GRR52"},
    {18, "RR_G2W_INTERRAT_RESELECTION_PROGRESS"},
    {19, "RR_G2W_INTERRAT_HANDOVER_ PROGRESS"},
    {20, "RR_CELL_REEST"},
    {21, "RR_W2G_INTERRAT_CC_ORDER_ PROGRESS"},
};
constexpr EnumTexts rrStates(rrStateRows, "Unknown");

constexpr Field stateFields[] = {
    {"RR State", u8At(13), text(rrStates), {.role = Role::RadioState}},
    {"RR Sub State", u8At(14), integer("%d")},
    {"RR Status", u8At(15), integer("%d")},
    {"RR Mode", u8At(16), flag("Data", "Voice")},
};
constexpr Layout state = layout(17, stateFields);

// 0x5137: RXLEV and RXQUAL are quantities of 3GPP TS 45.008 (8.1, 8.2); the numbers are the modem's, not the
// steps of 8.1.4 and 8.2.4. "GSM Serving Cell" shows the same bytes as level, C1 and C2, on purpose.
constexpr Field measurementFields[] = {
    {"Serving Rx Level", u8At(15), integer("%d")},
    {"Rx Quality Full", i32At(16), integer("%d")},
    {"Rx Quality Sub", i32At(20), integer("%d")},
};
constexpr Layout measurements = layout(29, measurementFields);

// 0x5072: as the modem reports it.
constexpr Field dtxFields[] = {
    {"DTX Used", u8At(19), flag("ON", "OFF")},
};
constexpr Layout dtx = layout(20, dtxFields);

// 0x51F6: the byte of DRX_TIMER_MAX (3GPP TS 44.060 12.24); shown as seconds, as the modem reports it.
constexpr Field drxFields[] = {
    {"DRX Used", u8At(16), integer("%d sec")},
};
constexpr Layout drx = layout(24, drxFields);

constexpr View sectionViews[] = {
    {0x512C, state},
    {0x5137, measurements},
    {0x5072, dtx},
    {0x51F6, drx},
};

} // namespace

std::span<const View> GSMRRInfo::views() const {
    return sectionViews;
}

void GSMRRInfo::trace() const {
    logLine(LogPriority::Warning, "GSMRRInfo");
}

} // namespace velmora
