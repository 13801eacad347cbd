// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/DriveScenario.h"

#include <algorithm>
#include <utility>

namespace velmora {
namespace {

std::chrono::nanoseconds nanosecondsOf(double seconds) {
    return std::chrono::nanoseconds(std::llround(seconds * 1e9));
}

} // namespace

Time DriveScenario::startTime() {
    using namespace std::chrono;
    return sys_days{year{2026} / January / 5} + hours{8};
}

ScenarioEvent DriveScenario::next() {
    while (_events.empty())
        advance();
    ScenarioEvent event = std::move(_events.front());
    _events.pop_front();
    return event;
}

void DriveScenario::advance() {
    _stepStart = _now;
    drive(step_s);
    followTimeline();
    react();

    const double end = _now + step_s;
    DriveScript due;
    while (!_script.empty() && _script.begin()->first < end)
        due.insert(due.end(), _script.extract(_script.begin()));
    addReports(due);
    for (const auto& [at, step] : due) {
        countUntil(at);
        send(at, step());
    }
    _now = end;
    addUnusualMessage();
}

RoadPlace DriveScenario::place() const {
    return {nanosecondsOf(_stepStart), road().east_m(), road().north_m()};
}

void DriveScenario::followTimeline() {
    if (_now < _phaseEnd || !_script.empty())
        return;
    const Phase& phase = _phases[_phase];
    _phase = (_phase + 1) % _phases.size();
    _phaseEnd = _now + phase.duration_s;
    if (phase.begin)
        (this->*phase.begin)();
}

void DriveScenario::countUntil(double) {}

bool DriveScenario::timeToReselect(bool better, double after_s) {
    if (better && _now - _betterSince < after_s)
        return false;
    _betterSince = _now;
    return better;
}

void DriveScenario::addUnusualMessage() {
    if (_now < _nextUnusual)
        return;
    _nextUnusual = _now + 5 + 10 * _random.unit();
    const std::size_t number = _unusualCount++;
    const UnusualMessageParts material = unusualMessageParts(number);
    const auto offset = offsetOf(_now);
    const UnusualMessage kind = allUnusualMessages[number % allUnusualMessages.size()];
    const auto message = unusualMessage(kind, material, startTime() + offset);
    if (!message)
        return;
    _events.push_back({offset, *message});
    if (_truth)
        _truth->followUnusual(offset, kind, number);
    if (_truth && kind == UnusualMessage::Prefixed)
        _truth->follow(offset, material.good.code());
}

void DriveScenario::send(double at, const std::optional<RecordBuilder>& record) {
    if (record) {
        const auto offset = offsetOf(at);
        _events.push_back({offset, record->message(startTime() + offset)});
    }
    if (_truth)
        _truth->follow(record ? _lastOffset : nanosecondsOf(at),
                       record ? std::optional(record->code()) : std::nullopt);
}

void DriveScenario::finishTruth() {
    if (_truth)
        _truth->finish();
}

std::chrono::nanoseconds DriveScenario::offsetOf(double at) {
    // A moment that two steps reckon in different ways may come out a nanosecond apart.
    _lastOffset = std::max(_lastOffset, nanosecondsOf(at));
    return _lastOffset;
}

} // namespace velmora
