// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/Truth/StatedReselections.h"

#include <algorithm>
#include <utility>

namespace velmora {
namespace {

constexpr double lateMargin_dB = 6;
constexpr TruthTime lateTime = std::chrono::seconds(10);
/// A level that is older is not compared.
constexpr TruthTime oldest = std::chrono::seconds(2);

bool areSame(const TruthCell& one, const TruthCell& other) {
    return one.radio == other.radio && one.channel == other.channel && one.physical == other.physical;
}

template <class Known>
auto findCell(Known& known, const TruthCell& cell) {
    return std::find_if(known.begin(), known.end(),
                        [&cell](const auto& each) { return areSame(each.cell, cell); });
}

} // namespace

void StatedReselections::move(TruthTime at, const TruthMove& move) {
    const auto margin = findCell(_compared, move.to);
    const auto better = findCell(_better, move.to);
    const bool isKnown = margin != _compared.end() && at - _comparedAt <= oldest;
    const bool isLate = isKnown && better != _better.end() && at - better->since > lateTime;
    const bool isByPhone = move.mode == TruthMode::Idle && move.from.radio == move.to.radio;
    if (isByPhone && isLate)
        tell(at, "late-reselection");
    const bool mayBeEarly = isByPhone && isKnown && !isLate && margin->level_dBm <= 0;
    forget();
    if (mayBeEarly)
        _early = Early{at, move.from};
}

void StatedReselections::measureServing(TruthTime at, double level_dBm) {
    _servingAt = at;
    _serving_dBm = level_dBm;
    _isMeasured = true;
}

void StatedReselections::measureNeighbours(TruthTime at, std::vector<TruthLevel> neighbours) {
    _neighboursAt = at;
    _neighbours = std::move(neighbours);
    _isMeasured = true;
}

void StatedReselections::confirm(TruthTime at) {
    judgeEarly(at);
    if (std::exchange(_isMeasured, false))
        compare(at);
}

bool StatedReselections::areFresh(TruthTime at) const {
    return _servingAt && _neighboursAt && at - *_servingAt <= oldest && at - *_neighboursAt <= oldest;
}

void StatedReselections::compare(TruthTime at) {
    std::vector<Better> better;
    _compared.clear();
    if (areFresh(at)) {
        _comparedAt = *_neighboursAt;
        for (const TruthLevel& each : _neighbours) {
            const double margin_dB = each.level_dBm - _serving_dBm;
            _compared.push_back({each.cell, margin_dB});
            if (margin_dB < lateMargin_dB)
                continue;
            const auto known = findCell(_better, each.cell);
            better.push_back({each.cell, known != _better.end() ? known->since : at});
        }
    }
    _better = std::move(better);
}

void StatedReselections::judgeEarly(TruthTime at) {
    if (!_early)
        return;
    const auto left = findCell(_neighbours, _early->from);
    if (_servingAt && _neighboursAt && left != _neighbours.end()) {
        if (left->level_dBm >= _serving_dBm)
            tell(_early->at, "early-reselection");
        _early.reset();
    } else if (at - _early->at > oldest) {
        _early.reset();
    }
}

void StatedReselections::forget() {
    _servingAt.reset();
    _neighboursAt.reset();
    _neighbours.clear();
    _compared.clear();
    _better.clear();
    _early.reset();
    _isMeasured = false;
}

void StatedReselections::tell(TruthTime at, std::string_view kind) const {
    _sink.happened({at, std::nullopt, kind, false, {}});
}

} // namespace velmora
