#include "Telephony/UTRANScenario.h"

#include "Platform/TelephonyService.h"

#include <algorithm>
#include <cmath>
#include <iterator>

namespace velmora {

using records::RRCState;

namespace {

/// A measurement period of the modem.
constexpr double step_s = 0.48;

constexpr int reselectionMargin_dB = 5;
constexpr double reselectionTime_s = 3;

} // namespace

/// The round: each phase begins with a procedure, where it has one, and lasts so long, or longer while the
/// script is not at its end.
struct UTRANScenario::Phase {
    double duration_s;
    void (UTRANScenario::*begin)();
};

const UTRANScenario::Phase UTRANScenario::phases[] = {
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
    : _network(seed), _random(seed ^ 0x5EED), _context{_phone, _network, _random} {}

std::string_view UTRANScenario::technology() const {
    return kVoxLogChannelTechnology_Ostrel_UTRAN2;
}

Time UTRANScenario::beginning() {
    using namespace std::chrono;
    return sys_days{year{2026} / January / 5} + hours{8};
}

ScenarioEvent UTRANScenario::next() {
    while (_events.empty())
        advance();
    ScenarioEvent event = std::move(_events.front());
    _events.pop_front();
    return event;
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

void UTRANScenario::advance() {
    _network.drive(step_s);
    remeasure();
    followTimeline();
    reselect();

    const double end = _now + step_s;
    std::multimap<double, Step> due;
    while (!_script.empty() && _script.begin()->first < end)
        due.insert(due.end(), _script.extract(_script.begin()));
    addReports(due, end);
    for (const auto& [at, step] : due)
        send(at, step());
    _now = end;
    addDamage();
}

void UTRANScenario::followTimeline() {
    if (_now < _phaseEnd || !_script.empty())
        return;
    const Phase& phase = phases[_phase];
    _phase = (_phase + 1) % std::size(phases);
    _phaseEnd = _now + phase.duration_s;
    if (phase.begin)
        (this->*phase.begin)();
}

void UTRANScenario::remeasure() {
    if (!_phone.serving)
        return;
    const auto found =
        std::find_if(_network.cells().begin(), _network.cells().end(),
                     [this](const UTRANMeasurement& each) { return each.cell == _phone.serving->cell; });
    // At the receiver's limit where it is not measured.
    _phone.serving->rscp_dBm =
        found != _network.cells().end() ? found->rscp_dBm : UTRANMeasurement{}.rscp_dBm;
}

void UTRANScenario::reselect() {
    const auto& cells = _network.cells();
    const bool better = _phone.serving && !cells.empty() &&
                        cells.front().rscp_dBm >= _phone.serving->rscp_dBm + reselectionMargin_dB;
    if (!better) {
        _betterSince = _now;
    } else if (_now - _betterSince >= reselectionTime_s) {
        _betterSince = _now;
        _phone.serving = cells.front();
        say(0, [this] { return utranReports::serving(_context); });
        return;
    }
    // Idle in an area that the network does not know the phone to be in, it registers anew.
    if (_script.empty() && _phone.registered && _phone.rrc == RRCState::Disconnected && _phone.serving &&
        _phone.serving->cell.area != _phone.registeredArea)
        registerWithNetwork();
}

void UTRANScenario::addReports(std::multimap<double, Step>& due, double end) {
    double phase = 0; // keeps reports of one period apart
    for (const UTRANReport& report : reportsOf(_phone)) {
        phase += 0.137;
        double turn = std::ceil((_now - phase) / report.period_s);
        for (; turn * report.period_s + phase < end; ++turn)
            due.emplace(turn * report.period_s + phase, [this, &report] { return report.make(_context); });
    }
}

DamageMaterial UTRANScenario::damageMaterial() {
    // Which records are spoilt changes from round to round of the kinds of damage.
    const std::size_t round = _damage / everyDamage.size();
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
    return {*utranReports::rrc(_context), tooShort, overrun, static_cast<std::int64_t>(_damage)};
}

void UTRANScenario::addDamage() {
    if (_now < _nextDamage)
        return;
    _nextDamage = _now + 5 + 10 * _random.unit();
    const Damage damage = everyDamage[_damage % everyDamage.size()];
    const DamageMaterial material = damageMaterial();
    ++_damage;
    const auto offset = offsetOf(_now);
    if (const auto message = damagedMessage(damage, material, beginning() + offset))
        _events.push_back({offset, *message});
}

void UTRANScenario::send(double at, const std::optional<RecordBuilder>& record) {
    if (!record)
        return;
    const auto offset = offsetOf(at);
    _events.push_back({offset, record->message(beginning() + offset)});
}

std::chrono::nanoseconds UTRANScenario::offsetOf(double at) {
    // A moment that two steps reckon in different ways may come out a nanosecond apart.
    _lastOffset = std::max(_lastOffset, std::chrono::nanoseconds(std::llround(at * 1e9)));
    return _lastOffset;
}

} // namespace velmora
