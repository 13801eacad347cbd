// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/IFX/IFXScenario.h"

#include "Platform/TelephonyService.h"
#include "PropertyLists/PropertyList.h"
#include "Telephony/Drives/IFX/IFXTruth.h"
#include "Telephony/Drives/ServingMeasurement.h"

#include <algorithm>
#include <iterator>
#include <stdexcept>
#include <string>

namespace velmora {
namespace {

using State = IFXPhone::State;

constexpr int reselectionMargin_dB = 6;

/// The round: what the phone does, for so many seconds, with so many contexts.
struct Phase {
    int duration_s;
    State state;
    int contexts;
};
constexpr Phase phases[] = {
    {6, State::Searching, 0},      {3, State::Limited, 0}, {3, State::Registering, 0},
    {30, State::Idle, 0},          {30, State::Call, 0},   {10, State::Idle, 0},
    {25, State::PacketSession, 1}, {10, State::Idle, 0},   {25, State::PacketSession, 2},
    {8, State::Idle, 0},
};

Data serialized(const Value& display, bool binary) {
    // What the display holds is made here: it has both forms.
    if (binary) {
        auto bytes = writeBinaryPropertyList(display);
        if (!bytes)
            throw std::logic_error("display cannot be written: " + bytes.reason());
        return Data(*std::move(bytes));
    }
    const auto text = writeXMLPropertyList(display);
    if (!text)
        throw std::logic_error("display cannot be written: " + text.reason());
    return Data(std::vector<std::uint8_t>(text->begin(), text->end()));
}

} // namespace

IFXScenario::IFXScenario(std::uint64_t seed) : _network(seed), _random(seed ^ 0x5EED) {}

std::string_view IFXScenario::technology() const {
    return kVoxLogChannelTechnology_IFX;
}

ScenarioEvent IFXScenario::next() {
    _network.drive(1);
    followTimeline();
    camp();
    const int number = _seconds++;
    if (_truth)
        _truth->follow(std::chrono::seconds(number), std::nullopt);
    return {std::chrono::seconds(number), serialized(ifxDisplay(_phone, _network), number % 2 == 0)};
}

RoadPlace IFXScenario::place() const {
    return {std::chrono::seconds(std::max(_seconds - 1, 0)), _network.east_m(), _network.north_m()};
}

void IFXScenario::tellTruth(TruthSink& sink) {
    _truth = std::make_unique<IFXTruth>(_phone, sink);
}

void IFXScenario::finishTruth() {
    if (_truth)
        _truth->finish();
}

void IFXScenario::followTimeline() {
    if (_seconds >= _phaseEnd) {
        const Phase& phase = phases[_phase];
        _phase = (_phase + 1) % std::size(phases);
        _phaseEnd = _seconds + phase.duration_s;
        _phone.state = phase.state;
        _phone.contexts = phase.contexts;
        _phone.callSeconds = 0;
    }
    if (_phone.state == State::Call)
        ++_phone.callSeconds;
    // Good where the cell is strong, and never quite steady.
    const int level_dBm = _phone.serving ? _phone.serving->rssi_dBm : -110;
    _phone.loss = std::clamp((-70 - level_dBm) / 40.0 + 0.1 * _random.normal(), 0.0, 1.0);
}

void IFXScenario::camp() {
    if (_phone.state == State::Searching) {
        _phone.serving.reset();
        return;
    }
    const auto& cells = _network.gsm();
    if (_phone.serving)
        _phone.serving = updatedMeasurement(*_phone.serving, cells);
    if (!cells.empty() &&
        (!_phone.serving || cells.front().rssi_dBm >= _phone.serving->rssi_dBm + reselectionMargin_dB))
        _phone.serving = cells.front();
    if (_phone.serving && _phone.state >= State::Idle)
        _phone.registeredArea = _phone.serving->cell->area;
}

} // namespace velmora
