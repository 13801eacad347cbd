// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/Registration/ProcessCS.h"

#include "LogGenerator/OstrelGSM/Records.h"
#include "Platform/SystemLog.h"

namespace velmora {

namespace {

// 0x7131: MM state (3GPP TS 24.008 4.1.2.1); the sub-states of MM IDLE (4.1.2.1) and the update status
// (4.1.2.2) are the standard's, their numbers the modem's.
constexpr EnumText subStateRows[] = {
    {0, "MM_NULL_SUBSTATE"},        {1, "MM_NO_IMSI"},
    {2, "MM_PLMN_SEARCH"},          {3, "MM_LIMITED_SERVICE"},
    {4, "MM_ATTEMPTING_TO_UPDATE"}, {5, "MM_LOCATION_UPDATE_NEEDED"},
    {6, "MM_NO_CELL_AVAILABLE"},    {7, "MM_PLMN_SEARCH_NORMAL_SERVICE"},
    {8, "MM_NORMAL_SERVICE"},
};
constexpr EnumTexts subStates(subStateRows, "Unknown");

constexpr EnumText updateStatusRows[] = {
    {0, "UPDATED"},
    {1, "NOT_UPDATED"},
    {2, "ROAMING_NOT_ALLOWED"},
    {3, "LOCATION_AREA_NOT_ALLOWED"},
};
constexpr EnumTexts updateStatuses(updateStatusRows, "Unknown");

constexpr Field stateFields[] = {
    {"MM State", u8At(13), text(OstrelGSM::mmStates), {.clause = "3GPP TS 24.008 4.1.2.1"}},
    {"MM Sub State", u8At(14), text(subStates), {.clause = "3GPP TS 24.008 4.1.2.1"}},
    {"LU Reject Cause", u8At(15), text(updateStatuses), {.clause = "3GPP TS 24.008 4.1.2.2"}},
};
constexpr Layout state = layout(16, stateFields);

constexpr View sectionViews[] = {
    {0x7131, state},
    {0x7132, OstrelGSM::registration},
};

} // namespace

std::span<const View> ProcessCS::views() const {
    return sectionViews;
}

void ProcessCS::trace() const {
    logLine(LogPriority::Warning, "ProcessCS");
}

} // namespace velmora
