// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Charts/ChartPainter.h"

#include "Toolkit/Charts/ChartText.h"
#include "Toolkit/Widgets/Charts/SeriesPainter.h"
#include "Toolkit/Widgets/Conversions.h"

#include <QPainter>

#include <algorithm>
#include <cmath>

namespace velmora {

ChartPainter::ChartPainter(QPainter& painter, const ChartModel& model, const ChartLayout& layout,
                           const ChartScale& scale, const ChartTheme& theme)
    : _painter(painter), _model(model), _layout(layout), _scale(scale), _theme(theme),
      _digits(layout.digits()) {}

void ChartPainter::draw() {
    _painter.setLayoutDirection(Qt::LeftToRight); // places are mirrored by the layout; numbers never are
    drawBands();
    drawTimeAxis();
    for (std::size_t index = 0; index < _layout.panels().size(); ++index)
        drawPanel(index);
    drawEvents();
    drawCursor();
}

Qt::Alignment ChartPainter::leading() const {
    return (_layout.isRightToLeft() ? Qt::AlignRight : Qt::AlignLeft) | Qt::AlignVCenter;
}

void ChartPainter::drawLine(const QRectF& place, const QString& text, Qt::Alignment alignment) {
    const QString line = escapedLine(text);
    const bool fits = _digits.metrics().horizontalAdvance(line) <= place.width();
    _painter.drawText(place, static_cast<int>(alignment) | Qt::TextSingleLine,
                      fits ? line : _digits.metrics().elidedText(line, Qt::ElideRight, place.width()));
}

void ChartPainter::drawPanel(std::size_t index) {
    const ChartPanel& panel = _model.panels()[index].panel;
    const ChartLayout::Panel& place = _layout.panels()[index];
    drawValueAxis(panel, place);
    SeriesPainter lines(_painter, _scale, _theme.ground());
    for (const ChartSeries& series : panel.series)
        lines.draw(series, _theme.line(series.color), place.plot, place.axis);
    drawLegend(panel, place);
}

void ChartPainter::drawLegend(const ChartPanel& panel, const ChartLayout::Panel& place) {
    const bool isMirrored = _layout.isRightToLeft();
    QFont bold = _painter.font();
    bold.setBold(true);
    _painter.save();
    _painter.setFont(bold);
    _painter.setPen(_theme.text());
    drawLine(place.title, toQt(panel.unit.empty() ? panel.title : panel.title + ", " + panel.unit),
             leading());
    _painter.restore();
    const std::int64_t time_ns = _model.readingTime_ns();
    for (std::size_t index = 0; index < panel.series.size(); ++index) {
        const ChartSeries& series = panel.series[index];
        const QRectF& entry = place.entries[index];
        const double middle = entry.center().y();
        const double from = isMirrored ? entry.right() - ChartLayout::swatch : entry.left();
        const double length = ChartLayout::swatch - ChartLayout::space;
        const double begin = isMirrored ? from + ChartLayout::space : from;
        const QColor color = _theme.line(series.color);
        _painter.setPen(SeriesPainter::pen(series.line, color));
        _painter.drawLine(QPointF(begin, middle), QPointF(begin + length, middle));
        _painter.setPen(Qt::NoPen);
        _painter.setBrush(color);
        drawLineMark(_painter, series.line, QPointF(begin + length / 2, middle), 6);

        const auto sample = series.samples ? series.samples->at(time_ns) : std::nullopt;
        const QString value = toQt(
            chartValue(sample ? std::optional(sample->value) : std::nullopt, panel.decimals, panel.unit));
        const double valueWidth = _digits.width(value);
        QRectF name = entry.adjusted(ChartLayout::swatch, 0, -2 * ChartLayout::space, 0);
        if (isMirrored)
            name = entry.adjusted(2 * ChartLayout::space, 0, -ChartLayout::swatch, 0);
        name.setWidth(std::max(name.width() - valueWidth - ChartLayout::space, 0.0));
        if (isMirrored)
            name.translate(valueWidth + ChartLayout::space, 0);
        _painter.setPen(_theme.faintText());
        drawLine(name, toQt(series.name), leading());
        const double nameWidth =
            std::min(_digits.metrics().horizontalAdvance(escapedLine(toQt(series.name))), name.width());
        const double x = isMirrored ? name.right() - nameWidth - ChartLayout::space - valueWidth
                                    : name.left() + nameWidth + ChartLayout::space;
        _painter.setPen(sample ? _theme.text() : _theme.faintText());
        const double base = middle + (_digits.metrics().ascent() - _digits.metrics().descent()) / 2;
        _digits.draw(_painter, {x, base}, value);
    }
}

void ChartPainter::drawValueAxis(const ChartPanel& panel, const ChartLayout::Panel& place) {
    const QRectF& plot = place.plot;
    const double rise = (_digits.metrics().ascent() - _digits.metrics().descent()) / 2;
    for (const double mark : place.axis.marks) {
        const double y = std::round(SeriesPainter::yAt(mark, plot, place.axis)) + 0.5;
        _painter.setPen(QPen(_theme.grid(), 1));
        _painter.drawLine(QPointF(plot.left(), y), QPointF(plot.right(), y));
        const QString text = toQt(chartNumber(mark, place.axis.decimals));
        const double x = _layout.isRightToLeft() ? plot.right() + ChartLayout::space / 2
                                                 : plot.left() - ChartLayout::space / 2 - _digits.width(text);
        _painter.setPen(_theme.faintText());
        _digits.draw(_painter, {x, y + rise}, text);
    }
    for (const ChartLimit& limit : panel.limits) {
        if (limit.value < place.axis.minimum || limit.value > place.axis.maximum)
            continue;
        const double y = std::round(SeriesPainter::yAt(limit.value, plot, place.axis)) + 0.5;
        _painter.setPen(QPen(_theme.faintText(), 1, Qt::DashLine));
        _painter.drawLine(QPointF(plot.left(), y), QPointF(plot.right(), y));
        const double height = _digits.metrics().height();
        const bool isBelow = y - height < plot.top();
        const QRectF text(plot.left() + 4, isBelow ? y : y - height, plot.width() - 8, height);
        drawLine(text, toQt(limit.label),
                 (_layout.isRightToLeft() ? Qt::AlignLeft : Qt::AlignRight) | Qt::AlignVCenter);
    }
}

} // namespace velmora
