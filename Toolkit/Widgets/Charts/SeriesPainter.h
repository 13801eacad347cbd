// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Charts/ChartPanel.h"
#include "Toolkit/Charts/SampleColumns.h"
#include "Toolkit/Charts/ValueAxis.h"
#include "Toolkit/Widgets/Charts/ChartScale.h"

#include <QColor>
#include <QLineF>
#include <QRect>
#include <QRectF>

#include <vector>

class QPainter;
class QPen;

namespace velmora {

/// Draws the lines of series into a plot: sample by sample where there are few, from the least to the
/// greatest of each column of pixels where there are many.
class SeriesPainter {
public:
    SeriesPainter(QPainter& painter, const ChartScale& scale, const QColor& ground)
        : _painter(painter), _scale(scale), _ground(ground) {}

    void draw(const ChartSeries& series, const QColor& color, const QRectF& plot, const ValueAxis& axis);

    /// The pen for a line of that kind.
    [[nodiscard]] static QPen pen(ChartLine line, const QColor& color);
    /// Where a value is in the plot.
    [[nodiscard]] static double yAt(double value, const QRectF& plot, const ValueAxis& axis);

private:
    void drawSamples(const ChartSeries& series, std::size_t begin, std::size_t end);
    void drawColumns(const ChartSeries& series, std::size_t end);
    void drawJoints(ChartLine line);
    void addColumn(const ChartSeries& series, std::size_t column, const SampleColumn* previous);
    [[nodiscard]] double y(double value) const { return yAt(value, _plot, _axis); }

    QPainter& _painter;
    const ChartScale& _scale;
    QColor _ground;
    QColor _color;
    QRectF _plot;
    ValueAxis _axis;
    std::vector<bool> _isDash; ///< of a period of the line's pattern, by points; empty for solid lines
    std::vector<SampleColumn> _columns;
    std::vector<QRect> _bars;    ///< in device pixels
    std::vector<QLineF> _joints; ///< between samples, or over columns without any
    std::vector<QPointF> _marks;
};

} // namespace velmora
