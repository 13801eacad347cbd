// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/TechnologyReport.h"

#include "Analysis/Statistics/ClockMinute.h"
#include "Export/Report/ReportEvents.h"

#include <algorithm>
#include <cmath>
#include <string>

namespace velmora {

TechnologyReport::TechnologyReport(const Catalogue& catalogue, const LevelClasses* classes,
                                   StatisticsGroups& groups, ReportEvents& events)
    : _classes(classes), _engine(catalogue, events), _statistics(catalogue, groups),
      _isByFile(groups.plan().by == StatisticsPlan::By::File) {}

const TechnologyReport::Use& TechnologyReport::useOf(const CatalogueField& leaf) {
    if (leaf.index >= _uses.size())
        _uses.resize(leaf.index + 1);
    Use& use = _uses[leaf.index];
    if (!use.isKnown) {
        use.isKnown = true;
        use.role = leaf.role;
        if (const ReportChart chart = chartOf(leaf); chart != ReportChart::None)
            use.series = &_series.emplace_back(ChartedLeaf{&leaf, chart, isNeighbour(leaf), SeriesBuckets()});
    }
    return use;
}

std::chrono::nanoseconds TechnologyReport::pass(Time time) {
    if (_last && (durationBetween(*_last, time) > TechnologyStatistics::longestSilence ||
                  durationBetween(time, *_last) > TechnologyStatistics::largestStepBack))
        forget(*_last);
    const std::chrono::nanoseconds passed =
        _last ? std::max(durationBetween(*_last, time), std::chrono::nanoseconds(0))
              : std::chrono::nanoseconds(0);
    _last = _last ? std::max(*_last, time) : time;
    return passed;
}

void TechnologyReport::report(const MessageReport& report) {
    const std::chrono::nanoseconds passed = pass(report.time);
    if (passed.count() > 0)
        _shares[_isByFile ? report.message.input : 0].add(_engine.picture().technology(), _class, passed);
    _engine.report(report);
    classify();
    _statistics.report(report);
    _cells.report(report, _engine.picture(), passed);
    observe(report);
    setBands(report);
}

void TechnologyReport::observe(const MessageReport& report) {
    bool hasNeighbour = false;
    LeafExtremes& extremes = _extremes[_isByFile ? report.message.input : 0];
    for (const Observation& each : report.observed.observations) {
        const Use& use = useOf(*each.leaf);
        hasNeighbour = hasNeighbour || use.role == Role::NeighbourChannel ||
                       use.role == Role::NeighbourPhysicalCell || use.role == Role::NeighbourLevel;
        if (each.kind != ObservedKind::Number || !std::isfinite(each.number))
            continue;
        extremes.add(each, report.message);
        if (use.role == Role::ServingLevel)
            _cells.addLevel(each.number);
        else if (use.role == Role::ServingQuality)
            _cells.addQuality(each.number);
        if (!use.series)
            continue;
        if (use.series->isNeighbour)
            addNeighbour(*use.series, each.number);
        else
            use.series->buckets.add(report.time, each.number, report.message);
    }
    for (ChartedLeaf* const series : _neighbourSeries) {
        if (hasNeighbour)
            series->buckets.add(report.time, *series->best, report.message);
        series->best.reset();
    }
    _neighbourSeries.clear();
    if (hasNeighbour)
        _neighbours.report(report, _engine.picture());
}

void TechnologyReport::addNeighbour(ChartedLeaf& series, double value) {
    if (!series.best)
        _neighbourSeries.push_back(&series);
    series.best = series.best ? std::max(*series.best, value) : value;
}

void TechnologyReport::classify() {
    const RadioPicture& picture = _engine.picture();
    const Reading* const level = picture.find(Role::ServingLevel);
    const std::optional<double> value = level ? std::optional(level->number) : std::nullopt;
    const std::optional<RadioTechnology> technology = picture.technology();
    if (value == _classLevel && technology == _classTechnology)
        return;
    _classLevel = value;
    _classTechnology = technology;
    _class = value && _classes ? _classes->of(technology, Role::ServingLevel, *value) : std::nullopt;
}

void TechnologyReport::setBands(const MessageReport& report) {
    const RadioPicture& picture = _engine.picture();
    const auto textOf = [&picture](Role role) -> std::optional<std::string_view> {
        const Reading* const reading = picture.find(role);
        return reading && !reading->text.empty() ? std::optional<std::string_view>(reading->text)
                                                 : std::nullopt;
    };
    const auto nameOfAny = [](const auto& value) {
        return value ? std::optional<std::string_view>(nameOf(*value)) : std::nullopt;
    };
    // Names are compared where the states are others.
    const States states{picture.technology(), picture.mode(), _class};
    if (states != _bandStates) {
        _technologyBand.set(report.time, nameOfAny(states.technology));
        _modeBand.set(report.time, nameOfAny(states.mode));
        _classBand.set(report.time, nameOfAny(states.levelClass));
        _bandStates = states;
    }
    _radioBand.set(report.time, textOf(Role::RadioState));
    _registrationBand.set(report.time, textOf(Role::RegistrationState));
    // By number: what is known of a cell, and so its name, grows while it serves.
    if (_cells.number() == _bandCell)
        return;
    _bandCell = _cells.number();
    if (_bandCell == ServingCells::unknown)
        _cellBand.end(report.time);
    else if (_bandCell == ServingCells::further)
        _cellBand.set(report.time, "further cells");
    else
        _cellBand.set(report.time, std::to_string(_bandCell));
}

void TechnologyReport::forget(Time time) {
    for (StateBand* const band :
         {&_technologyBand, &_classBand, &_modeBand, &_radioBand, &_registrationBand, &_cellBand})
        band->end(time);
    _bandStates = {};
    _cells.interrupt();
    _bandCell = ServingCells::unknown;
    _last.reset();
}

void TechnologyReport::reportUndecoded(MessageNumber message, Time time, Time arrival) {
    ObservedMessage nothing{};
    nothing.number = message.number;
    nothing.arrival = arrival;
    nothing.damage = Damage::Unreadable;
    _engine.report({message, time, nothing});
}

void TechnologyReport::damaged(MessageNumber message, std::string_view reason) {
    _engine.damaged(message, reason);
    _statistics.interrupt();
    if (_last)
        forget(*_last);
}

void TechnologyReport::interrupt() {
    _engine.interrupt();
    _statistics.interrupt();
    if (_last)
        forget(*_last);
}

void TechnologyReport::finish() {
    if (_last)
        forget(*_last);
    _engine.finish();
    _statistics.finish();
    for (ChartedLeaf& each : _series)
        each.buckets.finish();
    std::erase_if(_series, [](const ChartedLeaf& each) { return each.buckets.isEmpty(); });
    _uses.clear(); // which lead to them
    for (std::size_t i = 0; i < _cells.size(); ++i)
        _cellBand.rename(std::to_string(i + 1), nameOf(_cells.identity(i)));
}

std::vector<const StateBand*> TechnologyReport::bands() const {
    std::vector<const StateBand*> bands;
    for (const StateBand* const band :
         {&_technologyBand, &_classBand, &_modeBand, &_radioBand, &_registrationBand, &_cellBand})
        if (!band->isEmpty())
            bands.push_back(band);
    return bands;
}

} // namespace velmora
