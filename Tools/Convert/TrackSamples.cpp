// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Convert/TrackSamples.h"

#include "LogGenerator/Fields/Unit.h"
#include "Platform/TimeSpan.h"

#include <algorithm>
#include <utility>

namespace velmora {

void TrackSamples::add(const MessageReport& report, CountedLeaves& leaves, ObservedText& texts) {
    for (const Observation& observation : report.observed.observations) {
        const CountedLeaf& use = leaves.of(*observation.leaf);
        if (!use.counts(observation))
            continue;
        Series& series = seriesOf(*observation.leaf, use.name);
        if (std::exchange(series.message, report.message.number) == report.message.number)
            continue;
        TrackData::Value value;
        if (observation.kind == ObservedKind::Number)
            value = observation.number;
        else if (observation.kind != ObservedKind::Absent)
            value = std::string(texts.of(observation));
        series.samples.push_back({report.time, std::move(value)});
    }
}

TrackSamples::Series& TrackSamples::seriesOf(const CatalogueField& leaf, const std::string& name) {
    const std::string& shown = name.empty() ? leaf.path : name;
    const auto found = std::find_if(_series.begin(), _series.end(),
                                    [&](const Series& each) { return each.attribute.name == shown; });
    if (found != _series.end())
        return *found;
    return _series.emplace_back(Series{{shown, std::string(nameOf(leaf.unit))}, 0, {}});
}

std::vector<TrackData::Attribute> TrackSamples::attributes() const {
    std::vector<TrackData::Attribute> attributes;
    for (const Series& series : _series)
        attributes.push_back(series.attribute);
    return attributes;
}

std::vector<TrackData::Value> TrackSamples::valuesAt(Time time) const {
    std::vector<TrackData::Value> values;
    for (const Series& series : _series) {
        const auto after =
            std::upper_bound(series.samples.begin(), series.samples.end(), time,
                             [](Time moment, const Sample& sample) { return moment < sample.time; });
        const bool isFresh =
            after != series.samples.begin() && timeSpan(std::prev(after)->time, time) <= maximumAge;
        values.push_back(isFresh ? std::prev(after)->value : TrackData::Value());
    }
    return values;
}

} // namespace velmora
