// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/View.h"

#include "Toolkit/Widgets/Conversions.h"

#include <QCoreApplication>
#include <QEvent>
#include <QMouseEvent>
#include <QPointer>
#include <QWidget>

#include <algorithm>
#include <utility>

namespace velmora {

class View::State : public QObject {
public:
    explicit State(QWidget* shown) : widget(shown) {}

    bool eventFilter(QObject* watched, QEvent* event) override;

    QPointer<QWidget> widget;
    Rect frame;
    View* superview = nullptr;
    std::vector<View*> subviews;
    std::function<void()> onTap;
    bool isHidden = false;
    bool isPressed = false;
};

/// A tap is a press and a release that both come up to the view, unused by what lies on it.
bool View::State::eventFilter(QObject* watched, QEvent* event) {
    const bool isPress = event->type() == QEvent::MouseButtonPress;
    if (watched != widget || !onTap || (!isPress && event->type() != QEvent::MouseButtonRelease))
        return false;
    const auto* mouse = static_cast<QMouseEvent*>(event);
    if (mouse->button() != Qt::LeftButton)
        return false;
    const bool isTap =
        !isPress && std::exchange(isPressed, false) && widget->rect().contains(mouse->position().toPoint());
    if (isPress)
        isPressed = true;
    if (isTap)
        std::invoke(std::function<void()>(onTap)); // a copy, since the call may destroy the view
    return true;
}

View::View() : View(new QWidget) {}

View::View(QWidget* widget) : _state(std::make_unique<State>(widget)) {
    widget->setGeometry(0, 0, 0, 0);
    widget->installEventFilter(_state.get());
}

View::~View() {
    removeFromSuperview();
    while (!_state->subviews.empty())
        _state->subviews.back()->removeFromSuperview();
    if (!_state->widget)
        return;
    _state->widget->removeEventFilter(_state.get());
    _state->widget->setParent(nullptr);
    // The widget may be the one whose event led here.
    if (QCoreApplication::instance())
        _state->widget->deleteLater();
    else
        delete _state->widget;
}

Rect View::frame() const {
    return _state->frame;
}

void View::setFrame(const Rect& frame) {
    const bool isResized = frame.size() != _state->frame.size();
    _state->frame = frame;
    _state->widget->setGeometry(toQt(frame));
    if (isResized)
        layoutSubviews();
}

Rect View::bounds() const {
    return {0, 0, _state->frame.width, _state->frame.height};
}

void View::addSubview(View& view) {
    view.removeFromSuperview();
    _state->subviews.push_back(&view);
    view._state->superview = this;
    view.widget()->setParent(subviewWidget());
    view.widget()->setGeometry(toQt(view.frame()));
    view.widget()->setVisible(!view.isHidden());
}

void View::removeFromSuperview() {
    if (!_state->superview)
        return;
    std::erase(_state->superview->_state->subviews, this);
    _state->superview = nullptr;
    if (_state->widget)
        _state->widget->setParent(nullptr);
}

View* View::superview() const {
    return _state->superview;
}

const std::vector<View*>& View::subviews() const {
    return _state->subviews;
}

void View::layoutSubviews() {}

void View::sizeToFit() {}

bool View::isHidden() const {
    return _state->isHidden;
}

void View::setHidden(bool isHidden) {
    _state->isHidden = isHidden;
    if (_state->widget->parentWidget()) // without one it would become a window
        _state->widget->setVisible(!isHidden);
}

bool View::isOnScreen() const {
    return _state->widget->isVisible() && !_state->widget->window()->isMinimized();
}

void View::setBackgroundColor(Color color) {
    _state->widget->setAutoFillBackground(color != Color::clear && color != Color::automatic);
    _state->widget->setBackgroundRole(toQt(color, QPalette::NoRole));
}

void View::setOnTap(std::function<void()> onTap) {
    _state->onTap = std::move(onTap);
}

void View::setAccessibleName(std::string_view name) {
    _state->widget->setAccessibleName(toQt(name));
}

std::string View::accessibleName() const {
    return fromQt(_state->widget->accessibleName());
}

bool View::becomeFirstResponder() {
    if (!_state->widget->isVisible() || _state->widget->focusPolicy() == Qt::NoFocus ||
        !_state->widget->isEnabled())
        return false;
    _state->widget->setFocus(Qt::OtherFocusReason);
    return isFirstResponder();
}

void View::resignFirstResponder() {
    QWidget* const focused = _state->widget->window()->focusWidget();
    if (focused && (focused == _state->widget || _state->widget->isAncestorOf(focused)))
        focused->clearFocus();
}

bool View::isFirstResponder() const {
    return _state->widget->window()->focusWidget() == _state->widget;
}

QWidget* View::widget() const {
    return _state->widget;
}

QWidget* View::subviewWidget() const {
    return _state->widget;
}

} // namespace velmora
