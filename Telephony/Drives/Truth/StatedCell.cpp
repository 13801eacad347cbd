// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/Truth/StatedCell.h"

#include <string>

namespace velmora {
namespace {

constexpr TruthTime pingPongTime = std::chrono::seconds(10);

std::string_view kindOf(TruthMode mode) {
    switch (mode) {
    case TruthMode::Idle: return "cell-reselection";
    case TruthMode::Connected: return "handover";
    case TruthMode::Unknown: break;
    }
    return "cell-change";
}

} // namespace

std::optional<TruthMove> StatedCell::update(TruthTime at, const TruthServing& serving) {
    if (serving.cell != _now)
        change(serving);
    if (!serving.isStated)
        return std::nullopt;
    if (_now && _isPending)
        return state(at, serving.shown);
    _isAbsenceStated = _isAbsenceStated || !_now;
    return std::nullopt;
}

void StatedCell::change(const TruthServing& serving) {
    _now = serving.cell;
    _mode = serving.mode;
    _isPending = _now.has_value();
    if (_now)
        return;
    _wasAbsent = true;
    _isAbsenceStated = false;
}

std::optional<TruthMove> StatedCell::state(TruthTime at, TruthMode shown) {
    std::optional<TruthMove> move;
    if (_stated && *_stated != *_now) {
        // Without a word of the time in between, the messages show a change that there was not.
        const bool isVisible = !_wasAbsent && shown == _mode;
        if (!_wasAbsent || !_isAbsenceStated)
            tell(at, kindOf(_wasAbsent ? TruthMode::Unknown : _mode), *_now, !isVisible);
        if (!_wasAbsent) {
            move = TruthMove{*_stated, *_now, isVisible ? _mode : TruthMode::Unknown};
            if (_stated->radio != _now->radio)
                tell(at, "technology-change", *_now, false);
            returnTo(at);
        }
    }
    if (_wasAbsent)
        _left.reset();
    _stated = _now;
    _wasAbsent = _isAbsenceStated = _isPending = false;
    return move;
}

void StatedCell::misstate(TruthTime at, const TruthCell& cell) {
    if (_stated && !_isAbsenceStated)
        tell(at, kindOf(TruthMode::Unknown), cell, true);
    _stated = cell;
    _isAbsenceStated = false;
}

void StatedCell::returnTo(TruthTime at) {
    if (_left && _left->cell == *_now && at - _left->at <= pingPongTime)
        tell(at, "ping-pong", *_now, false);
    _left = Left{*_stated, at};
}

void StatedCell::tell(TruthTime at, std::string_view kind, const TruthCell& to, bool isHidden) {
    _sink.happened({at,
                    std::nullopt,
                    kind,
                    isHidden,
                    {{"from.radio", std::string(_stated->radio)},
                     {"from.channel", std::to_string(_stated->channel)},
                     {"from.physical-cell", std::to_string(_stated->physical)},
                     {"to.radio", std::string(to.radio)},
                     {"to.channel", std::to_string(to.channel)},
                     {"to.physical-cell", std::to_string(to.physical)}}});
}

} // namespace velmora
