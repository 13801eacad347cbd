// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/IFX/IFXTruth.h"

#include <string>

namespace velmora {
namespace {

using State = IFXPhone::State;

std::string_view nameOf(State state) {
    switch (state) {
    case State::Searching: return "searching";
    case State::Limited: return "limited service";
    case State::Registering: return "registering";
    case State::Idle: return "idle";
    case State::Call: return "call";
    case State::PacketSession: return "packet transfer";
    }
    return "";
}

} // namespace

void IFXTruth::follow(TruthTime at, std::optional<std::uint32_t>) {
    TruthServing serving;
    serving.isStated = true;
    serving.mode = serving.shown = _phone.state == State::Call ? TruthMode::Connected : TruthMode::Idle;
    if (_phone.serving) {
        const GSMCell& cell = *_phone.serving->cell;
        serving.cell = {"GSM", cell.arfcn, cell.bsic, cell.cellId};
    }
    _cell.update(at, serving);
    _registration.update(at, nameOf(_phone.state), true);
    // While it is not registered the area is not shown.
    _area.update(at, std::to_string(_phone.registeredArea.lac), _phone.state >= State::Idle);
    _limited.update(at, _phone.state == State::Limited, true);
    _searching.update(at, _phone.state == State::Searching, true);
    _contexts.state(at, _phone.contexts);
    const bool isCall = _phone.state == State::Call;
    if (isCall != _wasCall)
        tell(at, isCall ? "call-setup" : "call-end", "state", std::string(nameOf(_phone.state)));
    _wasCall = isCall;
}

void IFXTruth::finish() {
    _limited.finish();
    _searching.finish();
}

} // namespace velmora
