// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <QFontMetricsF>
#include <QString>

class QPainter;

namespace velmora {

/// Text whose digits all take the width of the widest, so that numbers below each other line up and a number
/// that changes does not move what is beside it, whether or not the font has tabular digits.
class DigitText {
public:
    explicit DigitText(const QFont& font);

    [[nodiscard]] double width(const QString& text) const;
    /// From that point on, which lies on the base line.
    void draw(QPainter& painter, QPointF place, const QString& text) const;
    [[nodiscard]] const QFontMetricsF& metrics() const { return _metrics; }

private:
    QFontMetricsF _metrics;
    double _digit = 0;
    bool _isTabular = true;
};

} // namespace velmora
