#include "Telephony/GSMScenario.h"

#include "Platform/TelephonyService.h"

#include <algorithm>
#include <cmath>
#include <iterator>

namespace velmora {
namespace {

/// A measurement period of the modem.
constexpr double step_s = 0.48;

constexpr int reselectionMargin_dB = 6;
constexpr double reselectionTime_s = 5;

/// The round: each phase begins with a procedure, where it has one, and lasts so long, or longer while a
/// procedure is still running.
struct Phase {
    double duration_s;
    void (GSMProcedures::*begin)(double now);
};
constexpr Phase phases[] = {
    {9, &GSMProcedures::powerOn},
    {7, &GSMProcedures::attach},
    {45, nullptr}, // idle on GSM
    {40, &GSMProcedures::startSession},
    {30, &GSMProcedures::endSession},
    {25, &GSMProcedures::startCall},
    {20, &GSMProcedures::handOverToUMTS},
    {30, &GSMProcedures::endCall},
    {65, &GSMProcedures::startSession},
    {20, &GSMProcedures::endSession},
    {20, &GSMProcedures::reselectToGSM},
    {20, &GSMProcedures::reselectToUMTS},
    {20, &GSMProcedures::reselectToGSM},
    {6, &GSMProcedures::powerOff},
};

/// What the cell measures in this list; the cell at the receiver's limit where it is not in it.
template <class Measurement>
Measurement measured(const std::vector<Measurement>& list, const Measurement& serving) {
    const auto found = std::find_if(list.begin(), list.end(),
                                    [&](const Measurement& each) { return each.cell == serving.cell; });
    if (found != list.end())
        return *found;
    Measurement lost;
    lost.cell = serving.cell;
    return lost;
}

} // namespace

GSMScenario::GSMScenario(std::uint64_t seed)
    : _network(seed), _random(seed ^ 0x5EED),
      _procedures(_phone, _network), _context{_phone, _network, _random} {}

std::string_view GSMScenario::technology() const {
    return kVoxLogChannelTechnology_Ostrel_GSM;
}

Time GSMScenario::beginning() {
    using namespace std::chrono;
    return sys_days{year{2026} / January / 5} + hours{8};
}

ScenarioEvent GSMScenario::next() {
    while (_events.empty())
        advance();
    ScenarioEvent event = std::move(_events.front());
    _events.pop_front();
    return event;
}

void GSMScenario::advance() {
    _network.drive(step_s);
    remeasure();
    followTimeline();
    reselect();

    const double end = _now + step_s;
    std::multimap<double, GSMProcedures::Step> due = _procedures.takeUntil(end);
    addReports(due, end);
    for (const auto& [at, step] : due)
        send(at, step());
    _now = end;
    addDamage();
}

void GSMScenario::followTimeline() {
    if (_now < _phaseEnd || !_procedures.idle())
        return;
    const Phase& phase = phases[_phase];
    _phase = (_phase + 1) % std::size(phases);
    _phaseEnd = _now + phase.duration_s;
    if (phase.begin)
        (_procedures.*phase.begin)(_now);
}

void GSMScenario::remeasure() {
    if (_phone.gsm.cell)
        _phone.gsm = measured(_network.gsm(), _phone.gsm);
    if (_phone.umts.cell)
        _phone.umts = measured(_network.umts(), _phone.umts);
}

void GSMScenario::reselect() {
    if (!_procedures.idle())
        return;
    const bool gsm = _phone.radio == GSMPhone::Radio::GSM && _phone.gsm.cell && !_network.gsm().empty();
    const bool umts = _phone.radio == GSMPhone::Radio::UMTS && _phone.umts.cell && !_network.umts().empty();
    const bool better =
        (gsm && _network.gsm().front().rssi_dBm >= _phone.gsm.rssi_dBm + reselectionMargin_dB) ||
        (umts && _network.umts().front().rscp_dBm >= _phone.umts.rscp_dBm + reselectionMargin_dB);
    if (!better) {
        _betterSince = _now;
    } else if (_now - _betterSince >= reselectionTime_s) {
        _betterSince = _now;
        if (gsm)
            _procedures.reselectWithinGSM(_now, _network.gsm().front());
        else
            _procedures.reselectWithinUMTS(_now, _network.umts().front());
        return;
    }
    const bool moved = _phone.area() != _phone.registeredArea || _phone.registeredRadio != _phone.radio;
    if (_phone.registered && moved && _phone.connection == GSMPhone::Connection::None)
        _procedures.updateArea(_now);
}

void GSMScenario::addReports(std::multimap<double, GSMProcedures::Step>& due, double end) {
    double phase = 0; // keeps reports of one period apart
    for (const GSMReport& report : reportsOf(_phone)) {
        phase += 0.137;
        double turn = std::ceil((_now - phase) / report.period_s);
        for (; turn * report.period_s + phase < end; ++turn)
            due.emplace(turn * report.period_s + phase, [this, &report] { return report.make(_context); });
    }
}

void GSMScenario::addDamage() {
    if (_now < _nextDamage)
        return;
    _nextDamage = _now + 5 + 10 * _random.unit();
    const Damage damage = everyDamage[_damage];
    _damage = (_damage + 1) % everyDamage.size();
    const auto offset = offsetOf(_now);
    if (const auto message = damagedMessage(damage, _context, beginning() + offset))
        _events.push_back({offset, *message});
}

void GSMScenario::send(double at, const std::optional<RecordBuilder>& record) {
    if (!record)
        return;
    const auto offset = offsetOf(at);
    _events.push_back({offset, record->message(beginning() + offset)});
}

std::chrono::nanoseconds GSMScenario::offsetOf(double at) {
    // A moment that two steps reckon in different ways may come out a nanosecond apart.
    _lastOffset = std::max(_lastOffset, std::chrono::nanoseconds(std::llround(at * 1e9)));
    return _lastOffset;
}

} // namespace velmora
