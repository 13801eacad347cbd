// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/GSM/GSMTruth.h"

#include "LogMessages/LogMessage.h"
#include "Telephony/Drives/GSM/GSMStateNames.h"

#include <string>

namespace velmora {
namespace {

using namespace records;
using Radio = GSMPhone::Radio;

/// The codes of GSMCellRecords.h, UMTSRecords.h and RegistrationRecords.h whose records state the phone.
enum Code : std::uint32_t {
    gsmCell = 0x5134,
    rrStates = 0x512C,
    umtsCell = 0x4127,
    rrcStates = 0x4125,
    activeSet = 0x417A,
    gmmStates = 0x7130,
    mmStates = 0x7131,
    registrations = 0x7132,
    network = 0x7135,
};

template <class State, class SubState>
std::string textOf(State state, SubState subState) {
    return std::string(nameOf(state)).append(", ").append(nameOf(subState));
}

} // namespace

GSMTruth::GSMTruth(const GSMPhone& phone, TruthSink& sink)
    : DriveTruth(sink), _phone(phone), _cell(sink), _rr(sink, "radio-state", "RR"),
      _rrc(sink, "radio-state", "RRC"), _mm(sink, "mobility-state", "MM"),
      _gmm(sink, "mobility-state", "GMM"), _registration(sink, "registration-state", "registration"),
      _limited(sink, "limited-service"), _contexts(sink) {}

void GSMTruth::follow(TruthTime at, std::optional<std::uint32_t> sent) {
    const std::uint32_t code = sent.value_or(0);
    followMobility(at);
    followStates(at, code);
    _cell.update(at, serving(code));
    _limited.update(at, !_phone.registered, code == network);
    if (code == ExtraCode::packetDataContexts)
        _contexts.state(at, _phone.contexts);
}

void GSMTruth::followStates(TruthTime at, std::uint32_t code) {
    _rr.update(at, nameOf(_phone.rr), code == rrStates);
    _rrc.update(at, nameOf(_phone.rrc), code == rrcStates);
    _mm.update(at, textOf(_phone.mm, _phone.mmSub), code == mmStates);
    _gmm.update(at, textOf(_phone.gmm, _phone.gmmSub), code == gmmStates);
    _registration.update(at, nameOf(_phone.registration), code == registrations);
}

void GSMTruth::followMobility(TruthTime at) {
    // The step that changes one of these states sends the record that states it.
    const auto left = [](auto state, auto& last, auto now) { return last == state && now != state; };
    if (left(MMState::LocationUpdateInitiated, _lastMM, _phone.mm))
        tell(at, "area-update", "type", "location");
    if (left(GMMState::RoutingAreaUpdateInitiated, _lastGMM, _phone.gmm))
        tell(at, "area-update", "type", "routing");
    if (left(MMState::ConnectionActive, _lastMM, _phone.mm))
        tell(at, "call-end", "state", std::string(nameOf(_phone.mm)));
    if (left(MMState::ConnectionActive, _phone.mm, _lastMM))
        tell(at, "call-setup", "state", std::string(nameOf(_phone.mm)));
    _lastMM = _phone.mm;
    _lastGMM = _phone.gmm;
}

TruthServing GSMTruth::serving(std::uint32_t code) const {
    TruthServing serving;
    const bool connected = _phone.connection == GSMPhone::Connection::Call || _phone.rrc == RRCState::CellDCH;
    serving.mode = serving.shown = connected ? TruthMode::Connected : TruthMode::Idle;
    serving.isStated = code == ExtraCode::cellInformation;
    if (_phone.radio == Radio::GSM && _phone.gsm.cell) {
        const GSMCell& cell = *_phone.gsm.cell;
        serving.cell = {"GSM", cell.arfcn, cell.bsic, cell.cellId};
        serving.isStated |= code == gsmCell;
    } else if (_phone.radio == Radio::UMTS && _phone.umts.cell) {
        const UMTSCell& cell = *_phone.umts.cell;
        serving.cell = {"UMTS", cell.uarfcn, cell.scramblingCode, cell.cellId};
        serving.isStated |= code == umtsCell || code == activeSet;
    } else {
        // RR inactive, and a registration that is offline or searches.
        serving.isStated |= code == rrStates || code == registrations;
    }
    return serving;
}

} // namespace velmora
