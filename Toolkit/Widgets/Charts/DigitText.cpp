// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Charts/DigitText.h"

#include <QPainter>

#include <algorithm>
#include <cmath>

namespace velmora {

DigitText::DigitText(const QFont& font) : _metrics(font) {
    for (char digit = '0'; digit <= '9'; ++digit) {
        const double width = _metrics.horizontalAdvance(QLatin1Char(digit));
        _isTabular = _isTabular && (digit == '0' || std::abs(width - _digit) < 0.01);
        _digit = std::max(_digit, width);
    }
}

double DigitText::width(const QString& text) const {
    if (_isTabular)
        return _metrics.horizontalAdvance(text);
    double width = 0;
    for (const QChar character : text)
        width += character.isDigit() ? _digit : _metrics.horizontalAdvance(character);
    return width;
}

void DigitText::draw(QPainter& painter, QPointF place, const QString& text) const {
    if (_isTabular) {
        painter.drawText(place, text);
        return;
    }
    for (const QChar character : text) {
        const double own = _metrics.horizontalAdvance(character);
        const double taken = character.isDigit() ? _digit : own;
        painter.drawText(place + QPointF((taken - own) / 2, 0), QString(character));
        place.rx() += taken;
    }
}

} // namespace velmora
