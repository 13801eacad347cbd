// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// What a chart says instead of being seen.

#include "Toolkit/Charts/ChartModel.h"
#include "Toolkit/Charts/ChartText.h"

namespace velmora {

namespace {

std::string gapText(std::size_t count) {
    if (count == 0)
        return {};
    return ", " + std::to_string(count) + (count == 1 ? " gap" : " gaps");
}

} // namespace

std::string ChartModel::summary() const {
    const TimeRange shown = range();
    const std::string span = chartDuration(std::chrono::nanoseconds(shown.length_ns()));
    std::string result;
    for (const auto& [id, panel] : _panels)
        for (const ChartSeries& series : panel.series) {
            if (!series.samples)
                continue;
            const std::optional<Sample> last = series.samples->at(shown.end_ns);
            const Extremes extremes = series.samples->extremes(shown.begin_ns, shown.end_ns + 1);
            result += result.empty() ? "" : ". ";
            result +=
                panel.title + ", " + series.name + ", " +
                chartValue(last ? std::optional(last->value) : std::nullopt, panel.decimals, panel.unit);
            result += window.isFollowing() ? " now" : " at the end";
            if (extremes.isEmpty())
                result += ", nothing over " + span;
            else
                result += ", minimum " + chartNumber(extremes.minimum, panel.decimals) + ", maximum " +
                          chartNumber(extremes.maximum, panel.decimals) + " over " + span +
                          gapText(series.samples->gapCount(shown.begin_ns, shown.end_ns + 1));
        }
    return result;
}

std::string ChartModel::spokenReadings(std::int64_t time_ns) const {
    std::string result = chartTime(time_ns, range().length_ns() < 60 * TimeWindow::second_ns);
    std::string panel;
    for (const ChartReading& reading : readings(time_ns)) {
        result += ", ";
        if (reading.panel != panel)
            result += reading.panel + ", ";
        panel = reading.panel;
        result += reading.series + ' ' + reading.text;
    }
    return result;
}

} // namespace velmora
