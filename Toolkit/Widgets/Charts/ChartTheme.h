// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Charts/ChartPanel.h"

#include <QColor>
#include <QPalette>

class QPainter;

namespace velmora {

/// The colours of a chart on a palette's ground, light or dark.
class ChartTheme {
public:
    explicit ChartTheme(const QPalette& palette);

    [[nodiscard]] QColor ground() const { return _ground; }
    [[nodiscard]] QColor text() const { return _text; }
    /// For what is less important, though no less readable than 4.5:1.
    [[nodiscard]] QColor faintText() const { return _faintText; }
    [[nodiscard]] QColor grid() const { return _grid; }
    [[nodiscard]] QColor line(ChartColor color) const;
    [[nodiscard]] QColor mark(ChartSeverity severity) const;
    /// A band's area, under text in the ordinary colour.
    [[nodiscard]] QColor band(ChartColor color) const;

private:
    /// The colour, made darker or lighter until its contrast to the ground is at least that.
    [[nodiscard]] QColor readable(QColor color, double least) const;

    QColor _ground;
    QColor _text;
    QColor _faintText;
    QColor _grid;
    bool _isDark;
};

/// Draws the mark that a line of that kind has besides its colour around a point; nothing for solid lines.
void drawLineMark(QPainter& painter, ChartLine line, const QPointF& center, double size);
/// Draws the mark of events of that severity around a point.
void drawEventMark(QPainter& painter, ChartSeverity severity, const QPointF& center, double size);

} // namespace velmora
