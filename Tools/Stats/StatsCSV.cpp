// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Stats/StatsCSV.h"

#include "Analysis/Statistics/NumberFigures.h"
#include "Tools/Decode/Samples/SampleText.h"
#include "Tools/Output.h"
#include "Tools/Stats/GroupText.h"

namespace velmora {

namespace {

constexpr std::string_view header =
    "technology,path,role,unit,samples,absent,minimum,p5,p50,p95,maximum,mean,state,"
    "seconds,share,worst_minute";
/// The columns of numbers.
constexpr std::string_view noNumbers = ",,,,,,";

} // namespace

void StatsCSV::begin() {
    const std::string_view group = groupColumn(_options.by);
    if (!group.empty())
        _output.put(std::string(group) + ",");
    _output.put(header);
    _output.put(csvRowEnd);
}

void StatsCSV::write(const GroupStatistics& group) {
    _rows.clear();
    if (!groupColumn(_options.by).empty())
        appendCsvText(_rows, groupCell(group, _options), _options.guard);
    _group = _rows.view();
    _rows.clear();
    for (const RoleStatistics& role : rolesOf(group)) {
        writeNumbers({group.key.technology, {}, nameOf(role.role), role.unit}, role.numbers, role.absent);
        _rows.append(",,,"); // a state's columns
        appendCell(role.worst ? minuteStamp(role.worst->begin) : std::string());
        _rows.append(csvRowEnd);
    }
    for (const auto& part : group.parts)
        for (const auto& leaf : part->leaves) {
            if (!leaf)
                continue;
            const Place place{part->technology, leaf->name.empty() ? leaf->leaf.path : leaf->name,
                              nameOf(leaf->leaf.role), leaf->leaf.unit};
            if (leaf->hasNumbers()) {
                writeNumbers(place, leaf->numbers, leaf->absent);
                _rows.append(",,,,"); // a state's columns and the worst minute
                _rows.append(csvRowEnd);
            }
            if (leaf->hasStates())
                writeStates(place, *leaf);
        }
    _output.put(_rows.view());
    _output.flush();
}

void StatsCSV::beginRow(const Place& place) {
    if (!_group.empty()) {
        _rows.append(_group);
        _rows.append(',');
    }
    // The first cell has no comma before it.
    if (!place.technology.empty())
        appendCsvText(_rows, place.technology, _options.guard);
    appendCell(place.path);
    appendCell(place.role);
    appendCell(nameOf(place.unit));
}

void StatsCSV::writeNumbers(const Place& place, const ValueCounts& numbers, std::uint64_t absent) {
    const NumberFigures figures(numbers);
    beginRow(place);
    appendCell(figures.samples);
    appendCell(absent);
    for (const std::optional<double>& figure :
         {figures.minimum, figures.p5, figures.p50, figures.p95, figures.maximum, figures.mean})
        appendCell(figure);
}

void StatsCSV::writeStates(const Place& place, const LeafStatistics& leaf) {
    const StateCounts& states = leaf.states;
    const std::chrono::nanoseconds known = states.time();
    const auto write = [&](const StateCounts::Value& value, std::string_view text) {
        beginRow(place);
        appendCell(value.samples);
        appendCell(leaf.absent);
        _rows.append(noNumbers);
        appendCell(text);
        const bool hasTime = !leaf.isInList();
        appendCell(hasTime ? std::optional(static_cast<double>(value.time.count()) / 1e9) : std::nullopt);
        appendCell(hasTime && known.count() != 0 ? std::optional(static_cast<double>(value.time.count()) /
                                                                 static_cast<double>(known.count()))
                                                 : std::nullopt);
        _rows.append(',');
        _rows.append(csvRowEnd);
    };
    for (const StateCounts::Value& each : states.values())
        write(each, each.text);
    if (states.hasOthers())
        write(states.at(StateCounts::others), "(others)");
    if (states.values().empty())
        write({}, {});
}

void StatsCSV::appendCell(std::string_view text) {
    _rows.append(',');
    if (!text.empty())
        appendCsvText(_rows, text, _options.guard);
}

void StatsCSV::appendCell(const std::optional<double>& number) {
    _rows.append(',');
    if (number)
        appendNumber(_rows, *number);
}

void StatsCSV::appendCell(std::uint64_t count) {
    _rows.append(',');
    appendNumber(_rows, count);
}

} // namespace velmora
