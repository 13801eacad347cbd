// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/GSM/GSMProcedures.h"

namespace velmora {

using namespace records;

void GSMProcedures::powerOn(double now) {
    const CellArea lastArea = _phone.registeredArea; // the SIM remembers it
    restart(_phone);
    _phone.registeredArea = lastArea;
    _phone.radio = GSMPhone::Radio::Searching;
    addRegistrationStep(now + 0.1, RegistrationState::Inactive);
    addMMStep(now + 0.2, MMState::Null, MMSubState::Null);
    addGMMStep(now + 0.3, GMMState::Null, GMMSubState::NullSubState);
    addContextsStep(now + 0.4, 0);
    addRegistrationStep(now + 0.8, RegistrationState::AutomaticSearch);
    addRRStep(now + 0.9, RRState::PLMNListConstruction);
    addMMStep(now + 1.0, MMState::Idle, MMSubState::PLMNSearch);
    addGMMStep(now + 1.1, GMMState::Deregistered, GMMSubState::PLMNSearch);
    addRRStep(now + 5.0, RRState::CellSelection);
    addRRStep(now + 7.0, RRState::ChooseCell);
    addRRStep(now + 7.6, RRState::EarlyCampedWaitForSI);
    addStep(now + 8.4, [this] { return campOnGSM(); });
    addRRStep(now + 8.7, RRState::Idle);
}

void GSMProcedures::attach(double now) {
    addRegistrationStep(now, RegistrationState::Registering);
    addMMStep(now + 0.1, MMState::Idle, MMSubState::LocationUpdateNeeded);
    addGMMStep(now + 0.2, GMMState::Deregistered, GMMSubState::AttachNeeded);
    addMMStep(now + 0.5, MMState::WaitForRRConnectionLU, MMSubState::AttemptingToUpdate);
    connect(now + 0.6);
    addMMStep(now + 1.7, MMState::LocationUpdateInitiated, MMSubState::AttemptingToUpdate);
    accept(now + 2.9);
    addMMStep(now + 3.0, MMState::WaitForNetworkCommand, MMSubState::NormalService);
    addMMStep(now + 3.4, MMState::Idle, MMSubState::NormalService);
    release(now + 3.5);
    addGMMStep(now + 4.0, GMMState::RegisteredInitiated, GMMSubState::AttemptingToAttach);
    addGMMStep(now + 5.4, GMMState::Registered, GMMSubState::NormalService);
    addRegistrationStep(now + 5.6, RegistrationState::Idle);
}

void GSMProcedures::updateArea(double now) {
    addMMStep(now, MMState::Idle, MMSubState::LocationUpdateNeeded);
    addGMMStep(now + 0.05, GMMState::Registered, GMMSubState::UpdateNeeded);
    addMMStep(now + 0.1, MMState::WaitForRRConnectionLU, MMSubState::AttemptingToUpdate);
    connect(now + 0.2);
    addMMStep(now + 1.2, MMState::LocationUpdateInitiated, MMSubState::AttemptingToUpdate);
    addGMMStep(now + 1.3, GMMState::RoutingAreaUpdateInitiated, GMMSubState::AttemptingToUpdate);
    accept(now + 2.1);
    addMMStep(now + 2.2, MMState::WaitForNetworkCommand, MMSubState::NormalService);
    addGMMStep(now + 2.4, GMMState::Registered, GMMSubState::NormalService);
    addMMStep(now + 2.5, MMState::Idle, MMSubState::NormalService);
    release(now + 2.6);
}

void GSMProcedures::startSession(double now) {
    addStep(now, [this]() -> std::optional<RecordBuilder> {
        _phone.connection = GSMPhone::Connection::PacketSession;
        return std::nullopt;
    });
    if (_phone.radio == GSMPhone::Radio::UMTS) {
        addGMMStep(now + 0.1, GMMState::ServiceRequestInitiated, GMMSubState::NormalService);
        connect(now + 0.2);
        addGMMStep(now + 1.4, GMMState::Registered, GMMSubState::NormalService);
        addContextsStep(now + 2.0, 1);
        addContextsStep(now + 2.8, 2);
    } else {
        addRRStep(now + 0.2, RRState::DataTransfer);
        addContextsStep(now + 1.5, 1);
    }
}

void GSMProcedures::endSession(double now) {
    addContextsStep(now, 0);
    double end = now + 0.5;
    if (_phone.radio == GSMPhone::Radio::UMTS) {
        // The network lets go by degrees.
        addRRCStep(now + 0.5, RRCState::CellFACH);
        addRRCStep(now + 2.0, RRCState::CellPCH);
        addRRCStep(now + 4.0, RRCState::URAPCH);
        end = now + 5.5;
    }
    addStep(end, [this]() -> std::optional<RecordBuilder> {
        _phone.connection = GSMPhone::Connection::None;
        return std::nullopt;
    });
    release(end + 0.1);
}

void GSMProcedures::startCall(double now) {
    addMMStep(now, MMState::WaitForRRConnectionMM, MMSubState::NormalService);
    connect(now + 0.1);
    addMMStep(now + 1.2, MMState::WaitForOutgoingConnection, MMSubState::NormalService);
    addStep(now + 2.0, [this]() -> std::optional<RecordBuilder> {
        _phone.connection = GSMPhone::Connection::Call;
        return std::nullopt;
    });
    addGMMStep(now + 2.1, GMMState::Registered, GMMSubState::Suspended);
    addMMStep(now + 2.3, MMState::ConnectionActive, MMSubState::NormalService);
}

void GSMProcedures::endCall(double now) {
    addMMStep(now, MMState::WaitForNetworkCommand, MMSubState::NormalService);
    addStep(now + 0.5, [this]() -> std::optional<RecordBuilder> {
        _phone.connection = GSMPhone::Connection::None;
        return std::nullopt;
    });
    release(now + 0.6);
    addMMStep(now + 1.2, MMState::Idle, MMSubState::NormalService);
    addGMMStep(now + 1.4, GMMState::Registered, GMMSubState::NormalService);
}

void GSMProcedures::tryReestablishment(double now) {
    addRRStep(now, RRState::CellReestablishment);
    addMMStep(now + 0.1, MMState::WaitForReestablishDecision, MMSubState::NormalService);
    addMMStep(now + 0.4, MMState::WaitForRRConnectionReestablishment, MMSubState::NormalService);
    addRRStep(now + 0.9, RRState::GoingActive);
}

void GSMProcedures::reestablishCall(double now) {
    tryReestablishment(now);
    addDedicatedChannelStep(now + 1.2);
    addMMStep(now + 1.5, MMState::ReestablishmentInitiated, MMSubState::NormalService);
    addRRStep(now + 1.8, RRState::DataTransfer);
    addMMStep(now + 2.3, MMState::ConnectionActive, MMSubState::NormalService);
}

void GSMProcedures::loseCall(double now) {
    tryReestablishment(now);
    addRRStep(now + 5.0, RRState::Idle);
    addStep(now + 5.1, [this]() -> std::optional<RecordBuilder> {
        _phone.connection = GSMPhone::Connection::None;
        return std::nullopt;
    });
    addMMStep(now + 5.4, MMState::Idle, MMSubState::NormalService);
    addGMMStep(now + 5.7, GMMState::Registered, GMMSubState::NormalService);
}

void GSMProcedures::handOverToUMTS(double now) {
    addRRStep(now, RRState::GSMToUMTSHandover);
    addStep(now + 0.6, [this] { return campOnUMTS(); });
    addRRCStep(now + 0.7, RRCState::CellDCH);
    addStep(now + 0.8, [] { return ciphering(true); });
    addRRStep(now + 0.9, RRState::Inactive);
}

void GSMProcedures::reselectToUMTS(double now) {
    addRRStep(now, RRState::GSMToUMTSReselection);
    addStep(now + 1.0, [this] { return campOnUMTS(); });
    addRRStep(now + 1.1, RRState::Inactive);
    addRRCStep(now + 1.2, RRCState::Disconnected);
}

void GSMProcedures::reselectToGSM(double now) {
    addRRStep(now, RRState::UMTSToGSMReselection);
    addStep(now + 1.0, [this] { return campOnGSM(); });
    addRRStep(now + 1.2, RRState::Idle);
}

void GSMProcedures::reselectWithinGSM(double now, const GSMMeasurement& better) {
    const auto move = [this, better] {
        _phone.gsm = better;
        return gsmServingCell(*better.cell);
    };
    if (_phone.connection == GSMPhone::Connection::Call) {
        addStep(now, move); // a handover: the call stays, the channel changes
        addDedicatedChannelStep(now + 0.1);
        return;
    }
    addRRStep(now, RRState::CellReselection);
    addStep(now + 0.3, move);
    const bool data = _phone.connection == GSMPhone::Connection::PacketSession;
    addRRStep(now + 0.5, data ? RRState::DataTransfer : RRState::Idle);
}

void GSMProcedures::reselectWithinUMTS(double now, const UMTSMeasurement& better) {
    addStep(now, [this, better] {
        _phone.umts = better;
        return umtsServingCell(*better.cell, 1);
    });
}

void GSMProcedures::powerOff(double now) {
    addRegistrationStep(now, RegistrationState::Deregistering);
    addMMStep(now + 0.1, MMState::WaitForRRConnectionIMSIDetach, MMSubState::NormalService);
    connect(now + 0.2);
    addMMStep(now + 1.2, MMState::IMSIDetachInitiated, MMSubState::NormalService);
    addGMMStep(now + 1.4, GMMState::DeregisteredInitiated, GMMSubState::IMSIDetachInitiated);
    release(now + 2.0);
    addMMStep(now + 2.6, MMState::Null, MMSubState::Null);
    addGMMStep(now + 2.7, GMMState::Null, GMMSubState::NullSubState);
    addRRStep(now + 2.8, RRState::Inactive);
    addStep(now + 3.0, [this] {
        _phone.radio = GSMPhone::Radio::Off;
        _phone.gsm = {};
        _phone.umts = {};
        _phone.registered = false;
        _phone.registration = RegistrationState::Offline;
        return registrationState(RegistrationState::Offline);
    });
}

} // namespace velmora
