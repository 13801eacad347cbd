// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/LTE/LTETruth.h"

#include "LogMessages/LogMessage.h"

#include <cmath>
#include <string>
#include <vector>

namespace velmora {
namespace {

/// The codes of LTERecords.h whose records state the phone.
enum Code : std::uint32_t {
    cells = 0xB0C2,
    antennas = 0xB0C1,
    connectedMeasurements = 0xB179,
    idleMeasurements = 0xB17F,
    candidates = 0xB186,
};

constexpr std::size_t reportedNeighbours = 6;

double rounded(double value, double step) {
    return step * std::round(value / step);
}

} // namespace

void LTETruth::follow(TruthTime at, std::optional<std::uint32_t> sent) {
    const std::uint32_t code = sent.value_or(0);
    followMode(at, code);
    followMeasurements(at, code);
    if (sent)
        _conditions.confirm(at);
    _cell.update(at, serving(code));
    if (code == ExtraCode::packetDataContexts)
        _contexts.state(at, _phone.contexts);
    _area.update(at, std::to_string(_phone.registeredArea.lac), code == ExtraCode::simFiles);
}

void LTETruth::followMeasurements(TruthTime at, std::uint32_t code) {
    if (!_phone.serving)
        _conditions.lose(at);
    if (!_phone.serving || (code != connectedMeasurements && code != idleMeasurements))
        return;
    // The modem measures in these steps, those of RSRP upwards from -140 dBm.
    const double step_dB = code == idleMeasurements ? 0.25 : 0.125;
    _conditions.measureLevel(at, "LTE", rounded(_phone.serving->rsrp_dBm, 0.25));
    _conditions.measureQuality(at, "LTE", rounded(_phone.serving->rsrq_dB, step_dB));
    std::vector<double> neighbours;
    for (const LTEMeasurement& each : _network.cells(_phone.carrier))
        if (each.cell != _phone.serving->cell && neighbours.size() < reportedNeighbours)
            neighbours.push_back(each.rsrp_dBm);
    _conditions.measureNeighbours(at, _phone.serving->rsrp_dBm, neighbours);
}

void LTETruth::followMode(TruthTime at, std::uint32_t code) {
    const bool isConnected = code == connectedMeasurements;
    const bool isIdle = code == idleMeasurements || code == candidates;
    if (isConnected || isIdle)
        _shown = isConnected ? TruthMode::Connected : TruthMode::Idle;
    // For a moment after a change the measurements of the earlier mode still come.
    const bool isLate = (isConnected && !_phone.connected) || (isIdle && _phone.connected);
    _mode.update(at, _phone.connected ? "connected" : "idle", (isConnected || isIdle) && !isLate);
    if (isLate)
        _mode.misstate(at, isConnected ? "connected" : "idle");
}

TruthServing LTETruth::serving(std::uint32_t code) const {
    TruthServing serving;
    serving.mode = _phone.connected ? TruthMode::Connected : TruthMode::Idle;
    serving.shown = _shown;
    serving.isStated = code == ExtraCode::cellInformation;
    if (!_phone.serving)
        return serving;
    const LTECell& cell = _phone.serving->cell;
    serving.cell = {"LTE", lteCarriers[cell.carrier].downlink, cell.physicalId, cell.identity};
    serving.isStated |=
        code == cells || code == connectedMeasurements || code == idleMeasurements || code == candidates;
    return serving;
}

void LTETruth::followUnusual(TruthTime at, UnusualMessage kind, std::size_t number) {
    DriveTruth::followUnusual(at, kind, number);
    // Without a serving cell the record that gets a prefix is of one without an identity.
    if (kind == UnusualMessage::Prefixed && !_phone.serving)
        _cell.misstate(at, {"LTE", lteCarriers.front().downlink, 0, 0});
    // One of the three records whose count is too high is a measurement in connected mode; what is in it is
    // shown.
    if (kind != UnusualMessage::CountOverrun || number / allUnusualMessages.size() % 3 != 0)
        return;
    _shown = TruthMode::Connected;
    followMeasurements(at, connectedMeasurements);
    if (!_phone.connected)
        _mode.misstate(at, "connected");
}

} // namespace velmora
