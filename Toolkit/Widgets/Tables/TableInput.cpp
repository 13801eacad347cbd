// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Tables/TableInput.h"

#include "Toolkit/Widgets/Scrolling/ScrollWidget.h"
#include "Toolkit/Widgets/Scrolling/TouchScroll.h"
#include "Toolkit/Widgets/Tables/CellWidget.h"
#include "Toolkit/Widgets/Tables/TableWidget.h"
#include "Toolkit/Widgets/TouchEvent.h"

#include <QContextMenuEvent>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QScrollBar>
#include <QScrollEvent>
#include <QScrollPrepareEvent>
#include <QTouchEvent>

#include <algorithm>
#include <chrono>
#include <cmath>

namespace velmora {

namespace {

constexpr double sidewaysStep = 60;
constexpr std::chrono::milliseconds longPress{600};

} // namespace

TableInput::TableInput(TableWidget& table) : _table(table) {
    _longPress.setSingleShot(true);
    _longPress.setInterval(longPress);
    QObject::connect(&_longPress, &QTimer::timeout, &_longPress, [this] { pressedLong(); });
}

TableInput::~TableInput() = default;

bool TableInput::handle(QEvent* event) {
    if (const QTouchEvent* const fingers = touchEvent(event)) {
        touch(*fingers);
        event->accept();
        return true;
    }
    switch (event->type()) {
    case QEvent::MouseButtonPress: {
        const auto* const mouse = static_cast<QMouseEvent*>(event);
        return mouse->button() == Qt::LeftButton && press(mouse->position().toPoint());
    }
    case QEvent::ContextMenu: return openMenu(*static_cast<QContextMenuEvent*>(event));
    case QEvent::MouseButtonDblClick: return true; // out of habit; one click is all that it takes
    case QEvent::MouseButtonRelease: {
        const auto* const mouse = static_cast<QMouseEvent*>(event);
        return mouse->button() == Qt::LeftButton && release(mouse->position().toPoint());
    }
    case QEvent::MouseMove:
        if (_pressed)
            _table.setPressedRow(_table.rowAt(static_cast<QMouseEvent*>(event)->position().toPoint()) ==
                                         _pressed
                                     ? _pressed
                                     : std::nullopt);
        return _pressed.has_value();
    case QEvent::ScrollPrepare: {
        auto* const prepare = static_cast<QScrollPrepareEvent*>(event);
        _underTouch = ScrollWidget::at(*_table.viewport(), prepare->startPos().toPoint());
        prepare->setViewportSize(_table.viewport()->size());
        prepare->setContentPosRange({0, 0, _underTouch ? _underTouch->maximumOffset() : 0,
                                     static_cast<double>(_table.verticalScrollBar()->maximum())});
        prepare->setContentPos({_underTouch ? _underTouch->position() : 0,
                                static_cast<double>(_table.verticalScrollBar()->value())});
        prepare->accept();
        return true;
    }
    case QEvent::Scroll: {
        // The finger moves: it does not mean the row that it came down on.
        cancelPress();
        const QPointF place = static_cast<QScrollEvent*>(event)->contentPos();
        if (_underTouch)
            _underTouch->setPosition(place.x());
        _table.verticalScrollBar()->setValue(static_cast<int>(std::round(place.y())));
        return true;
    }
    default: return false;
    }
}

void TableInput::touch(const QTouchEvent& event) {
    const bool isScroll = scrollByTouch(*_table.viewport(), event);
    if (event.type() == QEvent::TouchCancel || event.points().isEmpty()) {
        cancelPress();
        return;
    }
    const QPoint place = _table.viewport()->mapFromGlobal(event.points().first().globalPosition()).toPoint();
    if (event.type() == QEvent::TouchBegin && !isScroll) {
        _table.setFocus(Qt::MouseFocusReason);
        if (press(place))
            _longPress.start();
    } else if (event.type() == QEvent::TouchEnd) {
        (void)release(place);
    }
}

bool TableInput::press(const QPoint& place) {
    _pressed = _table.rowAt(place);
    _pressPlace = place;
    _table.setShowsFocus(false);
    _table.setPressedRow(_pressed);
    return _pressed.has_value();
}

bool TableInput::release(const QPoint& place) {
    if (!_pressed)
        return false;
    const std::optional<std::size_t> row = _table.rowAt(place);
    const bool isTap = row && row == _pressed;
    cancelPress();
    if (isTap)
        _table.activateRow(*row);
    return true;
}

void TableInput::cancelPress() {
    _longPress.stop();
    if (!_pressed)
        return;
    _pressed.reset();
    _table.setPressedRow(std::nullopt);
}

bool TableInput::openMenu(const QContextMenuEvent& event) {
    const bool isByKey = event.reason() == QContextMenuEvent::Keyboard;
    const std::optional<std::size_t> row = isByKey ? _table.focusRow() : _table.rowAt(event.pos());
    if (!row)
        return false;
    _table.openMenu(*row, isByKey ? _table.rowRect(*row).center() : event.pos());
    return true;
}

void TableInput::pressedLong() {
    const std::optional<std::size_t> row = _pressed;
    cancelPress();
    if (row)
        _table.openMenu(*row, _pressPlace);
}

void TableInput::handleKey(QKeyEvent* event) {
    event->ignore();
    if (event->modifiers() & (Qt::ControlModifier | Qt::AltModifier | Qt::MetaModifier))
        return;
    switch (event->key()) {
    case Qt::Key_Left: event->setAccepted(scrollSideways(-1)); break;
    case Qt::Key_Right: event->setAccepted(scrollSideways(1)); break;
    case Qt::Key_Return:
    case Qt::Key_Enter:
    case Qt::Key_Space:
    case Qt::Key_Select:
        event->accept();
        if (_table.focusRow() && !event->isAutoRepeat())
            _table.activateRow(*_table.focusRow());
        break;
    default: event->setAccepted(moveFocus(event->key())); break;
    }
}

bool TableInput::moveFocus(int key) {
    const auto total = static_cast<long long>(_table.rows().total());
    const auto page = static_cast<long long>(_table.rowsPerPage());
    const auto now = static_cast<long long>(_table.focusRow().value_or(0));
    long long next = 0;
    switch (key) {
    case Qt::Key_Up: next = now - 1; break;
    case Qt::Key_Down: next = _table.focusRow() ? now + 1 : 0; break;
    case Qt::Key_PageUp: next = now - page; break;
    case Qt::Key_PageDown: next = now + page; break;
    case Qt::Key_Home: next = 0; break;
    case Qt::Key_End: next = total - 1; break;
    default: return false;
    }
    if (total == 0)
        return true;
    _table.setShowsFocus(true);
    _table.setFocusRow(static_cast<std::size_t>(std::clamp(next, 0LL, total - 1)));
    return true;
}

bool TableInput::scrollSideways(int direction) {
    CellWidget* const cell = _table.cells().widget(_table.focusRow());
    if (!cell)
        return false;
    for (QWidget* const child : cell->findChildren<QWidget*>())
        if (auto* const scroller = dynamic_cast<ScrollWidget*>(child);
            scroller && scroller->maximumOffset() > 0) {
            scroller->setPosition(scroller->position() + direction * sidewaysStep);
            return true;
        }
    return false;
}

} // namespace velmora
