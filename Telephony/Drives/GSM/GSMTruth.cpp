// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/GSM/GSMTruth.h"

#include "LogMessages/LogMessage.h"
#include "Telephony/Drives/GSM/GSMStateNames.h"

#include <cmath>
#include <string>

namespace velmora {
namespace {

using namespace records;
using Radio = GSMPhone::Radio;

/// The codes of GSMCellRecords.h, UMTSRecords.h and RegistrationRecords.h whose records state the phone.
enum Code : std::uint32_t {
    gsmCell = 0x5134,
    gsmLevels = 0x5137,
    rrStates = 0x512C,
    umtsCell = 0x4127,
    rrcStates = 0x4125,
    activeSet = 0x417A,
    blockErrors = 0x4116,
    gmmStates = 0x7130,
    mmStates = 0x7131,
    registrations = 0x7132,
    network = 0x7135,
};

constexpr std::size_t reportedNeighbours = 8;
/// Over which blocks with errors are counted, and how long there have to be few at the end.
constexpr TruthTime errorTime = std::chrono::seconds(5);

template <class State, class SubState>
std::string textOf(State state, SubState subState) {
    return std::string(nameOf(state)).append(", ").append(nameOf(subState));
}

} // namespace

GSMTruth::GSMTruth(const GSMReportContext& context, TruthSink& sink)
    : DriveTruth(sink), _context(context), _phone(context.phone), _cell(sink), _rr(sink, "radio-state", "RR"),
      _rrc(sink, "radio-state", "RRC"), _mm(sink, "mobility-state", "MM"),
      _gmm(sink, "mobility-state", "GMM"), _registration(sink, "registration-state", "registration"),
      _limited(sink, "limited-service"), _contexts(sink), _conditions(sink),
      _errors(sink, "block-error-burst", TruthTime(0), errorTime) {}

void GSMTruth::follow(TruthTime at, std::optional<std::uint32_t> sent) {
    const std::uint32_t code = sent.value_or(0);
    followMobility(at);
    followStates(at, code);
    followMeasurements(at, code);
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

void GSMTruth::followMeasurements(TruthTime at, std::uint32_t code) {
    if (!_phone.gsm.cell && !_phone.umts.cell)
        _conditions.lose(at);
    if (_phone.gsm.cell && (code == gsmLevels || code == gsmCell)) {
        _conditions.measureNoQuality(at);
        _conditions.measureNoNeighbours(at);
    }
    if (!_blocks.empty() && at - _blocks.back().at >= errorTime)
        _errors.measure(at, false, true); // no block has come wrong since
    if (code == gsmLevels && _phone.gsm.cell) {
        _conditions.measureLevel(at, "GSM", _phone.gsm.rssi_dBm);
    } else if (code == activeSet && _phone.umts.cell) {
        _conditions.measureLevel(at, "UMTS", _phone.umts.rscp_dBm);
        // The record has an energy, which reads as whole decibels, rounded down.
        _conditions.measureQuality(at, "UMTS", std::ceil(_phone.umts.ecno_dB) - 1);
        _conditions.measureNeighbours(at, _phone.umts.rscp_dBm, umtsNeighbours());
    } else if (code == blockErrors) {
        followErrors(at);
    }
    if (code != 0) {
        _conditions.confirm(at);
        _errors.confirm(at);
    }
}

void GSMTruth::followErrors(TruthTime at) {
    _blocks.push_back({at, _context.crcs, _context.crcErrors});
    while (_blocks.size() > 1 && at - _blocks[1].at >= errorTime)
        _blocks.pop_front();
    if (at - _blocks.front().at < errorTime)
        return;
    const auto all = static_cast<double>(_context.crcs - _blocks.front().all);
    const auto wrong = static_cast<double>(_context.crcErrors - _blocks.front().wrong);
    _errors.measure(at, wrong > 0.2 * all, wrong <= 0.1 * all);
}

std::vector<double> GSMTruth::umtsNeighbours() const {
    std::vector<double> neighbours;
    for (const UMTSMeasurement& each : _context.network.umts())
        if (each.cell != _phone.umts.cell && each.cell->uarfcn == _phone.umts.cell->uarfcn &&
            neighbours.size() < reportedNeighbours)
            neighbours.push_back(each.rscp_dBm);
    return neighbours;
}

void GSMTruth::followUnusual(TruthTime at, UnusualMessage kind, std::size_t number) {
    DriveTruth::followUnusual(at, kind, number);
    // A measurement with a count that is too high is shown with the neighbours that it has.
    if (kind == UnusualMessage::CountOverrun)
        followMeasurements(at, gsmLevels);
}

void GSMTruth::finish() {
    _limited.finish();
    _conditions.finish();
    _errors.finish();
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
