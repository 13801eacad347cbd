// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/LTE/LTETruth.h"

#include "LogMessages/LogMessage.h"

#include <cmath>
#include <string>
#include <utility>
#include <vector>

namespace velmora {
namespace {

/// The codes of LTERecords.h whose records state the phone.
enum Code : std::uint32_t {
    cells = 0xB0C2,
    antennas = 0xB0C1,
    connectedMeasurements = 0xB179,
    idleMeasurements = 0xB17F,
    idleNeighbours = 0xB180,
    candidates = 0xB186,
};

constexpr std::size_t reportedNeighbours = 6;
/// So many reports of neighbours are a turn: the last one is of another carrier.
constexpr std::size_t carrierTurns = 4;

double rounded(double value, double step) {
    return step * std::round(value / step);
}

TruthCell truthOf(const LTECell& cell) {
    return {"LTE", lteCarriers[cell.carrier].downlink, cell.physicalId, cell.identity};
}

} // namespace

void LTETruth::follow(TruthTime at, std::optional<std::uint32_t> sent) {
    const std::uint32_t code = sent.value_or(0);
    followMode(at, code);
    if (const std::optional<TruthMove> move = _cell.update(at, serving(code))) {
        _reselections.move(at, *move);
        _conditions.changeCell(at);
        _hasNeighbours = false;
    }
    followMeasurements(at, code);
    followNeighbours(at, code);
    if (sent) {
        _conditions.confirm(at);
        _reselections.confirm(at);
    }
    if (code == ExtraCode::packetDataContexts)
        _contexts.state(at, _phone.contexts);
    _area.update(at, std::to_string(_phone.registeredArea.lac), code == ExtraCode::simFiles);
}

void LTETruth::followMeasurements(TruthTime at, std::uint32_t code) {
    if (!_phone.serving) {
        _conditions.lose(at);
        _reselections.forget();
    }
    if (!_phone.serving || (code != connectedMeasurements && code != idleMeasurements))
        return;
    // The modem measures in these steps, those of RSRP upwards from -140 dBm.
    const double step_dB = code == idleMeasurements ? 0.25 : 0.125;
    _conditions.measureLevel(at, "LTE", rounded(_phone.serving->rsrp_dBm, 0.25));
    _conditions.measureQuality(at, "LTE", rounded(_phone.serving->rsrq_dB, step_dB));
    _conditions.compareServing(at, rounded(_phone.serving->rsrp_dBm, 0.25));
    _reselections.measureServing(at, rounded(_phone.serving->rsrp_dBm, 0.25));
}

void LTETruth::followNeighbours(TruthTime at, std::uint32_t code) {
    if (code != connectedMeasurements && code != idleNeighbours)
        return;
    if (code == idleNeighbours && (_context.neighbours - 1) % carrierTurns == carrierTurns - 1) {
        if (!_hasNeighbours)
            _conditions.compareNeighbours(at, {}, true); // none on the serving cell's carrier
        return;
    }
    const double step_dB = code == idleNeighbours ? 0.5 : 0.25;
    std::vector<double> levels;
    std::vector<TruthLevel> neighbours;
    for (const LTEMeasurement& each : _context.network.cells(_phone.carrier)) {
        if ((_phone.serving && each.cell == _phone.serving->cell) || levels.size() == reportedNeighbours)
            continue;
        levels.push_back(rounded(each.rsrp_dBm, step_dB));
        neighbours.push_back({truthOf(each.cell), levels.back()});
    }
    _hasNeighbours = !levels.empty();
    _conditions.compareNeighbours(at, std::move(levels), _hasNeighbours);
    _reselections.measureNeighbours(at, std::move(neighbours));
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
    serving.cell = truthOf(_phone.serving->cell);
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
