// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Drives/Truth/RadioConditions.h"

#include <algorithm>

namespace velmora {
namespace {

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

void RadioConditions::measureNeighbours(TruthTime at, double serving_dBm,
                                        const std::vector<double>& neighbours_dBm) {
    const auto countWithin = [&](double margin_dB) {
        return std::count_if(neighbours_dBm.begin(), neighbours_dBm.end(),
                             [&](double each) { return each > serving_dBm - margin_dB; });
    };
    _pollution.measure(at, countWithin(5) >= 3, countWithin(7) < 3);
}

void RadioConditions::lose(TruthTime at) {
    _pollution.lose(at);
    _weak.lose(at);
    _poor.lose(at);
}

void RadioConditions::confirm(TruthTime at) {
    for (HeldCondition* each : {&_weak, &_poor, &_pollution})
        each->confirm(at);
}

void RadioConditions::finish() {
    for (HeldCondition* each : {&_weak, &_poor, &_pollution})
        each->finish();
}

} // namespace velmora
