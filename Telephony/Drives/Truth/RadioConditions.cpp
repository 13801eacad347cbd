// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/Truth/RadioConditions.h"

#include <algorithm>
#include <utility>

namespace velmora {
namespace {

constexpr TruthTime servingKnown = std::chrono::seconds(5);
constexpr TruthTime neighboursKnown = std::chrono::seconds(10);

/// Below the first it begins, from the second on it ends.
struct Limits {
    double begin;
    double end;
};

Limits levelLimits(std::string_view radio) {
    if (radio == "UMTS")
        return {-110, -107};
    if (radio == "LTE" || radio == "NR")
        return {-115, -112};
    return {-100, -97}; // GSM and CDMA2000
}

Limits qualityLimits(std::string_view radio) {
    if (radio == "UMTS")
        return {-14, -12};
    if (radio == "LTE" || radio == "NR")
        return {-15, -13};
    return {-13, -11}; // CDMA2000
}

void measure(HeldCondition& condition, TruthTime at, const Limits& limits, double value) {
    condition.measure(at, value < limits.begin, value >= limits.end);
}

} // namespace

void RadioConditions::measureLevel(TruthTime at, std::string_view radio, double level_dBm) {
    measure(_weak, at, levelLimits(radio), level_dBm);
}

void RadioConditions::measureQuality(TruthTime at, std::string_view radio, double quality_dB) {
    measure(_poor, at, qualityLimits(radio), quality_dB);
}

void RadioConditions::compareServing(TruthTime at, double level_dBm) {
    _serving = Serving{at, level_dBm};
    _isAlone = false;
}

void RadioConditions::compareNeighbours(TruthTime at, std::vector<double> levels_dBm, bool hasAny) {
    _neighbours.reset();
    if (hasAny)
        _neighbours = Neighbours{at, std::move(levels_dBm)};
}

void RadioConditions::compareNoNeighbours() {
    forgetLevels();
    _isAlone = true;
}

void RadioConditions::changeCell(TruthTime at) {
    lose(at);
    forgetLevels();
}

void RadioConditions::forgetLevels() {
    _serving.reset();
    _neighbours.reset();
    _isAlone = false;
}

void RadioConditions::compare(TruthTime at) {
    if (_isAlone) {
        _pollution.measure(at, false, true);
    } else if (!_serving || !_neighbours || at - _serving->at > servingKnown ||
               at - _neighbours->at > neighboursKnown) {
        _pollution.lose(at);
    } else if (at - _serving->at >= _fresh) {
        _pollution.measure(at, false, false);
    } else {
        const auto countWithin = [this](double margin_dB) {
            const std::vector<double>& all = _neighbours->levels_dBm;
            const double least_dBm = _serving->level_dBm - margin_dB;
            return std::count_if(all.begin(), all.end(), [=](double each) { return each > least_dBm; });
        };
        _pollution.measure(at, countWithin(5) >= 3, countWithin(7) < 3);
    }
}

void RadioConditions::lose(TruthTime at) {
    _weak.lose(at);
    _poor.lose(at);
}

void RadioConditions::confirm(TruthTime at) {
    compare(at);
    for (HeldCondition* each : {&_weak, &_poor, &_pollution})
        each->confirm(at);
}

void RadioConditions::finish() {
    for (HeldCondition* each : {&_weak, &_poor, &_pollution})
        each->finish();
}

} // namespace velmora
