// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <QPointF>
#include <QWidget>

namespace velmora {

class ScrollSigns;

/// A window on a wider content that moves sideways. In a table the table moves it under the finger, as one
/// gesture may go either way there; elsewhere it does so itself. Signs show at which edges the content goes
/// on. In a layout from right to left it is all mirrored: the content begins at the right edge.
class ScrollWidget : public QWidget {
public:
    ScrollWidget();

    [[nodiscard]] QWidget* content() const { return _content; }
    void setContentSize(const QSizeF& size);
    [[nodiscard]] QSizeF contentSize() const { return _size; }
    [[nodiscard]] double offset() const { return _offset; }
    void setOffset(double x);
    [[nodiscard]] double maximumOffset() const;
    /// The content's point at the left edge, whichever edge it begins at; what fingers and keys move.
    [[nodiscard]] double position() const;
    void setPosition(double x);

    /// The innermost one that can move at that place of `ancestor`, or null.
    [[nodiscard]] static ScrollWidget* at(const QWidget& ancestor, const QPoint& place);

protected:
    bool event(QEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void showEvent(QShowEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    QWidget* _content;
    ScrollSigns* _signs;
    QSizeF _size;
    double _offset = 0;
};

} // namespace velmora
