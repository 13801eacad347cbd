// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <QPoint>
#include <QPointF>
#include <QPointer>
#include <QTimer>

#include <cstddef>
#include <optional>

class QContextMenuEvent;
class QEvent;
class QKeyEvent;
class QTouchEvent;

namespace velmora {

class ScrollWidget;
class TableWidget;

/// Touch, mouse and keyboard input of a table. A vertical swipe scrolls the rows, a horizontal one the row
/// under it.
class TableInput {
public:
    explicit TableInput(TableWidget& table);
    ~TableInput();

    /// An event of the viewport; true when it was used.
    [[nodiscard]] bool handle(QEvent* event);
    void handleKey(QKeyEvent* event);
    /// Whether there is a row that it is for.
    [[nodiscard]] bool openMenu(const QContextMenuEvent& event);

private:
    void touch(const QTouchEvent& event);
    [[nodiscard]] bool press(const QPoint& place);
    [[nodiscard]] bool release(const QPoint& place);
    void cancelPress();
    void pressedLong();
    [[nodiscard]] bool moveFocus(int key);
    [[nodiscard]] bool scrollSideways(int direction);

    TableWidget& _table;
    std::optional<std::size_t> _pressed;
    QPointer<ScrollWidget> _underTouch;
    QPoint _pressPlace;
    QTimer _longPress; ///< of a finger
};

} // namespace velmora
