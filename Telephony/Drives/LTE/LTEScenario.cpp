// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/LTE/LTEScenario.h"

#include "Platform/TelephonyService.h"
#include "Telephony/Drives/LTE/LTETruth.h"
#include "Telephony/Drives/ServingMeasurement.h"

#include <algorithm>

namespace velmora {

namespace {

constexpr double reselectionMargin_dB = 4;
constexpr double reselectionTime_s = 2;

/// How much of a new measurement goes into the average.
constexpr double averaging = 0.3;

} // namespace

/// The round.
const DriveScenario::Phase LTEScenario::phases[] = {
    {5, &LTEScenario::powerOn},
    {5, &LTEScenario::registerWithNetwork},
    {18, nullptr}, // idle
    {25, &LTEScenario::startSession},
    {3, &LTEScenario::endSession},
    {10, &LTEScenario::changeCarrier},
    {5, &LTEScenario::connectBriefly},
    {10, &LTEScenario::changeCarrier},
    {5, &LTEScenario::connectBriefly},
    {10, &LTEScenario::changeCarrier},
    {5, &LTEScenario::connectBriefly},
    {10, &LTEScenario::changeCarrier},
    {5, &LTEScenario::connectBriefly},
    {10, &LTEScenario::changeCarrier},
    {5, &LTEScenario::connectBriefly},
    {10, &LTEScenario::changeCarrier}, // to the first again
    {5, &LTEScenario::powerOff},
};

const DriveScenario::Phase LTEScenario::incidents[] = {
    {5, &LTEScenario::powerOn},       {5, &LTEScenario::registerWithNetwork},
    {50, &LTEScenario::holdOn},       {10, &LTEScenario::letGo},
    {8, &LTEScenario::reselectEarly}, {8, &LTEScenario::reselectEarly},
    {50, &LTEScenario::holdOn},       {10, &LTEScenario::letGo},
    {8, &LTEScenario::reselectEarly}, {5, &LTEScenario::powerOff},
};

LTEScenario::LTEScenario(std::uint64_t seed)
    : DriveScenario(seed ^ 0x5EED, phases), _network(seed), _context{_phone, _network, random()} {}

void LTEScenario::addIncidents() {
    setRound(incidents);
}

std::string_view LTEScenario::technology() const {
    return kVoxLogChannelTechnology_Ostrel_LTE;
}

std::optional<RecordBuilder> LTEScenario::camp() {
    if (_network.cells(_phone.carrier).empty())
        return std::nullopt;
    return campOn(_network.cells(_phone.carrier).front());
}

std::optional<RecordBuilder> LTEScenario::campOn(const LTEMeasurement& cell) {
    _phone.radio = LTEPhone::Radio::Camped;
    _phone.serving = cell;
    _phone.average = *_phone.serving;
    _phone.cyclesBelow = 0;
    return lteReports::servingCell(_context);
}

void LTEScenario::addConnectedStep(double delay, bool connected) {
    addStep(delay, [this, connected] {
        _phone.connected = connected && _phone.serving;
        return lteReports::antennas(_context);
    });
}

void LTEScenario::addContextsStep(double delay, int count) {
    addStep(delay, [this, count] {
        _phone.contexts = count;
        return lteReports::contexts(_context);
    });
}

void LTEScenario::powerOn() {
    const CellArea lastArea = _phone.registeredArea; // the SIM remembers it
    restart(_phone);
    _phone.registeredArea = lastArea;
    _phone.radio = LTEPhone::Radio::Searching;
    addContextsStep(0.2, 0);
    addStep(0.5, [this] { return lteReports::sim(_context); });
    addStep(4, [this] { return camp(); });
    addStep(4.1, [this] { return lteReports::antennas(_context); });
}

void LTEScenario::registerWithNetwork() {
    addConnectedStep(0.2, true);
    addStep(2.0, [this] {
        if (_phone.serving)
            _phone.registeredArea = _phone.serving->cell.area;
        return lteReports::sim(_context);
    });
    addContextsStep(2.2, 1); // LTE knows no registration without one
    addConnectedStep(4, false);
}

void LTEScenario::startSession() {
    addConnectedStep(0.2, true);
    addContextsStep(1.0, random().chance(0.5) ? 2 : 1);
}

void LTEScenario::endSession() {
    addContextsStep(0.1, 1);
    addConnectedStep(1, false);
}

void LTEScenario::changeCarrier() {
    // The modem weighs the candidates before it goes.
    addStep(1, [this] { return lteReports::candidates(_context); });
    addStep(2, [this] {
        _phone.carrier = (_phone.carrier + 1) % lteCarriers.size();
        return camp();
    });
}

void LTEScenario::connectBriefly() {
    addConnectedStep(0.2, true);
    addConnectedStep(4, false);
}

void LTEScenario::updateArea() {
    const bool registered = _phone.contexts > 0;
    if (!registered || !_phone.serving || !script().empty() ||
        _phone.serving->cell.area == _phone.registeredArea)
        return;
    if (!_phone.connected) {
        addConnectedStep(0.1, true);
        addConnectedStep(2, false);
    }
    addStep(1, [this] {
        _phone.registeredArea = _phone.serving->cell.area;
        return lteReports::sim(_context);
    });
}

void LTEScenario::powerOff() {
    addConnectedStep(0.1, true);
    addContextsStep(1, 0);
    addStep(1.5, [this]() -> std::optional<RecordBuilder> {
        _phone.connected = false;
        _phone.radio = LTEPhone::Radio::Off;
        _phone.serving.reset();
        return std::nullopt;
    });
}

void LTEScenario::reselectEarly() {
    constexpr double margin_dB = 4;
    for (const LTEMeasurement& each : _network.cells(_phone.carrier))
        if (_phone.serving && each.rsrp_dBm <= _phone.serving->rsrp_dBm - margin_dB) {
            addStep(0, [this, each] { return campOn(each); });
            return;
        }
}

void LTEScenario::drive(double seconds) {
    _network.drive(seconds);
    if (!_phone.serving)
        return;
    _phone.serving = updatedMeasurement(*_phone.serving, _network.cells(_phone.carrier));
    _phone.average.rsrp_dBm += averaging * (_phone.serving->rsrp_dBm - _phone.average.rsrp_dBm);
    _phone.average.rsrq_dB += averaging * (_phone.serving->rsrq_dB - _phone.average.rsrq_dB);
    _phone.cyclesBelow =
        records::selectionLevel_dB(*_phone.serving) < 0 ? std::min(_phone.cyclesBelow + 1, 63) : 0;
}

void LTEScenario::react() {
    const auto& cells = _network.cells(_phone.carrier);
    const bool better = _phone.serving && !cells.empty() &&
                        cells.front().rsrp_dBm >= _phone.serving->rsrp_dBm + reselectionMargin_dB;
    if (timeToReselect(better && !_isHoldingOn, reselectionTime_s))
        addStep(0, [this] { return camp(); });
    updateArea();
}

void LTEScenario::addReports(DriveScript& due) {
    schedule(reportsOf(_phone), _context, 0.137, due);
}

UnusualMessageParts LTEScenario::unusualMessageParts(std::size_t number) {
    // Which records are damaged changes from round to round of the kinds of damage.
    const std::size_t round = number / allUnusualMessages.size();
    const LTEMeasurement serving = _phone.serving.value_or(LTEMeasurement{});
    RecordBuilder tooShort = records::lteServingCell(serving.cell);
    switch (round % 5) {
    case 1: tooShort = records::lteIdleMeasurement({serving, serving}); break;
    case 2: tooShort = records::lteIntraFrequency(serving, 0, {}, {}); break;
    case 3: tooShort = records::lteNeighbours(lteCarriers[0], {{serving, serving}}).cutTo(21); break;
    case 4: tooShort = records::reselectionCandidates(serving.cell, {}); break;
    default: break;
    }
    tooShort.cutTo(tooShort.size() - 1);

    std::optional<RecordBuilder> overrun;
    switch (round % 3) {
    case 0: // two detected cells more than there are
        overrun = records::lteIntraFrequency(serving, 0, {serving}, {serving}).u8(28, 3);
        break;
    case 1: // two neighbours, of which the second is cut
        overrun =
            records::lteNeighbours(lteCarriers[_phone.carrier], {{serving, serving}, {serving, serving}});
        overrun->cutTo(60);
        break;
    default: // three candidates, of which one is there
        overrun = records::reselectionCandidates(serving.cell, {{records::RATType::UTRAN, 2, 10588, 300}});
        overrun->u16(19, 3).cutTo(29);
        break;
    }
    return {records::lteServingCell(serving.cell), tooShort, overrun, static_cast<std::int64_t>(number)};
}

std::unique_ptr<DriveTruth> LTEScenario::makeTruth(TruthSink& sink) const {
    return std::make_unique<LTETruth>(_context, sink);
}

} // namespace velmora
