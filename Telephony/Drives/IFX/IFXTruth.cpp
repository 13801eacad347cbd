// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/IFX/IFXTruth.h"

#include <algorithm>
#include <cmath>
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
    // Whether a move within the same second as the state's change was before or after it, no message shows.
    const auto modeOf = [](bool isCall) { return isCall ? TruthMode::Connected : TruthMode::Idle; };
    const bool isCall = _phone.state == State::Call;
    serving.mode = modeOf(isCall);
    serving.shown = modeOf(_wasCall);
    if (_phone.serving) {
        const GSMCell& cell = *_phone.serving->cell;
        serving.cell = {"GSM", cell.arfcn, cell.bsic, cell.cellId};
    }
    _cell.update(at, serving);
    followMeasurements(at);
    _registration.update(at, nameOf(_phone.state), true);
    // While it is not registered the area is not shown.
    _area.update(at, std::to_string(_phone.registeredArea.lac), _phone.state >= State::Idle);
    _limited.update(at, _phone.state == State::Limited, true);
    _searching.update(at, _phone.state == State::Searching, true);
    _contexts.state(at, _phone.contexts);
    if (isCall != _wasCall)
        tell(at, isCall ? "call-setup" : "call-end", "state", std::string(nameOf(_phone.state)));
    _wasCall = isCall;
}

void IFXTruth::followMeasurements(TruthTime at) {
    if (_phone.serving)
        _conditions.measureLevel(at, "GSM", _phone.serving->rssi_dBm);
    else
        _conditions.lose(at);
    // RXQUAL goes from 0 to 7 (3GPP TS 45.008 8.2.4).
    const auto quality = std::clamp(std::lround(7 * _phone.loss), 0L, 7L);
    if (_phone.serving && _phone.state == State::Call)
        _conditions.judgeQuality(at, quality >= 6, quality <= 4);
    else
        _conditions.loseQuality(at);
    _conditions.confirm(at);
}

void IFXTruth::finish() {
    _conditions.finish();
    _limited.finish();
    _searching.finish();
}

} // namespace velmora
