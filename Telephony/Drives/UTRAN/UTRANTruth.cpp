// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/UTRAN/UTRANTruth.h"

#include "LogMessages/LogMessage.h"
#include "Telephony/Drives/GSM/GSMStateNames.h"

#include <string>

namespace velmora {
namespace {

/// The codes of UTRANRecords.h whose records state the phone.
enum Code : std::uint32_t { rrcStates = 0xD0E0, cells = 0xD0E2 };

} // namespace

void UTRANTruth::follow(TruthTime at, std::optional<std::uint32_t> sent) {
    const std::uint32_t code = sent.value_or(0);
    if (code == rrcStates)
        _isRRCShown = true;
    _rrc.update(at, nameOf(_phone.rrc), code == rrcStates);
    _cell.update(at, serving(code));
    _limited.update(at, _phone.serving && !_phone.registered, code == cells);
    if (code == ExtraCode::packetDataContexts)
        _contexts.state(at, _phone.contexts);
    _area.update(at, std::to_string(_phone.registeredArea.lac), code == ExtraCode::simFiles);
}

TruthServing UTRANTruth::serving(std::uint32_t code) const {
    TruthServing serving;
    // In the other connected states the phone reselects by itself (3GPP TS 25.331 7.2.2).
    serving.mode = _phone.rrc == records::RRCState::CellDCH ? TruthMode::Connected : TruthMode::Idle;
    serving.shown = _isRRCShown ? serving.mode : TruthMode::Unknown;
    serving.isStated = code == ExtraCode::cellInformation;
    if (!_phone.serving)
        return serving;
    const UTRANCell& cell = _phone.serving->cell;
    serving.cell = {"TD-SCDMA", cell.uarfcn, cell.parameterId, cell.cellId};
    serving.isStated |= code == cells;
    return serving;
}

void UTRANTruth::followUnusual(TruthTime at, UnusualMessage kind, std::size_t number) {
    DriveTruth::followUnusual(at, kind, number);
    if (kind == UnusualMessage::BelowMinimum && number / allUnusualMessages.size() % 2 == 1)
        _isRRCShown = false;
}

} // namespace velmora
