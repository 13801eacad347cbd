// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Charts/ChartTheme.h"

#include "Toolkit/Widgets/Contrast.h"

#include <QPainter>
#include <QPolygonF>

#include <algorithm>

namespace velmora {

namespace {

constexpr QRgb onLight[] = {0xff1a5fb4, 0xffb35900, 0xff1b7a3d, 0xff8b3fa8, 0xffc0243a, 0xff00707a};
constexpr QRgb onDark[] = {0xff78b4ff, 0xffffae57, 0xff74d192, 0xffd9a2f2, 0xffff8f94, 0xff63d4da};

QColor mixed(const QColor& one, const QColor& other, double shareOfOther) {
    const auto part = [shareOfOther](float a, float b) {
        return static_cast<float>(a * (1 - shareOfOther) + b * shareOfOther);
    };
    // In the precision of the screen, so that a colour that is read back is the same.
    return QColor::fromRgbF(part(one.redF(), other.redF()), part(one.greenF(), other.greenF()),
                            part(one.blueF(), other.blueF()))
        .rgb();
}

} // namespace

ChartTheme::ChartTheme(const QPalette& palette)
    : _ground(palette.color(QPalette::Base)), _text(palette.color(QPalette::Text)),
      _isDark(luminance(_ground) < 0.18) {
    _text = readable(_text, 7);
    _faintText = readable(mixed(_text, _ground, 0.35), 4.5);
    _grid = mixed(_text, _ground, 0.85);
}

QColor ChartTheme::readable(QColor color, double least) const {
    const QColor far = _isDark ? Qt::white : Qt::black;
    for (int step = 1; step <= 20 && contrast(color, _ground) < least; ++step)
        color = mixed(color, far, step / 20.0);
    return color;
}

QColor ChartTheme::line(ChartColor color) const {
    const auto index = std::min<std::size_t>(static_cast<std::size_t>(color), std::size(onLight) - 1);
    return readable(QColor(_isDark ? onDark[index] : onLight[index]), 3);
}

QColor ChartTheme::mark(ChartSeverity severity) const {
    switch (severity) {
    case ChartSeverity::note: return line(ChartColor::first);
    case ChartSeverity::warning: return line(ChartColor::second);
    case ChartSeverity::critical: return line(ChartColor::fifth);
    case ChartSeverity::info: break;
    }
    return _faintText;
}

QColor ChartTheme::band(ChartColor color) const {
    return mixed(_ground, line(color), 0.2);
}

void drawLineMark(QPainter& painter, ChartLine line, const QPointF& center, double size) {
    const double half = size / 2;
    const double x = center.x();
    const double y = center.y();
    switch (line) {
    case ChartLine::solid: break;
    case ChartLine::dashed: painter.drawEllipse(center, half, half); break;
    case ChartLine::dotted: painter.drawRect(QRectF(x - half, y - half, size, size)); break;
    case ChartLine::dashDotted:
        painter.drawPolygon(QPolygonF({{x, y - half}, {x + half, y + half}, {x - half, y + half}}));
        break;
    }
}

void drawEventMark(QPainter& painter, ChartSeverity severity, const QPointF& center, double size) {
    const double half = size / 2;
    const double x = center.x();
    const double y = center.y();
    switch (severity) {
    case ChartSeverity::info: painter.drawEllipse(center, half * 0.7, half * 0.7); break;
    case ChartSeverity::note:
        painter.drawPolygon(QPolygonF({{x - half, y - half},
                                       {x + half, y - half},
                                       {x + half, y + half},
                                       {x, y},
                                       {x - half, y + half}}));
        break;
    case ChartSeverity::warning:
        painter.drawPolygon(QPolygonF({{x, y - half}, {x + half, y + half}, {x - half, y + half}}));
        break;
    case ChartSeverity::critical:
        painter.drawPolygon(QPolygonF({{x, y - half}, {x + half, y}, {x, y + half}, {x - half, y}}));
        break;
    }
}

} // namespace velmora
