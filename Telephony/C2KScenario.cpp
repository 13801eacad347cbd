#include "Telephony/C2KScenario.h"

#include "Platform/TelephonyService.h"

#include <algorithm>
#include <cmath>
#include <iterator>

namespace velmora {

using namespace records;

namespace {

/// A measurement period of the modem.
constexpr double step_s = 0.48;

constexpr double reselectionMargin_dB = 3;
constexpr double reselectionTime_s = 2;

} // namespace

/// The round: each phase begins with what the phone does, where it does something, and lasts so long.
struct C2KScenario::Phase {
    double duration_s;
    void (C2KScenario::*begin)();
};

const C2KScenario::Phase C2KScenario::phases[] = {
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

C2KScenario::C2KScenario(std::uint64_t seed)
    : _network(seed), _random(seed ^ 0xC2C2), _context{_phone, _network, _random} {}

std::string_view C2KScenario::technology() const {
    return kVoxLogChannelTechnology_Ostrel_CDMA;
}

Time C2KScenario::beginning() {
    using namespace std::chrono;
    return sys_days{year{2026} / January / 5} + hours{8};
}

ScenarioEvent C2KScenario::next() {
    while (_events.empty())
        advance();
    ScenarioEvent event = std::move(_events.front());
    _events.pop_front();
    return event;
}

void C2KScenario::powerOn() {
    say1x(0.5, OneXState::PowerUp);
    say1x(1.2, OneXState::Initial);
    say(2.0, [this] {
        _phone.oneX = OneXState::Acquisition;
        return systemReport(_context);
    });
    say1x(3.5, OneXState::Sync);
    say(4.6, [this] {
        if (!_network.pilots().empty())
            _phone.serving = _network.pilots().front();
        _phone.oneX = OneXState::Paging;
        return systemReport(_context);
    });
    sayEVDO(6, EVDOState::Acquisition);
    sayEVDO(7.5, EVDOState::Sync);
    sayEVDO(8.4, EVDOState::Idle);
    saySession(9, EVDOSession::AMPSetup);
    say(10.2, [this] {
        _phone.session = EVDOSession::ATInitiated;
        _phone.uati = _random.between(0, 0xFFFFFF);
        return evdoStatusReport(_context);
    });
    saySession(11.5, EVDOSession::Initiated);
    saySession(13, EVDOSession::Open);
}

void C2KScenario::connect() {
    sayEVDO(0.3, EVDOState::Access);
    sayEVDO(1.5, EVDOState::Connected);
}

void C2KScenario::disconnect() {
    sayEVDO(0.3, EVDOState::Idle);
}

void C2KScenario::startCall() {
    sayEVDO(0.2, EVDOState::Inactive);
    say1x(0.4, OneXState::Paging);
    say1x(2.5, OneXState::Traffic);
}

void C2KScenario::endCall() {
    say1x(0.3, OneXState::Paging);
    sayEVDOReturn(3);
}

void C2KScenario::powerOff() {
    saySession(0.3, EVDOSession::Closed);
    sayEVDO(0.5, EVDOState::Inactive);
    say(0.9, [this] {
        _phone.oneX = OneXState::Inactive;
        _phone.serving.reset();
        return oneXStatusReport(_context);
    });
}

void C2KScenario::say1x(double delay, OneXState state) {
    say(delay, [this, state] {
        _phone.oneX = state;
        return oneXStatusReport(_context);
    });
}

void C2KScenario::sayEVDO(double delay, EVDOState state) {
    say(delay, [this, state] {
        _phone.evdo = state;
        return evdoStatusReport(_context);
    });
}

void C2KScenario::saySession(double delay, EVDOSession session) {
    say(delay, [this, session] {
        _phone.session = session;
        return evdoStatusReport(_context);
    });
}

void C2KScenario::sayEVDOReturn(double delay) {
    sayEVDO(delay, EVDOState::Acquisition);
    sayEVDO(delay + 1.5, EVDOState::Sync);
    sayEVDO(delay + 2.5, EVDOState::Idle);
}

void C2KScenario::advance() {
    _network.drive(step_s);
    remeasure();
    followTimeline();
    reselect();

    const double end = _now + step_s;
    std::multimap<double, Step> due;
    const auto later = _script.lower_bound(end);
    due.insert(_script.begin(), later);
    _script.erase(_script.begin(), later);
    addReports(due, end);
    for (const auto& [at, step] : due) {
        _context.transferUntil(at);
        send(at, step());
    }
    _now = end;
    addDamage();
}

void C2KScenario::followTimeline() {
    if (_now < _phaseEnd)
        return;
    const Phase& phase = phases[_phase];
    _phase = (_phase + 1) % std::size(phases);
    _phaseEnd = _now + phase.duration_s;
    if (phase.begin)
        (this->*phase.begin)();
}

void C2KScenario::remeasure() {
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

void C2KScenario::reselect() {
    const bool better =
        _phone.serving && !_network.pilots().empty() &&
        _network.pilots().front().level_dBm >= _phone.serving->level_dBm + reselectionMargin_dB;
    if (!better) {
        _betterSince = _now;
    } else if (_now - _betterSince >= reselectionTime_s) {
        _betterSince = _now;
        _phone.serving = _network.pilots().front();
        say(0.1, [this] { return systemReport(_context); });
    }
}

void C2KScenario::addReports(std::multimap<double, Step>& due, double end) {
    double phase = 0; // keeps reports of one period apart
    for (const C2KReport& report : c2kReports()) {
        phase += 0.037;
        double turn = std::max(std::ceil((_now - phase) / report.period_s), 0.0);
        for (; turn * report.period_s + phase < end; ++turn)
            due.emplace(turn * report.period_s + phase, [this, &report] { return report.make(_context); });
    }
}

void C2KScenario::addDamage() {
    if (_now < _nextDamage)
        return;
    _nextDamage = _now + 5 + 10 * _random.unit();
    const Damage damage = everyDamage[_damage % everyDamage.size()];
    const DamageMaterial material = c2kDamageMaterial(_context, _damage / everyDamage.size());
    ++_damage;
    const auto offset = offsetOf(_now);
    if (const auto message = damagedMessage(damage, material, beginning() + offset))
        _events.push_back({offset, *message});
}

void C2KScenario::send(double at, const std::optional<RecordBuilder>& record) {
    if (!record)
        return;
    const auto offset = offsetOf(at);
    _events.push_back({offset, record->message(beginning() + offset)});
}

std::chrono::nanoseconds C2KScenario::offsetOf(double at) {
    // A moment that two steps reckon in different ways may come out a nanosecond apart.
    _lastOffset = std::max(_lastOffset, std::chrono::nanoseconds(std::llround(at * 1e9)));
    return _lastOffset;
}

} // namespace velmora
