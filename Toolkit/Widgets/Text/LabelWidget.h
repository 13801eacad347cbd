// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Color.h"

#include <QLabel>

namespace velmora {

/// Plain text on one line, or on as many as it may have, that ends in an ellipsis where it does not fit (or
/// has one in its middle or at its start). It reads in its own direction, at the side that the layout has it.
/// On a highlighted table row it takes the colour of highlighted text unless it was given one.
class LabelWidget : public QLabel {
public:
    LabelWidget();

    void setTextColor(Color color);
    void setElideMode(Qt::TextElideMode mode);
    /// 1 at first.
    void setMaximumLines(int lines);
    /// Whether screen readers take it for a heading.
    void setHeading(bool isHeading) { _isHeading = isHeading; }
    [[nodiscard]] bool isHeading() const { return _isHeading; }
    /// Of the lines that it has in that width.
    [[nodiscard]] int heightForWidth(int width) const override;
    /// The text's own size.
    [[nodiscard]] QSize sizeHint() const override;
    [[nodiscard]] QSize minimumSizeHint() const override;
    /// What is drawn, with the ellipsis if there has to be one, and line feeds between lines.
    [[nodiscard]] QString shownText() const;
    [[nodiscard]] QColor shownColor() const;

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    Color _color = Color::automatic;
    Qt::TextElideMode _elideMode = Qt::ElideRight;
    int _maximumLines = 1;
    bool _isHeading = false;
};

} // namespace velmora
