// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/UTRAN/UTRANScenario.h"

#include "Platform/TelephonyService.h"
#include "Telephony/Drives/ServingMeasurement.h"

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

void UTRANScenario::sayRRC(double delay, RRCState state) {
    say(delay, [this, state] {
        _phone.rrc = state;
        return utranReports::rrc(_context);
    });
}

void UTRANScenario::sayContexts(double delay, int count) {
    say(delay, [this, count] {
        _phone.contexts = count;
        return utranReports::contexts(_context);
    });
}

void UTRANScenario::powerOn() {
    const CellArea lastArea = _phone.registeredArea; // the SIM remembers it
    _phone = UTRANPhone{};
    _phone.registeredArea = lastArea;
    _phone.radio = UTRANPhone::Radio::Searching;
    sayRRC(0.1, RRCState::Disconnected);
    sayContexts(0.2, 0);
    say(5, [this] {
        if (!_network.cells().empty()) {
            _phone.radio = UTRANPhone::Radio::Camped;
            _phone.serving = _network.cells().front();
        }
        return utranReports::serving(_context);
    });
}

void UTRANScenario::registerWithNetwork() {
    sayRRC(0.2, RRCState::Connecting);
    sayRRC(0.6, RRCState::CellDCH);
    say(2.5, [this] {
        _phone.registered = _phone.serving.has_value();
        if (_phone.serving)
            _phone.registeredArea = _phone.serving->cell.area;
        return utranReports::serving(_context);
    });
    say(2.7, [this] { return utranReports::sim(_context); });
    sayRRC(3.5, RRCState::Disconnected);
    say(3.6, [this] { return utranReports::quality(_context); });
}

void UTRANScenario::startSession() {
    ++_sessions;
    sayRRC(0.1, RRCState::Connecting);
    sayRRC(0.5, RRCState::CellFACH);
    sayRRC(2.0, RRCState::CellDCH);
    sayContexts(2.6, _sessions % 2 == 1 ? 1 : 2);
}

void UTRANScenario::endSession() {
    sayContexts(0.1, 0);
    sayRRC(1, RRCState::CellFACH);
    sayRRC(5, RRCState::CellPCH);
    say(5.1, [this] { return utranReports::quality(_context); });
    sayRRC(10, RRCState::URAPCH);
    sayRRC(15, RRCState::Disconnected);
}

void UTRANScenario::startCall() {
    sayRRC(0.1, RRCState::Connecting);
    say(0.7, [this] {
        _phone.call = true;
        _phone.rrc = RRCState::CellDCH;
        return utranReports::rrc(_context);
    });
}

void UTRANScenario::endCall() {
    say(0.3, [this] {
        _phone.call = false;
        _phone.rrc = RRCState::Disconnected;
        return utranReports::rrc(_context);
    });
    say(0.4, [this] { return utranReports::quality(_context); });
}

void UTRANScenario::powerOff() {
    sayRRC(0.1, RRCState::Connecting);
    sayRRC(0.6, RRCState::CellDCH);
    say(2, [this] {
        _phone.rrc = RRCState::Disconnected;
        _phone.radio = UTRANPhone::Radio::Off;
        _phone.serving.reset();
        _phone.registered = false;
        return utranReports::rrc(_context);
    });
    say(2.1, [this] { return utranReports::quality(_context); });
    say(2.2, [] { return records::utranNeighbours({}); });
    say(2.3, [] { return records::utranGSMNeighbours({}); });
}

void UTRANScenario::drive(double seconds) {
    _network.drive(seconds);
    if (_phone.serving)
        _phone.serving = measuredAnew(*_phone.serving, _network.cells());
}

void UTRANScenario::react() {
    const auto& cells = _network.cells();
    const bool better = _phone.serving && !cells.empty() &&
                        cells.front().rscp_dBm >= _phone.serving->rscp_dBm + reselectionMargin_dB;
    if (timeToReselect(better, reselectionTime_s)) {
        _phone.serving = cells.front();
        say(0, [this] { return utranReports::serving(_context); });
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

DamageMaterial UTRANScenario::damageMaterial(std::size_t number) {
    // Which records are spoilt changes from round to round of the kinds of damage.
    const std::size_t round = number / everyDamage.size();
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

} // namespace velmora
