// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/Registration/ProcessPS.h"

#include "LogGenerator/OstrelGSM/Records.h"
#include "Platform/SystemLog.h"

namespace velmora {

namespace {

// 0x7130: GMM states and sub-states (3GPP TS 24.008 4.1.3.1) and GPRS update status (4.1.3.2), with the
// modem's own numbers.
constexpr EnumText stateRows[] = {
    {0, "GMM_NULL"},
    {1, "GMM_DEREGISTERED"},
    {2, "GMM_REGISTERED_INITIATED"},
    {3, "GMM_REGISTERED"},
    {4, "GMM_DEREGISTERED_INITIATED"},
    {5, "GMM_ROUTING_AREA_UPDATE_INITIATED"},
    {6, "GMM_SERVICE_REQUEST_INITIATED"},
};
constexpr EnumTexts states(stateRows, "Unknown");

constexpr EnumText subStateRows[] = {
    {0, "GMM_NORMAL_SERVICE"},
    {1, "GMM_LIMITED_SERVICE"},
    {2, "GMM_ATTACH_NEEDED"},
    {3, "GMM_ATTEMPTING_TO_ATTACH"},
    {4, "GMM_NO_IMSI"},
    {5, "GMM_NO_CELL_AVAILABLE"},
    {6, "GMM_PLMN_SEARCH"},
    {7, "GMM_SUSPENDED"},
    {8, "GMM_UPDATE_NEEDED"},
    {9, "GMM_ATTEMPING_TO_UPDATE"}, // the modem's own spelling
    {10, "GMM_ATTEMPTING_TO_UPDATE_MM"},
    {11, "GMM_IMSI_DETACH_INITIATED"},
    {12, "GMM_NULL_SUBSTATE"},
};
constexpr EnumTexts subStates(subStateRows, "Unknown");

constexpr EnumText updateStatusRows[] = {
    {0, "GMM_GU1_UPDATED"},
    {1, "GMM_GU2_NOT_UPDATED"},
    {2, "GMM_GU3_PLMN_NOT_ALLOWED"},
    {3, "GMM_GU3_ROUTING_AREA_NOT_ALLOWED"},
};
constexpr EnumTexts updateStatuses(updateStatusRows, "Unknown");

// The first label is the same as the circuit-switched state's, on purpose.
constexpr Field stateFields[] = {
    {"MM State", u8At(13), text(states), {.clause = "3GPP TS 24.008 4.1.3.1"}},
    {"MM Sub State", u8At(14), text(subStates), {.clause = "3GPP TS 24.008 4.1.3.1"}},
    {"Attach Reject Cause", u8At(15), text(updateStatuses), {.clause = "3GPP TS 24.008 4.1.3.2"}},
};
constexpr Layout state = layout(16, stateFields);

constexpr View sectionViews[] = {
    {0x7130, state},
    {0x7132, OstrelGSM::registration},
};

} // namespace

std::span<const View> ProcessPS::views() const {
    return sectionViews;
}

void ProcessPS::trace() const {
    logLine(LogPriority::Warning, "ProcessPS");
}

} // namespace velmora
