// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Navigation/SheetWidget.h"

#include "Toolkit/Widgets/WindowWidget.h"

#include <QEvent>
#include <QKeyEvent>
#include <QPainter>

#include <algorithm>

namespace velmora {

SheetWidget::SheetWidget(WindowWidget& window) : QWidget(&window) {
    setObjectName("velmora.sheet");
    setGeometry(window.rect());
    setFocusPolicy(Qt::ClickFocus);
    window.installEventFilter(this);
}

SheetWidget::~SheetWidget() {
    if (onDestroyed)
        onDestroyed();
}

void SheetWidget::setShade(double shade) {
    _shade = std::clamp(shade, 0.0, 1.0);
    update();
}

void SheetWidget::setPassive() {
    _isPassive = true;
    setAttribute(Qt::WA_TransparentForMouseEvents);
}

void SheetWidget::focusFirst() {
    setFocus(Qt::OtherFocusReason); // so that keys come here even when nothing in the sheet takes them
    focusNextPrevChild(true);
}

bool SheetWidget::eventFilter(QObject* watched, QEvent* event) {
    if (event->type() == QEvent::Resize && watched == parent())
        setGeometry(parentWidget()->rect());
    return false;
}

bool SheetWidget::event(QEvent* event) {
    switch (event->type()) {
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonRelease:
    case QEvent::MouseButtonDblClick:
    case QEvent::Wheel: return true;
    default: return QWidget::event(event);
    }
}

void SheetWidget::keyPressEvent(QKeyEvent* event) {
    event->accept();
    const auto* const window = dynamic_cast<WindowWidget*>(parentWidget());
    if ((window && window->runCommand(*event)) || _isPassive)
        return;
    // A key that is held has already done what it does, such as leaving a field.
    const bool isEnter =
        (event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter) && !event->isAutoRepeat();
    const std::function<void()> action = isEnter || event->matches(QKeySequence::Save) ? onSave
                                         : WindowWidget::isBackOrCancel(*event)        ? onCancel
                                                                                : std::function<void()>();
    if (action)
        action();
}

void SheetWidget::paintEvent(QPaintEvent* /*event*/) {
    QColor shade = palette().color(QPalette::Shadow);
    shade.setAlphaF(static_cast<float>(_shade * 0.45));
    QPainter(this).fillRect(rect(), shade);
}

void SheetWidget::resizeEvent(QResizeEvent* /*event*/) {
    if (onResize)
        onResize();
}

/// Tab goes round within the sheet.
bool SheetWidget::focusNextPrevChild(bool next) {
    QWidget* const from = window()->focusWidget() ? window()->focusWidget() : this;
    for (QWidget* widget = next ? from->nextInFocusChain() : from->previousInFocusChain(); widget != from;
         widget = next ? widget->nextInFocusChain() : widget->previousInFocusChain())
        if (isAncestorOf(widget) && widget->isVisible() && widget->isEnabled() &&
            (widget->focusPolicy() & Qt::TabFocus)) {
            widget->setFocus(next ? Qt::TabFocusReason : Qt::BacktabFocusReason);
            return true;
        }
    return true;
}

} // namespace velmora
