// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/DriveIdentities.h"
#include "Telephony/Drives/GSM/GSMCellRecords.h"
#include "Telephony/Drives/GSM/RegistrationRecords.h"
#include "Telephony/Drives/GSM/UMTSRecords.h"
#include "Telephony/Drives/RadioNetwork.h"

#include <cstdint>

namespace velmora {

/// The phone of the GSM scenario: where it camps and what its protocols' states are. Procedures change it,
/// reports show it.
struct GSMPhone {
    enum class Radio : std::uint8_t { Off, Searching, GSM, UMTS };
    enum class Connection : std::uint8_t { None, Call, PacketSession };

    Radio radio = Radio::Off;
    Connection connection = Connection::None;
    GSMMeasurement gsm;   ///< the serving cell; null unless the radio is on GSM
    UMTSMeasurement umts; ///< the serving cell; null unless the radio is on UMTS

    records::RegistrationState registration = records::RegistrationState::Offline;
    records::MMState mm = records::MMState::Null;
    records::MMSubState mmSub = records::MMSubState::Null;
    records::UpdateStatus mmStatus = records::UpdateStatus::NotUpdated;
    records::GMMState gmm = records::GMMState::Null;
    records::GMMSubState gmmSub = records::GMMSubState::NullSubState;
    records::UpdateStatus gmmStatus = records::UpdateStatus::NotUpdated;
    records::RRState rr = records::RRState::Inactive;
    records::RRCState rrc = records::RRCState::Disconnected;

    DriveIdentities identities;
    bool registered = false;
    CellArea registeredArea{{1, 1}, 4101, 1}; ///< its last registration
    Radio registeredRadio = Radio::Off;       ///< the radio of that registration
    int contexts = 0;                         ///< active packet-data contexts

    /// The area of the cell that it camps on; that of its last registration where it camps on none.
    [[nodiscard]] CellArea area() const {
        if (radio == Radio::GSM && gsm.cell)
            return gsm.cell->area;
        if (radio == Radio::UMTS && umts.cell)
            return umts.cell->area;
        return registeredArea;
    }
};

} // namespace velmora
