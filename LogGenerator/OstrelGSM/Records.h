// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/Field.h"

namespace velmora::OstrelGSM {

/// Tables that several sections of this technology read. Offsets count from the record's first byte, and a
/// value outside an enumeration shows "Unknown".

/// As the modem reports them.
inline constexpr EnumText registrationStateRows[] = {
    {0, "REG_STATE_INACTIVE"},      {1, "REG_STATE_IDLE"},          {2, "REG_STATE_REGISTERING"},
    {3, "REG_STATE_DEREGISTERING"}, {4, "REG_STATE_MANUAL_SEARCH"}, {5, "REG_STATE_AUTOMATIC_SEARCH"},
    {6, "REG_STATE_OFFLINE"},
};
inline constexpr EnumTexts registrationStates(registrationStateRows, "Unknown");

/// The main states, with the numbers of 3GPP TS 24.008 4.1.2.1; the texts are the modem's.
/// 1, 2, 4, 11, 12, 16 and 24 have no text of their own. The blanks inside 20 and 21 are part of the texts.
inline constexpr EnumText mmStateRows[] = {
    {0, "MM_NULL"},
    {3, "MM_LOCATION_UPDATE_INITIATED"},
    {5, "MM_WAIT_FOR_OUTGOING_MM_CONNECTION"},
    {6, "MM_CONNECTION_ACTIVE"},
    {7, "MM_IMSI_DETACH_INITIATED"},
    {8, "MM_PROCESS_CM_SERVICE_PROMPT"},
    {9, "MM_WAIT_FOR_NETWORK_COMMAND"},
    {10, "MM_LOCATION_UPDATE_REJECTED"},
    {13, "MM_WAIT_FOR_RR_CONNECTION_LU"},
    {14, "MM_WAIT_FOR_RR_CONNECTION_MM"},
    {15, "MM_WAIT_FOR_RR_CONNECTION_IMSI_DETACH"},
    {17, "MM_REESTABLISHMENT_INITIATED"},
    {18, "MM_WAIT_FOR_RR_ACTIVE"},
    {19, "MM_IDLE"},
    {20, "MM_WAIT_FOR_ADDITIONAL_OUTGOING_MM_ CONNECTION"},
    {21, "MM_WAIT_FOR_RR_CONNECTION_ REESTABLISHMENT"},
    {22, "MM_WAIT_FOR_REESTABLISH_DECISION"},
    {23, "MM_LOCATION_UPDATING_PENDING"},
    {25, "MM_RR_CONNECTION_RELEASE_NOT_ALLOWED"},
};
inline constexpr EnumTexts mmStates(mmStateRows, "Unknown");

/// 0x7132, registration, as the modem reports it: what `ProcessCS`, `ProcessPS` and `ProcessCO` show of it.
inline constexpr Field registrationFields[] = {
    {"MM Service State", u8At(13), text(registrationStates), {.role = Role::RegistrationState}},
};
inline constexpr Layout registration = layout(16, registrationFields);

} // namespace velmora::OstrelGSM
