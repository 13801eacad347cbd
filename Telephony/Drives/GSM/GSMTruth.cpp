// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/GSM/GSMTruth.h"

#include "LogMessages/LogMessage.h"
#include "Telephony/Drives/GSM/GSMStateNames.h"

#include <cmath>
#include <string>
#include <utility>

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
    rankedCells = 0x4005,
    blockErrors = 0x4116,
    gmmStates = 0x7130,
    mmStates = 0x7131,
    registrations = 0x7132,
    network = 0x7135,
};

// How many neighbours each message has.
constexpr std::size_t measuredGSM = 6;
constexpr std::size_t rankedUMTS = 8;
constexpr std::size_t listedUMTS = 4; ///< by the telephony service
/// Over which blocks with errors are counted, and how long there have to be few at the end.
constexpr TruthTime errorTime = std::chrono::seconds(5);

template <class State, class SubState>
std::string textOf(State state, SubState subState) {
    return std::string(nameOf(state)).append(", ").append(nameOf(subState));
}

TruthCell truthOf(const GSMCell& cell) {
    return {"GSM", cell.arfcn, cell.bsic, cell.cellId};
}

TruthCell truthOf(const UMTSCell& cell) {
    return {"UMTS", cell.uarfcn, cell.scramblingCode, cell.cellId};
}

/// The level as the active set's record has it: the carrier's power and the share of the cell in it, each in
/// whole decibels, rounded down.
double recordedLevel_dBm(double received_dBm, double ecno_dB) {
    const double tenths = std::round((received_dBm + 106) * 10);
    return std::trunc(tenths / 10) - 106 + std::ceil(ecno_dB) - 1;
}

} // namespace

GSMTruth::GSMTruth(const GSMReportContext& context, TruthSink& sink)
    : DriveTruth(sink), _context(context), _phone(context.phone), _cell(sink), _reselections(sink),
      _rr(sink, "radio-state", "RR"), _rrc(sink, "radio-state", "RRC"), _mm(sink, "mobility-state", "MM"),
      _gmm(sink, "mobility-state", "GMM"), _registration(sink, "registration-state", "registration"),
      _limited(sink, "limited-service"), _contexts(sink), _conditions(sink),
      _errors(sink, "block-error-burst", TruthTime(0), errorTime) {}

void GSMTruth::follow(TruthTime at, std::optional<std::uint32_t> sent) {
    const std::uint32_t code = sent.value_or(0);
    followMobility(at);
    followCall(at);
    followStates(at, code);
    if (const std::optional<TruthMove> move = _cell.update(at, serving(code))) {
        _reselections.move(at, *move);
        _conditions.changeCell(at);
    }
    followMeasurements(at, code);
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
    _lastMM = _phone.mm;
    _lastGMM = _phone.gmm;
}

GSMTruth::Call GSMTruth::call() const {
    switch (_phone.mm) {
    case MMState::ReestablishmentInitiated:
    case MMState::WaitForRRConnectionReestablishment:
    case MMState::WaitForReestablishDecision: return Call::Reestablishing;
    case MMState::ConnectionActive: break;
    default: return _phone.rr == RRState::CellReestablishment ? Call::Reestablishing : Call::None;
    }
    return _phone.rr == RRState::CellReestablishment ? Call::Reestablishing : Call::Active;
}

void GSMTruth::followCall(TruthTime at) {
    const Call before = std::exchange(_lastCall, call());
    if (before == _lastCall)
        return;
    const std::string state(nameOf(_phone.mm));
    if (_lastCall == Call::Reestablishing)
        tell(at, "re-establishment", "state", state);
    else if (_lastCall == Call::None)
        tell(at, before == Call::Reestablishing ? "call-lost" : "call-end", "state", state);
    else if (before == Call::None)
        tell(at, "call-setup", "state", state);
}

void GSMTruth::followMeasurements(TruthTime at, std::uint32_t code) {
    if (!_phone.gsm.cell && !_phone.umts.cell) {
        _conditions.lose(at);
        _reselections.forget();
    }
    followGSM(at, code);
    followUMTS(at, code);
    if (!_blocks.empty() && at - _blocks.back().at >= errorTime)
        _errors.measure(at, false, true); // no block has come wrong since
    if (code == blockErrors)
        followErrors(at);
    if (code != 0) {
        _conditions.confirm(at);
        _reselections.confirm(at);
        _errors.confirm(at);
    }
}

void GSMTruth::followGSM(TruthTime at, std::uint32_t code) {
    if (!_phone.gsm.cell)
        return;
    if (code == gsmLevels || code == gsmCell) {
        _conditions.measureNoQuality(at);
        _conditions.compareNoNeighbours();
    }
    if (code == gsmLevels) {
        _conditions.measureLevel(at, "GSM", _phone.gsm.rssi_dBm);
        _reselections.measureServing(at, _phone.gsm.rssi_dBm);
    }
    if (code != gsmLevels && code != ExtraCode::cellInformation)
        return;
    std::vector<TruthLevel> neighbours;
    for (const GSMMeasurement& each : _context.network.gsm())
        if (each.cell != _phone.gsm.cell && neighbours.size() < measuredGSM)
            // The telephony service has steps of two decibels, rounded upwards.
            neighbours.push_back(
                {truthOf(*each.cell), code == gsmLevels ? each.rssi_dBm * 1.0 : each.rssi_dBm / 2 * 2.0});
    _reselections.measureNeighbours(at, std::move(neighbours));
}

void GSMTruth::followUMTS(TruthTime at, std::uint32_t code) {
    if (code == activeSet && _phone.umts.cell) {
        _conditions.measureLevel(at, "UMTS", _phone.umts.rscp_dBm);
        // The record has an energy, which reads as whole decibels, rounded down.
        _conditions.measureQuality(at, "UMTS", std::ceil(_phone.umts.ecno_dB) - 1);
        const double level = recordedLevel_dBm(_context.network.umtsRSSI_dBm(), _phone.umts.ecno_dB);
        _conditions.compareServing(at, level);
        _reselections.measureServing(at, level);
    }
    // The ranked list of one technology empties that of the other.
    if (code == rankedCells)
        compareUMTS(at, _context.isRankedUMTS ? rankedUMTS : 0);
    else if (code == ExtraCode::cellInformation)
        compareUMTS(at, listedUMTS);
}

void GSMTruth::compareUMTS(TruthTime at, std::size_t limit) {
    if (_phone.gsm.cell)
        return;
    std::vector<TruthLevel> neighbours;
    std::vector<double> levels;
    std::size_t all = 0;
    for (const UMTSMeasurement& each : _context.network.umts()) {
        if (each.cell == _phone.umts.cell || all == limit)
            continue;
        ++all;
        if (!_phone.umts.cell || each.cell->uarfcn != _phone.umts.cell->uarfcn)
            continue;
        neighbours.push_back({truthOf(*each.cell), static_cast<double>(each.rscp_dBm)});
        levels.push_back(each.rscp_dBm);
    }
    _reselections.measureNeighbours(at, std::move(neighbours));
    _conditions.compareNeighbours(at, std::move(levels), all > 0);
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
        serving.cell = truthOf(*_phone.gsm.cell);
        serving.isStated |= code == gsmCell;
    } else if (_phone.radio == Radio::UMTS && _phone.umts.cell) {
        serving.cell = truthOf(*_phone.umts.cell);
        serving.isStated |= code == umtsCell || code == activeSet;
    } else {
        // RR inactive, and a registration that is offline or searches.
        serving.isStated |= code == rrStates || code == registrations;
    }
    return serving;
}

} // namespace velmora
