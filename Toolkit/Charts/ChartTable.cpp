// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Charts/ChartTable.h"

#include "Toolkit/Charts/ChartModel.h"
#include "Toolkit/Charts/ChartText.h"

#include <algorithm>
#include <utility>

namespace velmora {

namespace {

/// The times of all samples in the range, in order, if there are no more than the limit.
std::optional<std::vector<std::int64_t>> allTimes(const ChartModel& model, const TimeRange& range,
                                                  std::size_t limit) {
    std::vector<std::int64_t> times;
    for (const auto& [id, panel] : model.panels())
        for (const ChartSeries& series : panel.series) {
            if (!series.samples)
                continue;
            const std::size_t begin = series.samples->countBefore(range.begin_ns);
            const std::size_t end = series.samples->countBefore(range.end_ns, true);
            if (begin < end && end - begin > limit)
                return std::nullopt;
            for (std::size_t index = begin; index < end; ++index)
                times.push_back(series.samples->entry(index).time_ns);
            std::sort(times.begin(), times.end());
            times.erase(std::unique(times.begin(), times.end()), times.end());
            if (times.size() > limit)
                return std::nullopt;
        }
    return times;
}

} // namespace

ChartTable ChartModel::table(std::size_t rowLimit) const {
    const TimeRange shown = range();
    rowLimit = std::max<std::size_t>(rowLimit, 1);
    ChartTable result;
    result.columns.emplace_back("Time");
    for (const auto& [id, panel] : _panels)
        for (const ChartSeries& series : panel.series)
            result.columns.push_back(panel.title + ", " + series.name +
                                     (panel.unit.empty() ? "" : " (" + panel.unit + ')'));
    std::optional<std::vector<std::int64_t>> times = allTimes(*this, shown, rowLimit);
    result.isThinned = !times;
    if (!times) {
        times.emplace();
        const auto count = static_cast<std::int64_t>(rowLimit);
        for (std::int64_t row = 1; row <= count; ++row)
            times->push_back(shown.end_ns - shown.length_ns() / count * (count - row));
    }
    const bool isFine = shown.length_ns() < 60 * TimeWindow::second_ns;
    result.times_ns = std::move(*times);
    for (const std::int64_t time_ns : result.times_ns) {
        std::vector<std::string>& row = result.rows.emplace_back();
        row.push_back(chartTime(time_ns, isFine));
        for (const auto& [id, panel] : _panels)
            for (const ChartSeries& series : panel.series) {
                const auto sample = series.samples ? series.samples->at(time_ns) : std::nullopt;
                row.push_back(sample ? chartNumber(sample->value, panel.decimals) : "no value");
            }
    }
    return result;
}

} // namespace velmora
