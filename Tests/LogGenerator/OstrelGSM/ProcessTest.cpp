// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/Registration/ProcessCO.h"
#include "LogGenerator/OstrelGSM/Registration/ProcessCS.h"
#include "LogGenerator/OstrelGSM/Registration/ProcessPS.h"
#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/Support/Hex.h"

#include <gtest/gtest.h>

namespace velmora {

namespace {

const auto makeCS = inDictionary<ProcessCS>;
const auto makePS = inDictionary<ProcessPS>;
const auto makeCO = inDictionary<ProcessCO>;

void expectRegistrationStates(SectionHarness (*make)()) {
    expectEnumeration(make, recordWith(0x7132, 16), 13, "MM Service State",
                      {{0, "REG_STATE_INACTIVE"},
                       {1, "REG_STATE_IDLE"},
                       {2, "REG_STATE_REGISTERING"},
                       {3, "REG_STATE_DEREGISTERING"},
                       {4, "REG_STATE_MANUAL_SEARCH"},
                       {5, "REG_STATE_AUTOMATIC_SEARCH"},
                       {6, "REG_STATE_OFFLINE"}},
                      "Unknown");
}

void expectMMStates(SectionHarness (*make)()) {
    expectEnumeration(make, recordWith(0x7131, 16), 13, "MM State",
                      {{0, "MM_NULL"},
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
                       {25, "MM_RR_CONNECTION_RELEASE_NOT_ALLOWED"}},
                      "Unknown");
}

TEST(ProcessCS, ShowsEveryState) {
    expectRegistrationStates(makeCS);
    expectMMStates(makeCS);
    const Data states = recordWith(0x7131, 16);
    expectEnumeration(makeCS, states, 14, "MM Sub State",
                      {{0, "MM_NULL_SUBSTATE"},
                       {1, "MM_NO_IMSI"},
                       {2, "MM_PLMN_SEARCH"},
                       {3, "MM_LIMITED_SERVICE"},
                       {4, "MM_ATTEMPTING_TO_UPDATE"},
                       {5, "MM_LOCATION_UPDATE_NEEDED"},
                       {6, "MM_NO_CELL_AVAILABLE"},
                       {7, "MM_PLMN_SEARCH_NORMAL_SERVICE"},
                       {8, "MM_NORMAL_SERVICE"}},
                      "Unknown");
    expectEnumeration(
        makeCS, states, 15, "LU Reject Cause",
        {{0, "UPDATED"}, {1, "NOT_UPDATED"}, {2, "ROAMING_NOT_ALLOWED"}, {3, "LOCATION_AREA_NOT_ALLOWED"}},
        "Unknown");
}

TEST(ProcessCS, WritesItsLabelsInOrder) {
    expectPrefixes(makeCS, record(0x7131, "13 08 02 FF"), 16, "ProcessCS",
                   "{MM State 'MM_IDLE', MM Sub State 'MM_NORMAL_SERVICE', "
                   "LU Reject Cause 'ROAMING_NOT_ALLOWED'}");
    expectPrefixes(makeCS, record(0x7132, "01 00 00 FF"), 16, "ProcessCS",
                   "{MM Service State 'REG_STATE_IDLE'}");
}

TEST(ProcessPS, ShowsEveryState) {
    expectRegistrationStates(makePS);
    const Data states = recordWith(0x7130, 16);
    expectEnumeration(makePS, states, 13, "MM State",
                      {{0, "GMM_NULL"},
                       {1, "GMM_DEREGISTERED"},
                       {2, "GMM_REGISTERED_INITIATED"},
                       {3, "GMM_REGISTERED"},
                       {4, "GMM_DEREGISTERED_INITIATED"},
                       {5, "GMM_ROUTING_AREA_UPDATE_INITIATED"},
                       {6, "GMM_SERVICE_REQUEST_INITIATED"}},
                      "Unknown");
    expectEnumeration(makePS, states, 14, "MM Sub State",
                      {{0, "GMM_NORMAL_SERVICE"},
                       {1, "GMM_LIMITED_SERVICE"},
                       {2, "GMM_ATTACH_NEEDED"},
                       {3, "GMM_ATTEMPTING_TO_ATTACH"},
                       {4, "GMM_NO_IMSI"},
                       {5, "GMM_NO_CELL_AVAILABLE"},
                       {6, "GMM_PLMN_SEARCH"},
                       {7, "GMM_SUSPENDED"},
                       {8, "GMM_UPDATE_NEEDED"},
                       {9, "GMM_ATTEMPING_TO_UPDATE"}, // spelt like this
                       {10, "GMM_ATTEMPTING_TO_UPDATE_MM"},
                       {11, "GMM_IMSI_DETACH_INITIATED"},
                       {12, "GMM_NULL_SUBSTATE"}},
                      "Unknown");
    expectEnumeration(makePS, states, 15, "Attach Reject Cause",
                      {{0, "GMM_GU1_UPDATED"},
                       {1, "GMM_GU2_NOT_UPDATED"},
                       {2, "GMM_GU3_PLMN_NOT_ALLOWED"},
                       {3, "GMM_GU3_ROUTING_AREA_NOT_ALLOWED"}},
                      "Unknown");
}

TEST(ProcessPS, WritesItsLabelsInOrder) {
    expectPrefixes(makePS, record(0x7130, "03 00 01 FF"), 16, "ProcessPS",
                   "{MM State 'GMM_REGISTERED', MM Sub State 'GMM_NORMAL_SERVICE', "
                   "Attach Reject Cause 'GMM_GU2_NOT_UPDATED'}");
    expectPrefixes(makePS, record(0x7132, "06 00 00 FF"), 16, "ProcessPS",
                   "{MM Service State 'REG_STATE_OFFLINE'}");
}

TEST(ProcessCO, ShowsTheStateAlone) {
    expectRegistrationStates(makeCO);
    expectMMStates(makeCO);
    expectPrefixes(makeCO, record(0x7131, "13 08 02 FF"), 16, "ProcessCS", "{MM State 'MM_IDLE'}");
    expectPrefixes(makeCO, record(0x7132, "02 00 00 FF"), 16, "ProcessCS",
                   "{MM Service State 'REG_STATE_REGISTERING'}");
}

} // namespace

} // namespace velmora
