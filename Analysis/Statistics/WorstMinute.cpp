// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Statistics/WorstMinute.h"

namespace velmora {

std::optional<WorstMinute::Measure> WorstMinute::measureOf(Role role) {
    switch (role) {
    case Role::ServingLevel:
    case Role::ServingQuality: return Measure::LowestMedian;
    case Role::BlockErrorRate: return Measure::HighestMean;
    default: return std::nullopt;
    }
}

std::optional<WorstMinute::Minute> WorstMinute::worse(Measure measure, const std::optional<Minute>& a,
                                                      const std::optional<Minute>& b) {
    if (!a || !b)
        return a ? a : b;
    if (a->figure == b->figure)
        return a->begin <= b->begin ? a : b;
    return (measure == Measure::LowestMedian) == (a->figure < b->figure) ? a : b;
}

std::optional<WorstMinute::Minute> WorstMinute::worst() const {
    if (_values.count() < fewestSamples)
        return _worst;
    const std::optional<double> figure = _measure == Measure::LowestMedian
                                             ? percentileOf(_values.sorted(), _values.count(), 50)
                                             : _values.mean();
    if (!figure)
        return _worst;
    return worse(_measure, _worst, Minute{_minute, *figure, _values.count()});
}

void WorstMinute::beginMinute(Time minute) {
    _worst = worst();
    _minute = minute;
    _values = ValueCounts(mostValues);
}

} // namespace velmora
