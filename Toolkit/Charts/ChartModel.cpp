// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Charts/ChartModel.h"

#include "Toolkit/Charts/ChartText.h"

#include <algorithm>
#include <cstdlib>
#include <utility>

namespace velmora {

namespace {

template <class Visit>
void forEachRing(const std::vector<ChartModel::Entry>& panels, Visit visit) {
    for (const auto& [id, panel] : panels)
        for (const ChartSeries& series : panel.series)
            if (series.samples)
                visit(*series.samples);
}

} // namespace

ChartModel::PanelId ChartModel::addPanel(ChartPanel panel) {
    _panels.push_back({++_lastId, std::move(panel)});
    return _lastId;
}

bool ChartModel::setPanel(PanelId id, ChartPanel panel) {
    const auto found =
        std::find_if(_panels.begin(), _panels.end(), [id](auto& entry) { return entry.id == id; });
    if (found == _panels.end())
        return false;
    found->panel = std::move(panel);
    _seen.clear();
    return true;
}

bool ChartModel::removePanel(PanelId id) {
    _seen.clear();
    return std::erase_if(_panels, [id](const Entry& entry) { return entry.id == id; }) != 0;
}

std::optional<std::int64_t> ChartModel::oldest_ns() const {
    std::optional<std::int64_t> oldest;
    forEachRing(_panels, [&oldest](const SampleRing& ring) {
        if (const auto of = ring.oldest_ns(); of && (!oldest || *of < *oldest))
            oldest = of;
    });
    return oldest;
}

std::vector<ChartReading> ChartModel::readings(std::int64_t time_ns) const {
    std::vector<ChartReading> result;
    for (const auto& [id, panel] : _panels)
        for (const ChartSeries& series : panel.series) {
            ChartReading reading{panel.title, series.name, {}, {}};
            if (series.samples)
                reading.sample = series.samples->at(time_ns);
            reading.text = chartValue(reading.sample ? std::optional(reading.sample->value) : std::nullopt,
                                      panel.decimals, panel.unit);
            result.push_back(std::move(reading));
        }
    return result;
}

std::optional<std::int64_t> ChartModel::stepped(std::int64_t from_ns, int samples) const {
    std::optional<std::int64_t> reached;
    for (int step = 0; step < std::abs(samples); ++step) {
        std::optional<std::int64_t> next;
        forEachRing(_panels, [&](const SampleRing& ring) {
            const std::int64_t here_ns = reached.value_or(from_ns);
            const std::optional<Sample> found = samples > 0 ? ring.after(here_ns) : ring.before(here_ns);
            if (found && (!next || (samples > 0 ? found->time_ns < *next : found->time_ns > *next)))
                next = found->time_ns;
        });
        if (!next)
            break;
        reached = next;
    }
    return reached;
}

std::optional<std::int64_t> ChartModel::nearest(std::int64_t time_ns, std::int64_t within_ns) const {
    const auto before = stepped(time_ns + 1, -1);
    const auto after = stepped(time_ns, 1);
    auto result = before;
    if (after && (!before || *after - time_ns < time_ns - *before))
        result = after;
    return result && std::abs(*result - time_ns) <= within_ns ? result : std::nullopt;
}

bool ChartModel::takeChanges(const TimeRange& range) {
    bool isChanged = false;
    forEachRing(_panels, [&](const SampleRing& ring) {
        Seen& seen = _seen[&ring];
        const std::uint64_t revision = ring.revision();
        if (revision == seen.revision)
            return;
        // What was added since lies after what was newest, and what was dropped before what is oldest now;
        // the line to the first new sample begins at the one before it.
        const Seen now{revision, ring.oldest_ns(), ring.newest_ns()};
        const bool isLonger = now.newest_ns && seen.newest_ns && *now.newest_ns >= *seen.newest_ns &&
                              seen.oldest_ns && *now.oldest_ns >= *seen.oldest_ns;
        const bool isLengthenedInside = isLonger && *seen.newest_ns <= range.end_ns &&
                                        *now.newest_ns >= range.begin_ns - ring.gapLimit_ns();
        const bool isShortenedInside =
            isLonger && *now.oldest_ns != *seen.oldest_ns && *now.oldest_ns >= range.begin_ns;
        isChanged = isChanged || !isLonger || isLengthenedInside || isShortenedInside;
        seen = now;
    });
    return isChanged;
}

} // namespace velmora
