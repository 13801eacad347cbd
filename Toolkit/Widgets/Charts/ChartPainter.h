// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Widgets/Charts/ChartLayout.h"
#include "Toolkit/Widgets/Charts/ChartScale.h"
#include "Toolkit/Widgets/Charts/ChartTheme.h"

class QPainter;

namespace velmora {

/// Draws a chart: bands and events, each panel with legend, axis and lines, the cursor and the axis of time.
class ChartPainter {
public:
    ChartPainter(QPainter& painter, const ChartModel& model, const ChartLayout& layout,
                 const ChartScale& scale, const ChartTheme& theme);

    void draw();

private:
    void drawBands();
    void drawTimeAxis();
    void drawPanel(std::size_t index);
    void drawLegend(const ChartPanel& panel, const ChartLayout::Panel& place);
    void drawValueAxis(const ChartPanel& panel, const ChartLayout::Panel& place);
    void drawEvents();
    void drawCursor();
    void drawCursorTime(double x);
    void drawEventText(double x);
    /// One line that ends in an ellipsis where it does not fit.
    void drawLine(const QRectF& place, const QString& text, Qt::Alignment alignment);
    /// At the side where lines of text begin.
    [[nodiscard]] Qt::Alignment leading() const;

    QPainter& _painter;
    const ChartModel& _model;
    const ChartLayout& _layout;
    const ChartScale& _scale;
    const ChartTheme& _theme;
    const DigitText& _digits;
};

} // namespace velmora
