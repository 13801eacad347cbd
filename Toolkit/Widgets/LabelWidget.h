// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Color.h"

#include <QLabel>

namespace velmora {

/// One line of plain text that ends in an ellipsis where it does not fit (or has one in its middle). On a
/// highlighted table row it takes the colour of highlighted text unless it was given one.
class LabelWidget : public QLabel {
public:
    LabelWidget();

    void setTextColor(Color color);
    void setElideMode(Qt::TextElideMode mode);
    /// The text's own size.
    [[nodiscard]] QSize sizeHint() const override;
    [[nodiscard]] QSize minimumSizeHint() const override;
    /// What is drawn, with the ellipsis if there has to be one.
    [[nodiscard]] QString shownText() const;
    [[nodiscard]] QColor shownColor() const;

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    Color _color = Color::automatic;
    Qt::TextElideMode _elideMode = Qt::ElideRight;
};

} // namespace velmora
