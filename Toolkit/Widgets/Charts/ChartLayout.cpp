// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Charts/ChartLayout.h"

#include "Toolkit/Charts/ChartText.h"
#include "Toolkit/Widgets/Conversions.h"

#include <algorithm>
#include <cmath>

namespace velmora {

namespace {

constexpr double leastPlot = 24;

/// Of all series' values in view. The columns' alignment may show a little more at the beginning.
Extremes extremesOf(const ChartPanel& panel, const TimeRange& range, double width) {
    const auto more_ns =
        static_cast<std::int64_t>(2 * static_cast<double>(range.length_ns()) / std::max(width, 2.0));
    Extremes result;
    for (const ChartSeries& series : panel.series)
        if (series.samples)
            result.add(series.samples->extremes(range.begin_ns - more_ns, range.end_ns + 1));
    return result;
}

} // namespace

ChartLayout::ChartLayout(const ChartModel& model, const QSizeF& size, const QFont& font, bool isRightToLeft)
    : _digits(font), _isRightToLeft(isRightToLeft), _lineHeight(std::ceil(_digits.metrics().height()) + 2) {
    for (const ChartBand& band : model.bands)
        _laneCount = std::max(_laneCount, std::min<std::size_t>(band.lane, 3) + 1);
    const double marks = model.ticks.empty() ? 0 : _lineHeight;
    const double top = static_cast<double>(_laneCount) * (_lineHeight + 2) + marks;
    const double bottom = _lineHeight + 4;

    // Titles and legends take what they need; the plots share the rest.
    std::vector<double> headers;
    double taken = top + bottom;
    for (const auto& [id, panel] : model.panels()) {
        Panel& place = _panels.emplace_back();
        headers.push_back(placeHeader(model, panel, 0, size.width() - space, place));
        taken += headers.back() + space;
    }
    const auto count = static_cast<double>(std::max<std::size_t>(_panels.size(), 1));
    _preferredHeight = std::ceil(taken + count * std::max(5 * _lineHeight, 80.0));
    const double plotHeight = std::max(std::floor((size.height() - taken) / count), leastPlot);

    const TimeRange shown = model.range();
    double labels = 0;
    double y = top;
    for (std::size_t index = 0; index < _panels.size(); ++index) {
        Panel& place = _panels[index];
        const ChartPanel& panel = model.panels()[index].panel;
        place.title.translate(0, y);
        for (QRectF& entry : place.entries)
            entry.translate(0, y);
        y += headers[index];
        place.plot = QRectF(0, y, 0, plotHeight);
        place.axis = ValueAxis::covering(extremesOf(panel, shown, size.width()), panel.minimum, panel.maximum,
                                         static_cast<std::size_t>(plotHeight / (1.6 * _lineHeight)));
        for (const double mark : place.axis.marks)
            labels = std::max(labels, _digits.width(toQt(chartNumber(mark, place.axis.decimals))));
        y += plotHeight + space;
    }
    // In whole steps, so that the plots keep their width when a label gets a little longer.
    labels = std::ceil((labels + space) / 8) * 8;
    _left = isRightToLeft ? space : labels;
    _width = std::max(std::floor(size.width() - labels - space), 1.0);
    for (Panel& place : _panels) {
        place.plot.setLeft(_left);
        place.plot.setWidth(_width);
    }
    _eventMarks = QRectF(_left, top - marks, _width, marks);
    _timeAxis = QRectF(_left, y - space, _width, bottom);
}

double ChartLayout::placeHeader(const ChartModel& model, const ChartPanel& panel, double top, double width,
                                Panel& place) {
    const QFontMetricsF& metrics = _digits.metrics();
    const QString title = toQt(panel.unit.empty() ? panel.title : panel.title + ", " + panel.unit);
    const double titleWidth = std::min(std::ceil(metrics.horizontalAdvance(title) * 1.1) + 2 * space, width);
    double entry = 0;
    const TimeRange shown = model.range();
    for (const ChartSeries& series : panel.series) {
        double value = _digits.width(QStringLiteral("no value"));
        if (series.samples)
            if (const Extremes all = series.samples->extremes(shown.begin_ns, shown.end_ns + 1);
                !all.isEmpty())
                for (const double end : {all.minimum, all.maximum})
                    value = std::max(value, _digits.width(toQt(chartValue(end, panel.decimals, panel.unit))));
        entry = std::max(entry, swatch + metrics.horizontalAdvance(toQt(series.name)) + value + 4 * space);
    }
    entry = std::clamp(std::ceil(entry / 8) * 8, 1.0, std::max(width, 1.0));
    const std::size_t count = panel.series.size();
    const bool isOneLine = titleWidth + entry * static_cast<double>(count) <= width;
    const auto columns = isOneLine ? std::max<std::size_t>(count, 1)
                                   : std::max<std::size_t>(static_cast<std::size_t>(width / entry), 1);
    const double from = isOneLine ? titleWidth : 0;
    const auto place1 = [&](double x, double y, double itsWidth) {
        return QRectF(space / 2 + (_isRightToLeft ? width - x - itsWidth : x), y, itsWidth, _lineHeight);
    };
    place.title = place1(0, top, titleWidth);
    const double firstLine = isOneLine ? top : top + _lineHeight;
    for (std::size_t index = 0; index < count; ++index)
        place.entries.push_back(place1(from + entry * static_cast<double>(index % columns),
                                       firstLine + _lineHeight * static_cast<double>(index / columns),
                                       entry));
    const std::size_t lines = (count + columns - 1) / columns;
    // Half a line more, since the topmost label of the axis reaches over the plot.
    return firstLine +
           _lineHeight * (static_cast<double>(std::max<std::size_t>(lines, isOneLine ? 1 : 0)) + 0.5);
}

QRectF ChartLayout::lane(std::size_t number) const {
    const auto index = static_cast<double>(std::min<std::size_t>(number, 3));
    return {_left, index * (_lineHeight + 2), _width, _lineHeight};
}

} // namespace velmora
