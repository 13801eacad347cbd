// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Navigation/SplitController.h"

#include <QPointer>
#include <QWidget>

#include <algorithm>
#include <utility>

namespace velmora {

namespace {

/// What the second one has at least, beside the first.
constexpr double leastWidthOfSecond = 400;
constexpr double lineWidth = 1;

} // namespace

class SplitController::SplitView : public View {
public:
    explicit SplitView(SplitController& owner) : _owner(owner) {
        setBackgroundColor(Color::secondary); // the line between the two
    }
    void layoutSubviews() override { _owner.update(); }

private:
    SplitController& _owner;
};

SplitController::SplitController(std::shared_ptr<ViewController> first,
                                 std::shared_ptr<ViewController> second)
    : _first{std::move(first)}, _second{std::move(second)} {}

SplitController::~SplitController() {
    for (const Side& side : {_first, _second})
        if (side.controller->isViewLoaded())
            side.controller->view().removeFromSuperview();
}

std::unique_ptr<View> SplitController::loadView() {
    return std::make_unique<SplitView>(*this);
}

bool SplitController::isWide() const {
    return _wasWide;
}

void SplitController::setSecondShown(bool isShown) {
    if (std::exchange(_isSecondShown, isShown) == isShown || !_isOnScreen)
        return;
    update();
    (void)becomeFirstResponder();
}

void SplitController::update() {
    const bool isWide = view().bounds().width >= leastWidthOfBoth;
    const bool hasChanged = std::exchange(_wasWide, isWide) != isWide;
    if (hasChanged && _onWidthChanged)
        _onWidthChanged();
    if (!_isOnScreen)
        return;
    const QPointer<QWidget> focus(view().widget()->window()->focusWidget());
    show(_first, _wasWide || !_isSecondShown);
    show(_second, _isSecondShown);
    layout();
    if (_first.isShown && _second.isShown && focus && focus->isVisible())
        focus->setFocus(Qt::OtherFocusReason); // the keyboard stays where it was
}

void SplitController::show(Side& side, bool isShown) {
    if (std::exchange(side.isShown, isShown) == isShown)
        return;
    ViewController& controller = *side.controller;
    if (isShown) {
        if (controller.view().superview() != &view())
            view().addSubview(controller.view());
        controller.view().setHidden(false);
        layout();
        controller.viewWillAppear(false);
        if (_hasAppeared)
            controller.viewDidAppear(false);
    } else {
        controller.viewWillDisappear(false);
        controller.view().setHidden(true); // it stays in the window, where it may present other screens
        controller.viewDidDisappear(false);
    }
}

void SplitController::layout() {
    const Rect all = view().bounds();
    if (!_first.isShown || !_second.isShown) {
        for (const Side& side : {_first, _second})
            if (side.isShown)
                side.controller->view().setFrame(all);
        return;
    }
    const double width = std::min(greatestWidthOfFirst, all.width - leastWidthOfSecond);
    _first.controller->view().setFrame({0, 0, width, all.height});
    _second.controller->view().setFrame({width + lineWidth, 0, all.width - width - lineWidth, all.height});
}

void SplitController::viewWillAppear(bool /*animated*/) {
    _isOnScreen = true;
    update();
}

void SplitController::viewDidAppear(bool animated) {
    _hasAppeared = true;
    for (const Side& side : {_second, _first}) // the first one last, for the keyboard
        if (side.isShown)
            side.controller->viewDidAppear(animated);
}

void SplitController::viewWillDisappear(bool /*animated*/) {
    show(_first, false);
    show(_second, false);
    _isOnScreen = _hasAppeared = false;
}

void SplitController::viewDidDisappear(bool /*animated*/) {}

ViewController& SplitController::focused() const {
    if (!_first.isShown)
        return *_second.controller;
    if (!_second.isShown)
        return *_first.controller;
    const QWidget* const widget = _second.controller->view().widget();
    const QWidget* const focus = widget->window()->focusWidget();
    return focus && widget->isAncestorOf(focus) ? *_second.controller : *_first.controller;
}

bool SplitController::becomeFirstResponder() {
    return focused().becomeFirstResponder();
}

void SplitController::cancelOperation() {
    focused().cancelOperation();
}

void SplitController::saveOperation() {
    if (_first.isShown)
        _first.controller->saveOperation();
}

} // namespace velmora
