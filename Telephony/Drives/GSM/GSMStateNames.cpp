// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/GSM/GSMStateNames.h"

namespace velmora {

std::string_view nameOf(records::RRState state) {
    using enum records::RRState;
    switch (state) {
    case Inactive: return "inactive";
    case GoingActive: return "going active";
    case CellSelection: return "cell selection";
    case PLMNListConstruction: return "PLMN list construction";
    case Idle: return "idle";
    case CellReselection: return "cell reselection";
    case ConnectionPending: return "connection pending";
    case ChooseCell: return "choose cell";
    case DataTransfer: return "data transfer";
    case ConnectionRelease: return "connection release";
    case EarlyCampedWaitForSI: return "early camped, wait for SI";
    case UMTSToGSMReselection: return "W2G interRAT reselection";
    case GSMToUMTSReselection: return "G2W interRAT reselection";
    case GSMToUMTSHandover: return "G2W interRAT handover";
    case CellReestablishment: return "cell reest";
    }
    return "";
}

std::string_view nameOf(records::RRCState state) {
    using enum records::RRCState;
    switch (state) {
    case Disconnected: return "disconnected";
    case Connecting: return "connecting";
    case CellFACH: return "CELL FACH";
    case CellDCH: return "CELL DCH";
    case CellPCH: return "CELL PCH";
    case URAPCH: return "URA PCH";
    }
    return "";
}

std::string_view nameOf(records::RegistrationState state) {
    using enum records::RegistrationState;
    switch (state) {
    case Inactive: return "inactive";
    case Idle: return "idle";
    case Registering: return "registering";
    case Deregistering: return "deregistering";
    case ManualSearch: return "manual search";
    case AutomaticSearch: return "automatic search";
    case Offline: return "offline";
    }
    return "";
}

std::string_view nameOf(records::MMState state) {
    using enum records::MMState;
    switch (state) {
    case Null: return "null";
    case LocationUpdateInitiated: return "location update initiated";
    case WaitForOutgoingConnection: return "wait for outgoing connection";
    case ConnectionActive: return "connection active";
    case IMSIDetachInitiated: return "IMSI detach initiated";
    case WaitForNetworkCommand: return "wait for network command";
    case WaitForRRConnectionLU: return "wait for RR connection LU";
    case WaitForRRConnectionMM: return "wait for RR connection MM";
    case WaitForRRConnectionIMSIDetach: return "wait for RR connection IMSI detach";
    case ReestablishmentInitiated: return "reestablishment initiated";
    case WaitForRRActive: return "wait for RR active";
    case Idle: return "idle";
    case WaitForRRConnectionReestablishment: return "wait for RR connection reestablishment";
    case WaitForReestablishDecision: return "wait for reestablish decision";
    }
    return "";
}

std::string_view nameOf(records::MMSubState state) {
    using enum records::MMSubState;
    switch (state) {
    case Null: return "null";
    case NoIMSI: return "no IMSI";
    case PLMNSearch: return "PLMN search";
    case LimitedService: return "limited service";
    case AttemptingToUpdate: return "attempting to update";
    case LocationUpdateNeeded: return "location update needed";
    case NoCellAvailable: return "no cell available";
    case PLMNSearchNormalService: return "PLMN search normal service";
    case NormalService: return "normal service";
    }
    return "";
}

std::string_view nameOf(records::GMMState state) {
    using enum records::GMMState;
    switch (state) {
    case Null: return "null";
    case Deregistered: return "deregistered";
    case RegisteredInitiated: return "registered initiated";
    case Registered: return "registered";
    case DeregisteredInitiated: return "deregistered initiated";
    case RoutingAreaUpdateInitiated: return "routing area update initiated";
    case ServiceRequestInitiated: return "service request initiated";
    }
    return "";
}

std::string_view nameOf(records::GMMSubState state) {
    using enum records::GMMSubState;
    switch (state) {
    case NormalService: return "normal service";
    case LimitedService: return "limited service";
    case AttachNeeded: return "attach needed";
    case AttemptingToAttach: return "attempting to attach";
    case NoIMSI: return "no IMSI";
    case NoCellAvailable: return "no cell available";
    case PLMNSearch: return "PLMN search";
    case Suspended: return "suspended";
    case UpdateNeeded: return "update needed";
    case AttemptingToUpdate: return "attempting to update";
    case AttemptingToUpdateMM: return "attempting to update MM";
    case IMSIDetachInitiated: return "IMSI detach initiated";
    case NullSubState: return "null substate";
    }
    return "";
}

} // namespace velmora
