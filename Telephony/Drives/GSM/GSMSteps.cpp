// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/GSM/GSMSteps.h"

#include "Telephony/Drives/ServiceRecords.h"

#include <vector>

namespace velmora {

using namespace records;

namespace {

constexpr int networkOperatingMode = 0; ///< class 1: paging is coordinated

} // namespace

void GSMSteps::addRegistrationStep(double at, RegistrationState state) {
    addStep(at, [this, state] {
        _phone.registration = state;
        return registrationState(state);
    });
}

void GSMSteps::addMMStep(double at, MMState state, MMSubState subState) {
    addStep(at, [this, state, subState] {
        _phone.mm = state;
        _phone.mmSub = subState;
        _phone.mmStatus =
            subState == MMSubState::NormalService ? UpdateStatus::Updated : UpdateStatus::NotUpdated;
        return mmState(state, subState, _phone.mmStatus);
    });
}

void GSMSteps::addGMMStep(double at, GMMState state, GMMSubState subState) {
    addStep(at, [this, state, subState] {
        _phone.gmm = state;
        _phone.gmmSub = subState;
        _phone.gmmStatus =
            subState == GMMSubState::NormalService ? UpdateStatus::Updated : UpdateStatus::NotUpdated;
        return gmmState(state, subState, _phone.gmmStatus);
    });
}

void GSMSteps::addRRStep(double at, RRState state) {
    addStep(at, [this, state] {
        _phone.rr = state;
        return rrState(state, 0, 1, _phone.connection == GSMPhone::Connection::PacketSession);
    });
}

void GSMSteps::addRRCStep(double at, RRCState state) {
    addStep(at, [this, state] {
        _phone.rrc = state;
        return rrcState(state);
    });
}

void GSMSteps::addContextsStep(double at, int count) {
    addStep(at, [this, count] {
        _phone.contexts = count;
        std::vector<DictionaryRef> contexts;
        for (int number = 1; number <= count; ++number)
            contexts.push_back(testContext(number, _phone.identities));
        _binary = !_binary;
        return packetContexts(contexts, _binary);
    });
}

void GSMSteps::addDedicatedChannelStep(double at) {
    addStep(at, [this]() -> std::optional<RecordBuilder> {
        if (!_phone.gsm.cell)
            return std::nullopt;
        return dedicatedChannel(_phone.gsm.cell->arfcn);
    });
}

void GSMSteps::connect(double at) {
    if (_phone.radio == GSMPhone::Radio::UMTS) {
        addRRCStep(at, RRCState::Connecting);
        addRRCStep(at + 0.4, RRCState::CellFACH);
        addRRCStep(at + 0.7, RRCState::CellDCH);
        addStep(at + 0.9, [] { return ciphering(true); });
    } else {
        addRRStep(at, RRState::ConnectionPending);
        addDedicatedChannelStep(at + 0.3);
        addRRStep(at + 0.4, RRState::GoingActive);
        addRRStep(at + 0.7, RRState::DataTransfer);
    }
}

void GSMSteps::release(double at) {
    if (_phone.radio == GSMPhone::Radio::UMTS) {
        addStep(at, [] { return ciphering(false); });
        addRRCStep(at + 0.2, RRCState::Disconnected);
    } else {
        addRRStep(at, RRState::ConnectionRelease);
        addRRStep(at + 0.3, RRState::Idle);
    }
}

void GSMSteps::accept(double at) {
    addStep(at, [this] {
        _phone.registered = true;
        _phone.registeredArea = _phone.area();
        _phone.registeredRadio = _phone.radio;
        return servingNetwork(networkOperatingMode, ServiceType::CSAndPS, _phone.registeredArea);
    });
    // A network names those that count as its own: alone for the smaller one.
    addStep(at + 0.05, [this] {
        const bool home = _phone.registeredArea.plmn.mnc == 1;
        return equivalentNetworks(home ? std::vector<PLMN>{{1, 2}} : std::vector<PLMN>{{1, 1}, {111, 11}});
    });
}

std::optional<RecordBuilder> GSMSteps::campOnGSM() {
    _phone.radio = GSMPhone::Radio::GSM;
    _phone.umts = {};
    _phone.rrc = RRCState::Disconnected;
    if (!_network.gsm().empty())
        _phone.gsm = _network.gsm().front();
    if (!_phone.gsm.cell)
        return std::nullopt;
    return gsmServingCell(*_phone.gsm.cell);
}

std::optional<RecordBuilder> GSMSteps::campOnUMTS() {
    _phone.radio = GSMPhone::Radio::UMTS;
    _phone.gsm = {};
    _phone.rr = RRState::Inactive;
    if (!_network.umts().empty())
        _phone.umts = _network.umts().front();
    if (!_phone.umts.cell)
        return std::nullopt;
    return umtsServingCell(*_phone.umts.cell, 1);
}

} // namespace velmora
