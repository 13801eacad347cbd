// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/RadioNetwork.h"
#include "Telephony/Drives/RecordBuilder.h"

#include <cstdint>
#include <vector>

/// The records of registration and mobility management, one function a log code. The enumerators carry the
/// numbers in the records; only those that a scenario sends are listed.
namespace velmora::records {

enum class RegistrationState : std::uint8_t {
    Inactive,
    Idle,
    Registering,
    Deregistering,
    ManualSearch,
    AutomaticSearch,
    Offline
};

enum class MMState : std::uint8_t {
    Null = 0,
    LocationUpdateInitiated = 3,
    WaitForOutgoingConnection = 5,
    ConnectionActive = 6,
    IMSIDetachInitiated = 7,
    WaitForNetworkCommand = 9,
    WaitForRRConnectionLU = 13,
    WaitForRRConnectionMM = 14,
    WaitForRRConnectionIMSIDetach = 15,
    ReestablishmentInitiated = 17,
    WaitForRRActive = 18,
    Idle = 19,
    WaitForRRConnectionReestablishment = 21,
    WaitForReestablishDecision = 22,
};

enum class MMSubState : std::uint8_t {
    Null,
    NoIMSI,
    PLMNSearch,
    LimitedService,
    AttemptingToUpdate,
    LocationUpdateNeeded,
    NoCellAvailable,
    PLMNSearchNormalService,
    NormalService
};

enum class UpdateStatus : std::uint8_t { Updated, NotUpdated };

enum class GMMState : std::uint8_t {
    Null,
    Deregistered,
    RegisteredInitiated,
    Registered,
    DeregisteredInitiated,
    RoutingAreaUpdateInitiated,
    ServiceRequestInitiated
};

enum class GMMSubState : std::uint8_t {
    NormalService,
    LimitedService,
    AttachNeeded,
    AttemptingToAttach,
    NoIMSI,
    NoCellAvailable,
    PLMNSearch,
    Suspended,
    UpdateNeeded,
    AttemptingToUpdate,
    AttemptingToUpdateMM,
    IMSIDetachInitiated,
    NullSubState
};

enum class ServiceType : std::uint8_t { NoService, CSOnly, PSOnly, CSAndPS, Limited };

/// 0x7130
[[nodiscard]] RecordBuilder gmmState(GMMState state, GMMSubState subState, UpdateStatus status);
/// 0x7131
[[nodiscard]] RecordBuilder mmState(MMState state, MMSubState subState, UpdateStatus status);
/// 0x7132; PLMN selection is automatic.
[[nodiscard]] RecordBuilder registrationState(RegistrationState state);
/// 0x7135; `operatingMode` counts from 0.
[[nodiscard]] RecordBuilder servingNetwork(int operatingMode, ServiceType service, const CellArea& area);
/// 0x7150. The digits of an entry alternate (MCC 1, MNC 1, MCC 2, MNC 2, MCC 3, MNC 3) in six bytes, but
/// entries are read three bytes apart: all but the first share half of their bytes with the one before, whose
/// second half is their first. So the first network is stored unchanged, and of each later one only the last
/// half.
[[nodiscard]] RecordBuilder equivalentNetworks(const std::vector<PLMN>& networks);

} // namespace velmora::records
