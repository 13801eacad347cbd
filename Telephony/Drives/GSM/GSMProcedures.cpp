// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/GSM/GSMProcedures.h"

namespace velmora {

using namespace records;

void GSMProcedures::powerOn(double now) {
    const CellArea lastArea = _phone.registeredArea; // the SIM remembers it
    _phone = GSMPhone{};
    _phone.registeredArea = lastArea;
    _phone.radio = GSMPhone::Radio::Searching;
    sayRegistration(now + 0.1, RegistrationState::Inactive);
    sayMM(now + 0.2, MMState::Null, MMSubState::Null);
    sayGMM(now + 0.3, GMMState::Null, GMMSubState::NullSubState);
    sayContexts(now + 0.4, 0);
    sayRegistration(now + 0.8, RegistrationState::AutomaticSearch);
    sayRR(now + 0.9, RRState::PLMNListConstruction);
    sayMM(now + 1.0, MMState::Idle, MMSubState::PLMNSearch);
    sayGMM(now + 1.1, GMMState::Deregistered, GMMSubState::PLMNSearch);
    sayRR(now + 5.0, RRState::CellSelection);
    sayRR(now + 7.0, RRState::ChooseCell);
    sayRR(now + 7.6, RRState::EarlyCampedWaitForSI);
    say(now + 8.4, [this] { return campOnGSM(); });
    sayRR(now + 8.7, RRState::Idle);
}

void GSMProcedures::attach(double now) {
    sayRegistration(now, RegistrationState::Registering);
    sayMM(now + 0.1, MMState::Idle, MMSubState::LocationUpdateNeeded);
    sayGMM(now + 0.2, GMMState::Deregistered, GMMSubState::AttachNeeded);
    sayMM(now + 0.5, MMState::WaitForRRConnectionLU, MMSubState::AttemptingToUpdate);
    connect(now + 0.6);
    sayMM(now + 1.7, MMState::LocationUpdateInitiated, MMSubState::AttemptingToUpdate);
    accept(now + 2.9);
    sayMM(now + 3.0, MMState::WaitForNetworkCommand, MMSubState::NormalService);
    sayMM(now + 3.4, MMState::Idle, MMSubState::NormalService);
    release(now + 3.5);
    sayGMM(now + 4.0, GMMState::RegisteredInitiated, GMMSubState::AttemptingToAttach);
    sayGMM(now + 5.4, GMMState::Registered, GMMSubState::NormalService);
    sayRegistration(now + 5.6, RegistrationState::Idle);
}

void GSMProcedures::updateArea(double now) {
    sayMM(now, MMState::Idle, MMSubState::LocationUpdateNeeded);
    sayGMM(now + 0.05, GMMState::Registered, GMMSubState::UpdateNeeded);
    sayMM(now + 0.1, MMState::WaitForRRConnectionLU, MMSubState::AttemptingToUpdate);
    connect(now + 0.2);
    sayMM(now + 1.2, MMState::LocationUpdateInitiated, MMSubState::AttemptingToUpdate);
    sayGMM(now + 1.3, GMMState::RoutingAreaUpdateInitiated, GMMSubState::AttemptingToUpdate);
    accept(now + 2.1);
    sayMM(now + 2.2, MMState::WaitForNetworkCommand, MMSubState::NormalService);
    sayGMM(now + 2.4, GMMState::Registered, GMMSubState::NormalService);
    sayMM(now + 2.5, MMState::Idle, MMSubState::NormalService);
    release(now + 2.6);
}

void GSMProcedures::startSession(double now) {
    say(now, [this]() -> std::optional<RecordBuilder> {
        _phone.connection = GSMPhone::Connection::PacketSession;
        return std::nullopt;
    });
    if (_phone.radio == GSMPhone::Radio::UMTS) {
        sayGMM(now + 0.1, GMMState::ServiceRequestInitiated, GMMSubState::NormalService);
        connect(now + 0.2);
        sayGMM(now + 1.4, GMMState::Registered, GMMSubState::NormalService);
        sayContexts(now + 2.0, 1);
        sayContexts(now + 2.8, 2);
    } else {
        sayRR(now + 0.2, RRState::DataTransfer);
        sayContexts(now + 1.5, 1);
    }
}

void GSMProcedures::endSession(double now) {
    sayContexts(now, 0);
    double end = now + 0.5;
    if (_phone.radio == GSMPhone::Radio::UMTS) {
        // The network lets go by degrees.
        sayRRC(now + 0.5, RRCState::CellFACH);
        sayRRC(now + 2.0, RRCState::CellPCH);
        sayRRC(now + 4.0, RRCState::URAPCH);
        end = now + 5.5;
    }
    say(end, [this]() -> std::optional<RecordBuilder> {
        _phone.connection = GSMPhone::Connection::None;
        return std::nullopt;
    });
    release(end + 0.1);
}

void GSMProcedures::startCall(double now) {
    sayMM(now, MMState::WaitForRRConnectionMM, MMSubState::NormalService);
    connect(now + 0.1);
    sayMM(now + 1.2, MMState::WaitForOutgoingConnection, MMSubState::NormalService);
    say(now + 2.0, [this]() -> std::optional<RecordBuilder> {
        _phone.connection = GSMPhone::Connection::Call;
        return std::nullopt;
    });
    sayGMM(now + 2.1, GMMState::Registered, GMMSubState::Suspended);
    sayMM(now + 2.3, MMState::ConnectionActive, MMSubState::NormalService);
}

void GSMProcedures::endCall(double now) {
    sayMM(now, MMState::WaitForNetworkCommand, MMSubState::NormalService);
    say(now + 0.5, [this]() -> std::optional<RecordBuilder> {
        _phone.connection = GSMPhone::Connection::None;
        return std::nullopt;
    });
    release(now + 0.6);
    sayMM(now + 1.2, MMState::Idle, MMSubState::NormalService);
    sayGMM(now + 1.4, GMMState::Registered, GMMSubState::NormalService);
}

void GSMProcedures::handOverToUMTS(double now) {
    sayRR(now, RRState::GSMToUMTSHandover);
    say(now + 0.6, [this] { return campOnUMTS(); });
    sayRRC(now + 0.7, RRCState::CellDCH);
    say(now + 0.8, [] { return ciphering(true); });
    sayRR(now + 0.9, RRState::Inactive);
}

void GSMProcedures::reselectToUMTS(double now) {
    sayRR(now, RRState::GSMToUMTSReselection);
    say(now + 1.0, [this] { return campOnUMTS(); });
    sayRR(now + 1.1, RRState::Inactive);
    sayRRC(now + 1.2, RRCState::Disconnected);
}

void GSMProcedures::reselectToGSM(double now) {
    sayRR(now, RRState::UMTSToGSMReselection);
    say(now + 1.0, [this] { return campOnGSM(); });
    sayRR(now + 1.2, RRState::Idle);
}

void GSMProcedures::reselectWithinGSM(double now, const GSMMeasurement& better) {
    const auto move = [this, better] {
        _phone.gsm = better;
        return gsmServingCell(*better.cell);
    };
    if (_phone.connection == GSMPhone::Connection::Call) {
        say(now, move); // a handover: the call stays, the channel changes
        sayDedicatedChannel(now + 0.1);
        return;
    }
    sayRR(now, RRState::CellReselection);
    say(now + 0.3, move);
    const bool data = _phone.connection == GSMPhone::Connection::PacketSession;
    sayRR(now + 0.5, data ? RRState::DataTransfer : RRState::Idle);
}

void GSMProcedures::reselectWithinUMTS(double now, const UMTSMeasurement& better) {
    say(now, [this, better] {
        _phone.umts = better;
        return umtsServingCell(*better.cell, 1);
    });
}

void GSMProcedures::powerOff(double now) {
    sayRegistration(now, RegistrationState::Deregistering);
    sayMM(now + 0.1, MMState::WaitForRRConnectionIMSIDetach, MMSubState::NormalService);
    connect(now + 0.2);
    sayMM(now + 1.2, MMState::IMSIDetachInitiated, MMSubState::NormalService);
    sayGMM(now + 1.4, GMMState::DeregisteredInitiated, GMMSubState::IMSIDetachInitiated);
    release(now + 2.0);
    sayMM(now + 2.6, MMState::Null, MMSubState::Null);
    sayGMM(now + 2.7, GMMState::Null, GMMSubState::NullSubState);
    sayRR(now + 2.8, RRState::Inactive);
    say(now + 3.0, [this] {
        _phone.radio = GSMPhone::Radio::Off;
        _phone.gsm = {};
        _phone.umts = {};
        _phone.registered = false;
        _phone.registration = RegistrationState::Offline;
        return registrationState(RegistrationState::Offline);
    });
}

} // namespace velmora
