// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Charts/SeriesPainter.h"

#include "Toolkit/Widgets/Charts/ChartTheme.h"

#include <QPainter>

#include <algorithm>
#include <cmath>

namespace velmora {

namespace {

constexpr double thickness = 1.6;
constexpr double markSize = 7;
constexpr double markDistance = 96;

/// Lengths of dashes and spaces in points, beginning with a dash.
std::vector<int> dashes(ChartLine line) {
    switch (line) {
    case ChartLine::dashed: return {8, 4};
    case ChartLine::dotted: return {2, 3};
    case ChartLine::dashDotted: return {8, 3, 2, 3};
    case ChartLine::solid: break;
    }
    return {};
}

/// For each point of a period of the pattern whether it is in a dash.
std::vector<bool> dashPoints(ChartLine line) {
    std::vector<bool> points;
    bool isDash = true;
    for (const int length : dashes(line)) {
        points.insert(points.end(), static_cast<std::size_t>(length), isDash);
        isDash = !isDash;
    }
    return points;
}

} // namespace

QPen SeriesPainter::pen(ChartLine line, const QColor& color) {
    QPen pen(color, thickness, Qt::SolidLine, Qt::FlatCap, Qt::BevelJoin);
    const std::vector<int> lengths = dashes(line);
    QList<qreal> pattern;
    for (const int length : lengths)
        pattern.push_back(length / thickness);
    if (!pattern.isEmpty())
        pen.setDashPattern(pattern);
    return pen;
}

double SeriesPainter::yAt(double value, const QRectF& plot, const ValueAxis& axis) {
    const double share = (value - axis.minimum) / (axis.maximum - axis.minimum);
    // Far outside is as good as further away, and fits into what the painter counts with.
    return plot.bottom() - std::clamp(share, -10.0, 11.0) * plot.height();
}

void SeriesPainter::draw(const ChartSeries& series, const QColor& color, const QRectF& plot,
                         const ValueAxis& axis) {
    if (!series.samples || series.samples->size() == 0)
        return;
    _color = color;
    _plot = plot;
    _axis = axis;
    const TimeRange shown = _scale.range();
    const std::size_t begin = series.samples->countBefore(shown.begin_ns);
    const std::size_t end = series.samples->countBefore(shown.end_ns);
    _painter.save();
    _painter.setClipRect(plot.adjusted(0, -thickness, 0, thickness));
    if (end - begin <= _scale.columns / 2)
        drawSamples(series, begin, end);
    else
        drawColumns(series, end);
    _painter.restore();
}

void SeriesPainter::drawSamples(const ChartSeries& series, std::size_t begin, std::size_t end) {
    const SampleRing& ring = *series.samples;
    const std::size_t first = begin == 0 ? 0 : begin - 1; // the line comes in from the one before
    const std::size_t last = std::min(end + 1, ring.size());
    const bool hasDots = static_cast<double>(end - begin) < _scale.width() / 12;
    _joints.clear();
    _marks.clear();
    for (std::size_t index = first; index < last; ++index) {
        const Sample sample = ring.entry(index);
        if (std::isnan(sample.value))
            continue;
        const QPointF place(_scale.xAt(sample.time_ns), y(sample.value));
        const bool isJoined = index > 0 && !ring.isGapAfter(index - 1);
        if (hasDots || (!isJoined && ring.isGapAfter(index)))
            _marks.push_back(place);
        if (index == first || !isJoined)
            continue;
        const Sample before = ring.entry(index - 1);
        const QPointF from(_scale.xAt(before.time_ns), y(before.value));
        const QPointF corner(place.x(), series.isStepped ? from.y() : place.y());
        _joints.emplace_back(from, corner);
        if (corner != place)
            _joints.emplace_back(corner, place);
    }
    drawJoints(series.line);
    _painter.setPen(Qt::NoPen);
    _painter.setBrush(_color);
    for (const QPointF& dot : _marks)
        _painter.drawEllipse(dot, 2, 2);
}

void SeriesPainter::drawJoints(ChartLine line) {
    // As single lines, since Qt draws these much faster than a polyline of as many; squares at their ends
    // close the corners.
    QPen drawn = pen(line, _color);
    if (line == ChartLine::solid)
        drawn.setCapStyle(Qt::SquareCap);
    _painter.setRenderHint(QPainter::Antialiasing);
    _painter.setPen(drawn);
    _painter.drawLines(_joints.data(), static_cast<int>(_joints.size()));
}

void SeriesPainter::drawColumns(const ChartSeries& series, std::size_t end) {
    reduceToColumns(*series.samples, _scale.begin_ns, _scale.column_ns, _scale.columns, _columns);
    _bars.clear();
    _joints.clear();
    _marks.clear();
    _isDash = dashPoints(series.line);
    const SampleColumn* previous = nullptr;
    for (std::size_t column = 0; column < _columns.size(); ++column) {
        if (_columns[column].extremes.isEmpty())
            continue;
        addColumn(series, column, previous);
        previous = &_columns[column];
    }
    // The line goes on to the first sample past the end.
    if (previous && end < series.samples->size() && !series.samples->isGapAfter(end - 1)) {
        const Sample next = series.samples->entry(end);
        const double x = _scale.left + static_cast<double>(previous - _columns.data()) / _scale.pixelRatio;
        _joints.emplace_back(x, y(previous->last), _scale.xAt(next.time_ns),
                             y(series.isStepped ? previous->last : next.value));
    }
    _painter.save();
    _painter.scale(1 / _scale.pixelRatio, 1 / _scale.pixelRatio);
    _painter.setPen(Qt::NoPen);
    _painter.setBrush(_color);
    _painter.drawRects(_bars.data(), static_cast<int>(_bars.size()));
    _painter.restore();
    drawJoints(series.line);
    _painter.setPen(QPen(_ground, 1.5)); // an edge, by which marks stand out from bars of their own colour
    _painter.setBrush(_color);
    for (const QPointF& mark : _marks)
        drawLineMark(_painter, series.line, mark, markSize);
}

void SeriesPainter::addColumn(const ChartSeries& series, std::size_t column, const SampleColumn* previous) {
    const double ratio = _scale.pixelRatio;
    const SampleColumn& here = _columns[column];
    Extremes drawn = here.extremes;
    const double x = _scale.left + (static_cast<double>(column) + 0.5) / ratio;
    const bool joins = previous && here.joinsPrevious;
    if (joins && previous + 1 == &here) {
        drawn.add(previous->last);
    } else if (joins) {
        const double from = _scale.left + (static_cast<double>(previous - _columns.data()) + 0.5) / ratio;
        const double end = series.isStepped ? previous->last : here.first;
        _joints.emplace_back(from, y(previous->last), x, y(end));
        if (series.isStepped)
            drawn.add(previous->last);
    } else if (here.joinsPrevious) { // with a sample before the range
        const std::size_t index = series.samples->countBefore(_scale.begin_ns);
        const Sample before = series.samples->entry(index - 1);
        _joints.emplace_back(_scale.xAt(before.time_ns), y(before.value), x,
                             y(series.isStepped ? before.value : here.first));
    }
    const double half = thickness / 2;
    const int top = static_cast<int>(std::lround((y(drawn.maximum) - half) * ratio));
    const int bottom = std::max(static_cast<int>(std::lround((y(drawn.minimum) + half) * ratio)), top + 1);
    // Where the line is level a dash can be left out without hiding anything.
    const std::int64_t along = _scale.begin_ns / _scale.column_ns + static_cast<std::int64_t>(column);
    const bool isLevel = bottom - top <= std::lround(2 * thickness * ratio);
    const auto point = static_cast<std::size_t>(std::abs(static_cast<double>(along) / ratio));
    if (!isLevel || _isDash.empty() || _isDash[point % _isDash.size()])
        _bars.emplace_back(static_cast<int>(std::lround(_scale.left * ratio)) + static_cast<int>(column), top,
                           1, bottom - top);
    const auto distance = static_cast<std::int64_t>(markDistance * ratio);
    const auto shift = static_cast<std::int64_t>(series.color) * distance / 6;
    if (series.line != ChartLine::solid && (along + shift) % distance == 0)
        _marks.emplace_back(x, y(here.last));
}

} // namespace velmora
