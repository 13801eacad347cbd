// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/UTRAN/UTRANScenario.h"

#include "Platform/TelephonyService.h"
#include "Telephony/Drives/ServingMeasurement.h"
#include "Telephony/Drives/UTRAN/UTRANTruth.h"

#include <algorithm>

namespace velmora {

using records::RRCState;

namespace {

constexpr int reselectionMargin_dB = 5;
constexpr double reselectionTime_s = 3;

} // namespace

/// The round.
const DriveScenario::Phase UTRANScenario::phases[] = {
    {8, &UTRANScenario::powerOn},
    {6, &UTRANScenario::registerWithNetwork},
    {25, nullptr}, // idle
    {40, &UTRANScenario::startSession},
    {18, &UTRANScenario::endSession},
    {10, nullptr},
    {25, &UTRANScenario::startCall},
    {12, &UTRANScenario::endCall},
    {40, &UTRANScenario::startSession},
    {18, &UTRANScenario::endSession},
    {8, &UTRANScenario::powerOff},
};

UTRANScenario::UTRANScenario(std::uint64_t seed)
    : DriveScenario(seed ^ 0x5EED, phases), _network(seed), _context{_phone, _network, random()} {}

std::string_view UTRANScenario::technology() const {
    return kVoxLogChannelTechnology_Ostrel_UTRAN2;
}

void UTRANScenario::addRRCStep(double delay, RRCState state) {
    addStep(delay, [this, state] {
        _phone.rrc = state;
        return utranReports::rrc(_context);
    });
}

void UTRANScenario::addContextsStep(double delay, int count) {
    addStep(delay, [this, count] {
        _phone.contexts = count;
        return utranReports::contexts(_context);
    });
}

void UTRANScenario::powerOn() {
    const CellArea lastArea = _phone.registeredArea; // the SIM remembers it
    restart(_phone);
    _phone.registeredArea = lastArea;
    _phone.radio = UTRANPhone::Radio::Searching;
    addRRCStep(0.1, RRCState::Disconnected);
    addContextsStep(0.2, 0);
    addStep(5, [this] {
        if (!_network.cells().empty()) {
            _phone.radio = UTRANPhone::Radio::Camped;
            _phone.serving = _network.cells().front();
        }
        return utranReports::serving(_context);
    });
}

void UTRANScenario::registerWithNetwork() {
    addRRCStep(0.2, RRCState::Connecting);
    addRRCStep(0.6, RRCState::CellDCH);
    addStep(2.5, [this] {
        _phone.registered = _phone.serving.has_value();
        if (_phone.serving)
            _phone.registeredArea = _phone.serving->cell.area;
        return utranReports::serving(_context);
    });
    addStep(2.7, [this] { return utranReports::sim(_context); });
    addRRCStep(3.5, RRCState::Disconnected);
    addStep(3.6, [this] { return utranReports::quality(_context); });
}

void UTRANScenario::startSession() {
    ++_sessions;
    addRRCStep(0.1, RRCState::Connecting);
    addRRCStep(0.5, RRCState::CellFACH);
    addRRCStep(2.0, RRCState::CellDCH);
    addContextsStep(2.6, _sessions % 2 == 1 ? 1 : 2);
}

void UTRANScenario::endSession() {
    addContextsStep(0.1, 0);
    addRRCStep(1, RRCState::CellFACH);
    addRRCStep(5, RRCState::CellPCH);
    addStep(5.1, [this] { return utranReports::quality(_context); });
    addRRCStep(10, RRCState::URAPCH);
    addRRCStep(15, RRCState::Disconnected);
}

void UTRANScenario::startCall() {
    addRRCStep(0.1, RRCState::Connecting);
    addStep(0.7, [this] {
        _phone.call = true;
        _phone.rrc = RRCState::CellDCH;
        return utranReports::rrc(_context);
    });
}

void UTRANScenario::endCall() {
    addStep(0.3, [this] {
        _phone.call = false;
        _phone.rrc = RRCState::Disconnected;
        return utranReports::rrc(_context);
    });
    addStep(0.4, [this] { return utranReports::quality(_context); });
}

void UTRANScenario::powerOff() {
    addRRCStep(0.1, RRCState::Connecting);
    addRRCStep(0.6, RRCState::CellDCH);
    addStep(2, [this] {
        _phone.rrc = RRCState::Disconnected;
        _phone.radio = UTRANPhone::Radio::Off;
        _phone.serving.reset();
        _phone.registered = false;
        return utranReports::rrc(_context);
    });
    addStep(2.1, [this] { return utranReports::quality(_context); });
    addStep(2.2, [] { return records::utranNeighbours({}); });
    addStep(2.3, [] { return records::utranGSMNeighbours({}); });
}

void UTRANScenario::drive(double seconds) {
    _network.drive(seconds);
    if (_phone.serving)
        _phone.serving = updatedMeasurement(*_phone.serving, _network.cells());
}

void UTRANScenario::react() {
    const auto& cells = _network.cells();
    const bool better = _phone.serving && !cells.empty() &&
                        cells.front().rscp_dBm >= _phone.serving->rscp_dBm + reselectionMargin_dB;
    if (timeToReselect(better, reselectionTime_s)) {
        _phone.serving = cells.front();
        addStep(0, [this] { return utranReports::serving(_context); });
        return;
    }
    // Idle in an area that the network does not know the phone to be in, it registers again.
    if (script().empty() && _phone.registered && _phone.rrc == RRCState::Disconnected && _phone.serving &&
        _phone.serving->cell.area != _phone.registeredArea)
        registerWithNetwork();
}

void UTRANScenario::addReports(DriveScript& due) {
    schedule(reportsOf(_phone), _context, 0.137, due);
}

UnusualMessageParts UTRANScenario::unusualMessageParts(std::size_t number) {
    // Which records are damaged changes from round to round of the kinds of damage.
    const std::size_t round = number / allUnusualMessages.size();
    RecordBuilder tooShort =
        round % 2 == 0 ? records::utranServingCell(_phone.serving ? _phone.serving->cell : UTRANCell{}, false)
                       : records::utranRRCState(_phone.rrc);
    tooShort.cutTo(tooShort.size() - 1);
    // Each record has two entries less than it says; of an empty list there is nothing to cut.
    std::optional<RecordBuilder> overrun;
    switch (round % 3) {
    case 0:
        overrun = utranReports::neighbours(_context);
        overrun->cutTo(std::max<std::size_t>(overrun->size() - 32, 21));
        break;
    case 1:
        overrun = utranReports::gsmNeighbours(_context);
        overrun->cutTo(std::max<std::size_t>(overrun->size() - 16, 17));
        break;
    default:
        // Down to one transport channel: no composite one is left then.
        overrun = records::utranChannelQuality({{1, 0.01}, {2, 0.02}, {3, 0.03}}, {{0, 1, {8}}});
        overrun->cutTo(19);
        break;
    }
    return {*utranReports::rrc(_context), tooShort, overrun, static_cast<std::int64_t>(number)};
}

std::unique_ptr<DriveTruth> UTRANScenario::makeTruth(TruthSink& sink) const {
    return std::make_unique<UTRANTruth>(_context, sink);
}

} // namespace velmora
