// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/Modem/ModemTruth.h"

#include "LogMessages/LiveModem.h"

#include <algorithm>
#include <set>
#include <string>
#include <utility>
#include <vector>

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
    if (_cell.update(at, serving(code)))
        _conditions.changeCell(at);
    const bool isRegistrationStated = code == LiveModemCode::registration;
    if (_phone.isPresent())
        _registration.update(at, nameOf(_phone.registration), isRegistrationStated);
    _limited.update(at, _phone.registration == Registration::Denied, isRegistrationStated);
    _searching.update(at, _phone.registration == Registration::Searching, isRegistrationStated);
    if (_phone.isPresent() && !_phone.isLocked && !_phone.isSIMMissing)
        _sim.update(at, std::to_string(_phone.slot), code == LiveModemCode::sim);
    followMeasurements(at, code);
    if (code == LiveModemCode::traffic)
        followTraffic(at);
    if (sent) {
        _conditions.confirm(at);
        _stall.confirm(at);
    }
    if (code == LiveModemCode::contexts)
        followContexts(at);
}

void ModemTruth::followMeasurements(TruthTime at, std::uint32_t code) {
    const bool isMeasured = _phone.cellReport == ModemCellReport::Reported && !_phone.isPlaceOnly;
    // What a message does not name is not there any more.
    if (!_phone.serving || (code == LiveModemCode::cells && !isMeasured))
        _conditions.changeCell(at);
    if (!_phone.serving || code != LiveModemCode::cells || !isMeasured)
        return;
    const ModemCell& cell = *_phone.serving;
    _conditions.measureLevel(at, nameOf(cell.radio), cell.level_dBm);
    if (cell.radio == ModemCell::Radio::GSM)
        _conditions.measureNoQuality(at);
    else
        _conditions.measureQuality(at, nameOf(cell.radio), cell.quality_dB);
    followNeighbours(at);
}

void ModemTruth::followNeighbours(TruthTime at) {
    if (_phone.radio == ModemCell::Radio::GSM) {
        _conditions.compareNoNeighbours();
        return;
    }
    _conditions.compareServing(at, _phone.serving->level_dBm);
    if (_phone.neighborReport != ModemCellReport::Reported) {
        _conditions.compareNeighbours(at, {}, false);
        return;
    }
    const std::size_t reported = _phone.radio == ModemCell::Radio::UMTS ? 6 : 5;
    std::vector<double> neighbours;
    for (const ModemCell& each : cellsOf(_network, _phone.radio, _phone.carrier))
        if (!each.isSameCellAs(*_phone.serving) && each.channel == _phone.serving->channel &&
            neighbours.size() < reported)
            neighbours.push_back(each.level_dBm);
    const bool hasAny = cellsOf(_network, _phone.radio, _phone.carrier).size() > 1;
    _conditions.compareNeighbours(at, std::move(neighbours), hasAny);
}

void ModemTruth::followTraffic(TruthTime at) {
    std::vector<Counters> counters;
    bool isStalled = false;
    bool isUnknown = false;
    for (const ModemBearer& each : _phone.bearers) {
        if (!_phone.isPresent() || !each.isConnected || !each.last)
            continue;
        const ModemBearer::Answer& now = *each.last;
        counters.push_back({each.number, each.start_s, now});
        const auto known = std::find_if(_counters.begin(), _counters.end(), [&each](const Counters& other) {
            return other.number == each.number && other.start_s == each.start_s;
        });
        // Two answers in a row have no rate.
        if (known == _counters.end() || known->answer.at_s == now.at_s)
            isUnknown = true;
        else
            isStalled =
                isStalled || (now.received == known->answer.received && now.sent > known->answer.sent);
    }
    _counters = std::move(counters);
    if (!isStalled && (isUnknown || _counters.empty()))
        _stall.lose(at);
    else
        _stall.measure(at, isStalled, !isStalled);
}

void ModemTruth::followContexts(TruthTime at) {
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
    _stall.finish();
    _conditions.finish();
    _limited.finish();
    _searching.finish();
}

} // namespace velmora
