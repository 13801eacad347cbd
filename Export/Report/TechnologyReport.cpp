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
      _isByFile(groups.plan().by == StatisticsPlan::By::File), _events(events) {}

const TechnologyReport::Use& TechnologyReport::useOf(const CatalogueField& leaf) {
    if (leaf.index >= _uses.size())
        _uses.resize(leaf.index + 1);
    Use& use = _uses[leaf.index];
    if (!use.isKnown) {
        use.isKnown = true;
        use.role = leaf.role;
        const ReportChart chart = chartOf(leaf);
        for (std::uint32_t group = 0; chart != ReportChart::None && group < (_isByFile ? 2 : 1); ++group)
            use.series[group] = &_series.emplace_back(
                ChartedLeaf{&leaf, chart, isNeighbour(leaf), _isByFile ? std::optional(group) : std::nullopt,
                            SeriesBuckets()});
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

void TechnologyReport::beginInput() {
    if (_isByFile && _last)
        endBands(*_last);
    _lastMessage.reset();
    // Of files that follow each other the first has what there was at the start.
    if (_isByFile || _startContexts.empty())
        _startContexts.emplace_back(catalogue(), _events);
}

void TechnologyReport::report(const MessageReport& report) {
    if (!_lastMessage || _lastMessage->input != report.message.input)
        beginInput();
    const std::chrono::nanoseconds passed = pass(report.time);
    if (passed.count() > 0) {
        MessageRange messages;
        messages.add(_lastMessage.value_or(report.message));
        messages.add(report.message);
        _shares[groupOf(report.message)].add(_engine.picture().technology(), _class, passed, messages);
    }
    _lastMessage = report.message;
    _engine.report(report);
    _startContexts.back().report(report, _engine.picture());
    classify();
    _statistics.report(report);
    _cells.report(report, _engine.picture(), passed);
    observe(report);
    setBands(report);
}

void TechnologyReport::observe(const MessageReport& report) {
    bool hasNeighbour = false;
    const std::size_t group = groupOf(report.message);
    LeafExtremes& extremes = _extremes[group];
    for (const Observation& each : report.observed.observations) {
        const Use& use = useOf(*each.leaf);
        hasNeighbour = hasNeighbour || use.role == Role::NeighbourChannel ||
                       use.role == Role::NeighbourPhysicalCell || use.role == Role::NeighbourLevel;
        if (each.kind != ObservedKind::Absent)
            extremes.addMessage(each, report.message);
        if (each.kind != ObservedKind::Number || !std::isfinite(each.number))
            continue;
        extremes.add(each, report.message);
        if (use.role == Role::ServingLevel)
            _cells.addLevel(each.number);
        else if (use.role == Role::ServingQuality)
            _cells.addQuality(each.number);
        ChartedLeaf* const series = use.series[group];
        if (!series)
            continue;
        if (series->isNeighbour)
            addNeighbour(*series, each.number);
        else
            series->buckets.add(report.time, each.number, report.message);
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
    Bands& bands = _bands[groupOf(report.message)];
    // Names are compared where the states are others.
    const States states{picture.technology(), picture.mode(), _class};
    if (states != bands.states) {
        bands.technology.set(report.time, nameOfAny(states.technology));
        bands.mode.set(report.time, nameOfAny(states.mode));
        bands.levelClass.set(report.time, nameOfAny(states.levelClass));
        bands.states = states;
    }
    bands.radio.set(report.time, textOf(Role::RadioState));
    bands.registration.set(report.time, textOf(Role::RegistrationState));
    // By number: what is known of a cell, and so its name, grows while it serves.
    if (_cells.number() == _bandCell)
        return;
    _bandCell = _cells.number();
    if (_bandCell == ServingCells::unknown)
        bands.cell.end(report.time);
    else if (_bandCell == ServingCells::further)
        bands.cell.set(report.time, "further cells");
    else
        bands.cell.set(report.time, std::to_string(_bandCell));
}

void TechnologyReport::endBands(Time time) {
    for (Bands& bands : _bands) {
        for (StateBand* const band : bands.all())
            band->end(time);
        bands.states = {};
    }
    _bandCell = ServingCells::unknown;
}

void TechnologyReport::forget(Time time) {
    endBands(time);
    _cells.interrupt();
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
    for (Bands& bands : _bands)
        for (std::size_t i = 0; i < _cells.size(); ++i)
            bands.cell.rename(std::to_string(i + 1), nameOf(_cells.identity(i)));
}

std::vector<TechnologyReport::ShownBand> TechnologyReport::bands() const {
    std::vector<ShownBand> shown;
    for (std::uint32_t group = 0; group < _bands.size(); ++group) {
        const Bands& bands = _bands[group];
        for (const StateBand* const band : {&bands.technology, &bands.levelClass, &bands.mode, &bands.radio,
                                            &bands.registration, &bands.cell})
            if (!band->isEmpty())
                shown.push_back({band, _isByFile ? std::optional(group) : std::nullopt});
    }
    return shown;
}

} // namespace velmora
