// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/LTE/LTETruth.h"

#include "LogMessages/LogMessage.h"

#include <string>

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

} // namespace

void LTETruth::follow(TruthTime at, std::optional<std::uint32_t> sent) {
    const std::uint32_t code = sent.value_or(0);
    followMode(at, code);
    _cell.update(at, serving(code));
    if (code == ExtraCode::packetDataContexts)
        _contexts.state(at, _phone.contexts);
    _area.update(at, std::to_string(_phone.registeredArea.lac), code == ExtraCode::simFiles);
}

void LTETruth::followMode(TruthTime at, std::uint32_t code) {
    const bool isConnected = code == connectedMeasurements;
    const bool isIdle = code == idleMeasurements || code == candidates;
    if (isConnected || isIdle)
        _shown = isConnected ? TruthMode::Connected : TruthMode::Idle;
    // For a moment after a change the measurements of the earlier mode still come.
    _mode.update(at, _phone.connected ? "connected" : "idle",
                 (isConnected && _phone.connected) || (isIdle && !_phone.connected));
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
    // One of the three records whose count is too high is a measurement in connected mode; what is in it is
    // shown.
    if (kind != UnusualMessage::CountOverrun || number / allUnusualMessages.size() % 3 != 0)
        return;
    _shown = TruthMode::Connected;
    _mode.misstate(at, "connected");
}

} // namespace velmora
