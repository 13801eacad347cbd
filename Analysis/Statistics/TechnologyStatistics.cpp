// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Statistics/TechnologyStatistics.h"

#include "Analysis/Statistics/ClockMinute.h"

#include <algorithm>
#include <utility>

namespace velmora {

namespace {

/// The begin of the next minute; absent at the end of all times.
std::optional<Time> nextMinute(Time time) {
    const Time begin = minuteOf(time);
    constexpr std::chrono::minutes minute{1};
    return begin > Time::max() - minute ? std::nullopt : std::optional<Time>(begin + minute);
}

bool isNumbered(const std::optional<std::uint32_t>& cell) {
    return cell && *cell != ServingCells::unknown && *cell != ServingCells::further;
}

} // namespace

TechnologyStatistics::TechnologyStatistics(const Catalogue& catalogue, StatisticsGroups& groups)
    : _catalogue(catalogue), _groups(groups), _picture(catalogue), _leaves(groups.plan().leaves) {}

bool TechnologyStatistics::wants(const CatalogueField& leaf) const {
    return _groups.plan().leaves.choose(leaf) || (has(StatisticsPlan::By::Cell) && _picture.wants(leaf));
}

void TechnologyStatistics::report(const MessageReport& report) {
    Time time = report.time;
    if (_now &&
        (durationBetween(*_now, time) > longestSilence || durationBetween(time, *_now) > largestStepBack))
        interrupt();
    if (_now) {
        time = std::max(*_now, time);
        pass(time);
    }
    _now = time;
    _input = report.message.input;
    if (has(StatisticsPlan::By::Cell)) {
        _picture.update(report);
        _cell = _cells.numberOf(_picture);
    }
    if (has(StatisticsPlan::By::Square))
        _cell = numberOf(_groups.plan().square());
    enter(time);
    if (_part) {
        ++_part->messages;
        _part->first = _part->first.value_or(time);
        _part->last = time;
    }
    for (const Observation& each : report.observed.observations)
        observe(each, time);
    for (const CatalogueField* const leaf : report.observed.removed)
        _held.withdraw(*leaf, time);
}

void TechnologyStatistics::finish() {
    interrupt();
    if (_group)
        name(*_group);
}

std::uint32_t TechnologyStatistics::numberOf(const std::optional<Square>& square) {
    if (!square)
        return ServingCells::unknown;
    const auto found = _squares.find(*square);
    if (found != _squares.end())
        return found->second;
    if (_squares.size() == mostSquares)
        return ServingCells::further;
    _squaresByNumber.push_back(*square);
    return _squares[*square] = static_cast<std::uint32_t>(_squaresByNumber.size());
}

void TechnologyStatistics::name(GroupStatistics& group) const {
    if (!isNumbered(group.key.cell))
        return;
    group.cell = has(StatisticsPlan::By::Square) ? nameOf(_squaresByNumber[*group.key.cell - 1])
                                                 : nameOf(_cells.identity(*group.key.cell));
}

void TechnologyStatistics::interrupt() {
    if (!_now)
        return;
    _held.forget(*_now);
    _picture.clear();
    _cell = ServingCells::unknown;
    _now.reset();
}

void TechnologyStatistics::pass(Time time) {
    for (;;) {
        std::optional<Time> next;
        const auto consider = [&](Time boundary) {
            if (boundary > *_now && boundary <= time && (!next || boundary < *next))
                next = boundary;
        };
        if (_counted.from)
            consider(*_counted.from);
        if (_counted.to)
            consider(*_counted.to);
        if (has(StatisticsPlan::By::Minute))
            if (const std::optional<Time> minute = nextMinute(*_now))
                consider(*minute);
        if (!next)
            return;
        _now = *next;
        enter(*next);
    }
}

void TechnologyStatistics::enter(Time time) {
    const bool counts = _counted.contains(time);
    const Time minute = has(StatisticsPlan::By::Minute) ? minuteOf(time) : Time();
    const std::uint32_t input = has(StatisticsPlan::By::File) ? _input : 0;
    if (counts == _place.counts && minute == _place.minute && input == _place.input && _cell == _place.cell)
        return;
    _place = {counts, input, minute, _cell};
    GroupStatistics* const earlier = _group;
    _group = counts ? &_groups.of(keyOf(_place)) : nullptr;
    _part = _group ? &_group->partOf(_catalogue.technology()) : nullptr;
    _leaves.forgetStatistics();
    if (earlier)
        name(*earlier);
    if (_part && !_groups.plan().leaves.isEverything())
        for (const CatalogueField& leaf : _catalogue.fields())
            if (CountedLeaf& use = _leaves.of(leaf); use.isChosen)
                static_cast<void>(statisticsOf(leaf, use));
    _held.moveTo(
        [this](const CatalogueField& leaf) {
            LeafStatistics* const statistics = statisticsOf(leaf, _leaves.of(leaf));
            return statistics ? &statistics->states : nullptr;
        },
        time);
    if (earlier && has(StatisticsPlan::By::Minute))
        _groups.complete(*earlier);
}

GroupKey TechnologyStatistics::keyOf(const Place& place) const {
    GroupKey key;
    if (!has(StatisticsPlan::By::Nothing) && !has(StatisticsPlan::By::File))
        key.technology = _catalogue.technology();
    if (has(StatisticsPlan::By::File))
        key.input = place.input;
    if (has(StatisticsPlan::By::Cell) || has(StatisticsPlan::By::Square))
        key.cell = place.cell;
    if (has(StatisticsPlan::By::Minute))
        key.minute = place.minute;
    return key;
}

void TechnologyStatistics::observe(const Observation& observation, Time time) {
    const CatalogueField& leaf = *observation.leaf;
    CountedLeaf& use = _leaves.of(leaf);
    if (!use.counts(observation))
        return;
    LeafStatistics* const statistics = statisticsOf(leaf, use);
    if (_part && !statistics)
        ++_part->omitted;
    const bool isInList = !observation.rows.empty();
    const bool isNumber = observation.kind == ObservedKind::Number;
    if (!isInList && (isNumber || observation.kind == ObservedKind::Absent) && _held.holds(leaf))
        _held.withdraw(leaf, time);
    if (isNumber) {
        if (!statistics)
            return;
        statistics->numbers.add(observation.number);
        if (use.measure && !has(StatisticsPlan::By::Minute))
            minutesOf(leaf.role, *use.measure).add(time, observation.number);
    } else if (observation.kind == ObservedKind::Absent) {
        if (statistics)
            ++statistics->absent;
    } else if (!isInList) {
        _held.report(observation, statistics ? &statistics->states : nullptr, time);
    } else if (statistics) {
        statistics->states.addSample(statistics->states.indexOf(observation, _texts));
    }
}

WorstMinute& TechnologyStatistics::minutesOf(Role role, WorstMinute::Measure measure) {
    std::unique_ptr<WorstMinute>& minutes = _part->minutes[static_cast<std::size_t>(role)];
    if (!minutes)
        minutes = std::make_unique<WorstMinute>(measure);
    return *minutes;
}

} // namespace velmora
