// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/C2K/C2KScenario.h"

#include "Platform/TelephonyService.h"
#include "Telephony/Drives/C2K/C2KTruth.h"

namespace velmora {

using namespace records;

namespace {

constexpr double reselectionMargin_dB = 3;
constexpr double reselectionTime_s = 2;

} // namespace

/// The round.
const DriveScenario::Phase C2KScenario::phases[] = {
    {20, &C2KScenario::powerOn},    // and the session's negotiation
    {30, nullptr},                  // idle on both
    {50, &C2KScenario::connect},    // EV-DO
    {15, &C2KScenario::disconnect}, // idle
    {45, &C2KScenario::startCall},  // 1x
    {25, &C2KScenario::endCall},    // idle, EV-DO after a while
    {30, &C2KScenario::connect},    // EV-DO
    {15, &C2KScenario::disconnect}, // idle
    {6, &C2KScenario::powerOff},    // until the next round
};

const DriveScenario::Phase C2KScenario::incidents[] = {
    {20, &C2KScenario::powerOn},    {12, &C2KScenario::connect}, {15, &C2KScenario::stall},
    {15, &C2KScenario::flow},       {6, &C2KScenario::stall}, // too short for an event
    {10, &C2KScenario::flow},       {25, &C2KScenario::stall},   {10, &C2KScenario::flow},
    {10, &C2KScenario::disconnect}, {6, &C2KScenario::powerOff},
};

C2KScenario::C2KScenario(std::uint64_t seed)
    : DriveScenario(seed ^ 0xC2C2, phases), _network(seed), _context{_phone, _network, random()} {}

void C2KScenario::addIncidents() {
    setRound(incidents);
}

std::string_view C2KScenario::technology() const {
    return kVoxLogChannelTechnology_Ostrel_CDMA;
}

void C2KScenario::powerOn() {
    add1xStep(0.5, OneXState::PowerUp);
    add1xStep(1.2, OneXState::Initial);
    addStep(2.0, [this] {
        _phone.oneX = OneXState::Acquisition;
        return systemReport(_context);
    });
    add1xStep(3.5, OneXState::Sync);
    addStep(4.6, [this] {
        if (!_network.pilots().empty())
            _phone.serving = _network.pilots().front();
        _phone.oneX = OneXState::Paging;
        return systemReport(_context);
    });
    addEVDOStep(6, EVDOState::Acquisition);
    addEVDOStep(7.5, EVDOState::Sync);
    addEVDOStep(8.4, EVDOState::Idle);
    addSessionStep(9, EVDOSession::AMPSetup);
    addStep(10.2, [this] {
        _phone.session = EVDOSession::ATInitiated;
        _phone.uati = random().between(0, 0xFFFFFF);
        return evdoStatusReport(_context);
    });
    addSessionStep(11.5, EVDOSession::Initiated);
    addSessionStep(13, EVDOSession::Open);
}

void C2KScenario::connect() {
    addEVDOStep(0.3, EVDOState::Access);
    addEVDOStep(1.5, EVDOState::Connected);
}

void C2KScenario::disconnect() {
    addEVDOStep(0.3, EVDOState::Idle);
}

void C2KScenario::startCall() {
    addEVDOStep(0.2, EVDOState::Inactive);
    add1xStep(0.4, OneXState::Paging);
    add1xStep(2.5, OneXState::Traffic);
}

void C2KScenario::endCall() {
    add1xStep(0.3, OneXState::Paging);
    addEVDOReturn(3);
}

void C2KScenario::powerOff() {
    addSessionStep(0.3, EVDOSession::Closed);
    addEVDOStep(0.5, EVDOState::Inactive);
    addStep(0.9, [this] {
        _phone.oneX = OneXState::Inactive;
        _phone.serving.reset();
        return oneXStatusReport(_context);
    });
}

void C2KScenario::add1xStep(double delay, OneXState state) {
    addStep(delay, [this, state] {
        _phone.oneX = state;
        return oneXStatusReport(_context);
    });
}

void C2KScenario::addEVDOStep(double delay, EVDOState state) {
    addStep(delay, [this, state] {
        _phone.evdo = state;
        return evdoStatusReport(_context);
    });
}

void C2KScenario::addSessionStep(double delay, EVDOSession session) {
    addStep(delay, [this, session] {
        _phone.session = session;
        return evdoStatusReport(_context);
    });
}

void C2KScenario::addEVDOReturn(double delay) {
    addEVDOStep(delay, EVDOState::Acquisition);
    addEVDOStep(delay + 1.5, EVDOState::Sync);
    addEVDOStep(delay + 2.5, EVDOState::Idle);
}

void C2KScenario::drive(double seconds) {
    _network.drive(seconds);
    if (!_phone.serving)
        return;
    for (const C2KPilot& pilot : _network.pilots())
        if (pilot.sector.sid == _phone.serving->sector.sid &&
            pilot.sector.pnOffset == _phone.serving->sector.pnOffset) {
            _phone.serving = pilot;
            return;
        }
    // It has gone below the receiver's sensitivity.
    _phone.serving = C2KPilot{_phone.serving->sector};
}

void C2KScenario::react() {
    const bool better =
        _phone.serving && !_network.pilots().empty() &&
        _network.pilots().front().level_dBm >= _phone.serving->level_dBm + reselectionMargin_dB;
    if (timeToReselect(better, reselectionTime_s)) {
        _phone.serving = _network.pilots().front();
        addStep(0.1, [this] { return systemReport(_context); });
    }
}

void C2KScenario::addReports(DriveScript& due) {
    schedule(c2kReports(), _context, 0.037, due);
}

UnusualMessageParts C2KScenario::unusualMessageParts(std::size_t number) {
    return c2kUnusualMessageParts(_context, number / allUnusualMessages.size());
}

std::unique_ptr<DriveTruth> C2KScenario::makeTruth(TruthSink& sink) const {
    return std::make_unique<C2KTruth>(_context, sink);
}

} // namespace velmora
