// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Detectors/ReportedValue.h"

namespace velmora {

bool ReportedValue::update(const Observation& observation, ObservedText& texts) {
    if (_isKnown && observation.kind != ObservedKind::Text && observation.raw == _raw &&
        observation.number == _number)
        return false;
    if (_isKnown && observation.kind == ObservedKind::Text && observation.words == _text)
        return false;
    _isKnown = true;
    _previous.swap(_text);
    _raw = observation.raw;
    _number = observation.number;
    _text.assign(observation.kind == ObservedKind::Text ? observation.words : texts.of(observation));
    return true;
}

bool isValue(const Observation& observation, const ValueRow& row) {
    if (observation.kind == ObservedKind::Text)
        return !row.text.empty() && observation.words == row.text;
    return row.text.empty() && observation.kind != ObservedKind::Absent && observation.raw == row.raw;
}

} // namespace velmora
