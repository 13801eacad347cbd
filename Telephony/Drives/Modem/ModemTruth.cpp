// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/Modem/ModemTruth.h"

#include "LogMessages/LiveModem.h"

#include <set>
#include <string>

namespace velmora {
namespace {

using MM::Registration;

std::string_view nameOf(Registration state) {
    switch (state) {
    case Registration::Idle: return "idle";
    case Registration::Home: return "registered, home";
    case Registration::Searching: return "searching";
    case Registration::Denied: return "denied";
    case Registration::Roaming: return "registered, roaming";
    }
    return "";
}

std::string_view nameOf(ModemCell::Radio radio) {
    switch (radio) {
    case ModemCell::Radio::GSM: return "GSM";
    case ModemCell::Radio::UMTS: return "UMTS";
    case ModemCell::Radio::LTE: return "LTE";
    case ModemCell::Radio::NR: return "NR";
    }
    return "";
}

} // namespace

void ModemTruth::follow(TruthTime at, std::optional<std::uint32_t> sent) {
    const std::uint32_t code = sent.value_or(0);
    _cell.update(at, serving(code));
    const bool isRegistrationStated = code == LiveModemCode::registration;
    if (_phone.isPresent())
        _registration.update(at, nameOf(_phone.registration), isRegistrationStated);
    _limited.update(at, _phone.registration == Registration::Denied, isRegistrationStated);
    _searching.update(at, _phone.registration == Registration::Searching, isRegistrationStated);
    if (_phone.isPresent() && !_phone.isLocked && !_phone.isSIMMissing)
        _sim.update(at, std::to_string(_phone.slot), code == LiveModemCode::sim);
    if (code != LiveModemCode::contexts)
        return;
    std::set<int> up;
    for (const ModemBearer& each : _phone.bearers)
        if (each.isConnected)
            up.insert(each.number);
    _contexts.state(at, up);
}

TruthServing ModemTruth::serving(std::uint32_t code) const {
    TruthServing serving;
    serving.mode = serving.shown = TruthMode::Unknown;
    serving.isStated = code == LiveModemCode::cells;
    if (!_phone.serving)
        return serving;
    const ModemCell& cell = *_phone.serving;
    serving.cell = {nameOf(cell.radio), cell.channel, cell.physical, cell.identity};
    serving.isStated &= _phone.cellReport == ModemCellReport::Reported || _phone.isPlaceOnly;
    return serving;
}

void ModemTruth::finish() {
    _limited.finish();
    _searching.finish();
}

} // namespace velmora
