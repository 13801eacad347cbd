// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// What lies along the axis of time: its marks, bands, events and the cursor.

#include "Toolkit/Charts/ChartText.h"
#include "Toolkit/Charts/TimeAxis.h"
#include "Toolkit/Widgets/Charts/ChartPainter.h"
#include "Toolkit/Widgets/Charts/SeriesPainter.h"
#include "Toolkit/Widgets/Conversions.h"

#include <QPainter>

#include <algorithm>
#include <cmath>
#include <map>

namespace velmora {

namespace {

constexpr double eventMark = 9;
constexpr double near = 6;

} // namespace

void ChartPainter::drawBands() {
    const TimeRange shown = _scale.range();
    for (const ChartBand& band : _model.bands) {
        const std::int64_t end_ns =
            std::min(band.end_ns.value_or(std::max(_model.window.now_ns(), band.begin_ns)), shown.end_ns);
        const std::int64_t begin_ns = std::max(band.begin_ns, shown.begin_ns);
        if (begin_ns >= end_ns)
            continue;
        QRectF area = _layout.lane(band.lane);
        area.setLeft(_scale.xAt(begin_ns));
        area.setRight(_scale.xAt(end_ns));
        _painter.fillRect(area, _theme.band(band.color));
        _painter.fillRect(QRectF(area.left(), area.top(), 2, area.height()), _theme.line(band.color));
        _painter.setPen(_theme.text());
        const QRectF text = area.adjusted(6, 0, -2, 0);
        if (text.width() >= _digits.metrics().averageCharWidth() * 2)
            drawLine(text, toQt(band.label), leading());
    }
}

void ChartPainter::drawTimeAxis() {
    const TimeRange shown = _scale.range();
    const bool isFine = shown.length_ns() < 10 * TimeWindow::second_ns;
    const double label = _digits.width(isFine ? QStringLiteral("00:00:00.000") : QStringLiteral("00:00:00"));
    const TimeAxis axis = TimeAxis::covering(
        shown, static_cast<std::size_t>(_layout.width() / (label + 3 * ChartLayout::space)));
    const QRectF& place = _layout.timeAxis();
    const double base = place.top() + 4 + _digits.metrics().ascent();
    for (const TimeAxis::Mark& mark : axis.marks) {
        const double x = std::round(_scale.xAt(mark.time_ns)) + 0.5;
        _painter.setPen(QPen(_theme.grid(), 1));
        for (const ChartLayout::Panel& panel : _layout.panels())
            _painter.drawLine(QPointF(x, panel.plot.top()), QPointF(x, panel.plot.bottom()));
        const QString text = toQt(mark.label);
        const double width = _digits.width(text);
        if (x - width / 2 < 0 || x + width / 2 > place.right() + ChartLayout::space)
            continue;
        _painter.setPen(_theme.faintText());
        _digits.draw(_painter, {x - width / 2, base}, text);
    }
}

void ChartPainter::drawEvents() {
    const TimeRange shown = _scale.range();
    const auto time = [](const ChartTick& tick, std::int64_t time_ns) { return tick.time_ns < time_ns; };
    const auto begin = std::lower_bound(_model.ticks.begin(), _model.ticks.end(), shown.begin_ns, time);
    const auto end = std::lower_bound(begin, _model.ticks.end(), shown.end_ns, time);
    // Of events at one place the gravest is drawn.
    std::map<int, ChartSeverity> places;
    for (auto tick = begin; tick != end; ++tick) {
        const auto [place, isNew] =
            places.try_emplace(static_cast<int>(std::floor(_scale.xAt(tick->time_ns))), tick->severity);
        if (!isNew)
            place->second = std::max(place->second, tick->severity);
    }
    _painter.setRenderHint(QPainter::Antialiasing);
    for (int grade = 0; grade <= static_cast<int>(ChartSeverity::critical); ++grade)
        for (const auto& [x, severity] : places) {
            if (static_cast<int>(severity) != grade)
                continue;
            const QColor color = _theme.mark(severity);
            _painter.setPen(QPen(color, 1, Qt::DotLine));
            for (const ChartLayout::Panel& panel : _layout.panels())
                _painter.drawLine(QPointF(x + 0.5, panel.plot.top()), QPointF(x + 0.5, panel.plot.bottom()));
            _painter.setPen(QPen(_theme.ground(), 1));
            _painter.setBrush(color);
            drawEventMark(_painter, severity, {x + 0.5, _layout.eventMarks().center().y()}, eventMark);
        }
}

void ChartPainter::drawCursor() {
    if (!_model.cursor_ns || !_scale.range().contains(*_model.cursor_ns))
        return;
    const double x = std::floor(_scale.xAt(*_model.cursor_ns)) + 0.5;
    _painter.setRenderHint(QPainter::Antialiasing);
    for (std::size_t index = 0; index < _layout.panels().size(); ++index) {
        const ChartLayout::Panel& place = _layout.panels()[index];
        _painter.setPen(QPen(_theme.text(), 1));
        _painter.drawLine(QPointF(x, place.plot.top()), QPointF(x, place.plot.bottom()));
        for (const ChartSeries& series : _model.panels()[index].panel.series) {
            const auto sample = series.samples ? series.samples->at(*_model.cursor_ns) : std::nullopt;
            if (!sample || sample->value < place.axis.minimum || sample->value > place.axis.maximum)
                continue;
            _painter.setPen(QPen(_theme.ground(), 1));
            _painter.setBrush(_theme.line(series.color));
            _painter.drawEllipse(QPointF(_scale.xAt(sample->time_ns),
                                         SeriesPainter::yAt(sample->value, place.plot, place.axis)),
                                 4, 4);
        }
    }
    drawCursorTime(x);
    drawEventText(x);
}

void ChartPainter::drawCursorTime(double x) {
    const bool isFine = _scale.range().length_ns() < 60 * TimeWindow::second_ns;
    const QString text = toQt(chartTime(*_model.cursor_ns, isFine));
    const QRectF& axis = _layout.timeAxis();
    const double width = _digits.width(text) + ChartLayout::space;
    const double most = std::max(axis.right() + ChartLayout::space - width, 0.0);
    const QRectF box(std::clamp(x - width / 2, 0.0, most), axis.top() + 3, width, axis.height() - 3);
    _painter.setPen(Qt::NoPen);
    _painter.setBrush(_theme.text());
    _painter.drawRoundedRect(box, 3, 3);
    _painter.setPen(_theme.ground());
    _digits.draw(_painter, {box.left() + ChartLayout::space / 2, axis.top() + 4 + _digits.metrics().ascent()},
                 text);
}

void ChartPainter::drawEventText(double x) {
    const ChartTick* nearest = nullptr;
    for (const ChartTick& tick : _model.ticks) {
        const double distance = std::abs(_scale.xAt(tick.time_ns) - x);
        if (distance <= near && (!nearest || distance <= std::abs(_scale.xAt(nearest->time_ns) - x)))
            nearest = &tick;
    }
    if (!nearest)
        return;
    const QRectF& strip = _layout.eventMarks();
    const QString text = escapedLine(toQt(nearest->text));
    const double width =
        std::min(_digits.metrics().horizontalAdvance(text) + ChartLayout::space, strip.width());
    // Beside the mark, where there is more room.
    const bool isLeft = x > strip.center().x();
    const double from = isLeft ? std::max(x - eventMark - width, strip.left())
                               : std::min(x + eventMark, strip.right() - width);
    const QRectF box(from, strip.top(), width, strip.height());
    _painter.fillRect(box, _theme.ground());
    _painter.setPen(_theme.text());
    drawLine(box.adjusted(2, 0, -2, 0), text, Qt::AlignLeft | Qt::AlignVCenter);
}

} // namespace velmora
