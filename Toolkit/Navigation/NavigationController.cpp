// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Navigation/NavigationController.h"

#include "Toolkit/Widgets/Conversions.h"
#include "Toolkit/Widgets/Navigation/BackButton.h"
#include "Toolkit/Widgets/Navigation/CommandButton.h"
#include "Toolkit/Widgets/Navigation/NavigationView.h"
#include "Toolkit/Widgets/WindowWidget.h"

#include <algorithm>
#include <stdexcept>
#include <utility>

namespace velmora {

NavigationController::NavigationController(std::shared_ptr<ViewController> rootViewController) {
    if (!rootViewController || rootViewController->_navigationController)
        throw std::invalid_argument("a navigation stack begins with a screen that is on no stack");
    rootViewController->_navigationController = this;
    _panes.push_back(std::move(rootViewController));
}

NavigationController::~NavigationController() {
    if (isViewLoaded())
        stackView().finish();
    for (const auto& pane : _panes) {
        pane->_navigationController = nullptr;
        if (pane->isViewLoaded())
            pane->view().removeFromSuperview();
    }
}

void NavigationController::setDelegate(NavigationControllerDelegate* delegate) {
    _delegate = delegate;
}

NavigationView& NavigationController::stackView() {
    return static_cast<NavigationView&>(view());
}

std::unique_ptr<View> NavigationController::loadView() {
    auto stack = std::make_unique<NavigationView>();
    QObject::connect(&stack->header().backButton(), &QAbstractButton::clicked, &stack->header(), [this] {
        const auto self = shared_from_this();
        goBack();
    });
    QObject::connect(&stack->header().commandButton(), &QAbstractButton::clicked, &stack->header(), [this] {
        const std::function<void()> action = _headerCommand.action; // the call may set another one
        if (action)
            action();
    });
    stack->header().setCommand(toQt(_headerCommand.title));
    stack->setToolbarHidden(_isToolbarHidden);
    stack->setNotice(_notice);
    stack->setAccessories(_accessories);
    return stack;
}

void NavigationController::pushViewController(std::shared_ptr<ViewController> viewController, bool animated) {
    if (!viewController || viewController->_navigationController)
        throw std::invalid_argument("what is pushed is a screen that is on no stack");
    const std::shared_ptr<ViewController> old = _panes.back();
    viewController->_navigationController = this;
    _panes.push_back(std::move(viewController));
    showTop(old, true, animated);
}

std::shared_ptr<ViewController> NavigationController::popViewController(bool animated) {
    if (_panes.size() < 2)
        return nullptr;
    return popToViewController(*_panes[_panes.size() - 2], animated).front();
}

std::vector<std::shared_ptr<ViewController>>
NavigationController::popToViewController(const ViewController& viewController, bool animated) {
    const auto found = std::find_if(_panes.begin(), _panes.end(),
                                    [&](const auto& pane) { return pane.get() == &viewController; });
    if (found == _panes.end() || found + 1 == _panes.end())
        return {};
    std::vector<std::shared_ptr<ViewController>> popped(found + 1, _panes.end());
    _panes.erase(found + 1, _panes.end());
    for (const auto& pane : popped)
        pane->_navigationController = nullptr;
    showTop(popped.back(), false, animated);
    return popped;
}

std::shared_ptr<ViewController> NavigationController::topViewController() const {
    return _panes.back();
}

void NavigationController::setToolbarHidden(bool isHidden, bool /*animated*/) {
    if (std::exchange(_isToolbarHidden, isHidden) != isHidden && isViewLoaded())
        stackView().setToolbarHidden(isHidden);
}

void NavigationController::setNotice(Notice notice) {
    _notice = std::move(notice);
    if (isViewLoaded())
        stackView().setNotice(_notice);
}

void NavigationController::setHeaderCommand(std::string title, std::function<void()> action) {
    _headerCommand = {std::move(title), std::move(action)};
    if (isViewLoaded())
        stackView().header().setCommand(toQt(_headerCommand.title));
}

void NavigationController::setLeave(std::string title, std::function<void()> action) {
    _leave = {std::move(title), std::move(action)};
    if (_isOnScreen)
        fillBars(false);
}

void NavigationController::goBack() {
    if (popViewController(true) || _leave.title.empty())
        return;
    const std::function<void()> action = _leave.action; // the call may set another one
    if (action)
        action();
}

void NavigationController::setAccessories(std::vector<View*> views) {
    _accessories = std::move(views);
    if (isViewLoaded())
        stackView().setAccessories(_accessories);
}

void NavigationController::showTop(const std::shared_ptr<ViewController>& old, bool isPush, bool animated) {
    if (!_isOnScreen) { // it is announced as the stack comes onto the screen
        if (isViewLoaded())
            stackView().removePane();
        return;
    }
    const std::shared_ptr<ViewController> top = _panes.back();
    stackView().finish();
    old->viewWillDisappear(animated);
    announceTop(animated);
    if (top != _panes.back()) // a delegate may have navigated further
        return;
    fillBars(animated);
    stackView().showPane(top->view(), &old->view(), isPush, animated, [top, old, animated] {
        old->viewDidDisappear(animated);
        top->viewDidAppear(animated);
    });
    auto* const window = dynamic_cast<WindowWidget*>(view().widget()->window());
    if (!window || !window->sheet())
        (void)top->becomeFirstResponder();
}

void NavigationController::announceTop(bool animated) {
    const std::shared_ptr<ViewController> top = _panes.back();
    if (_delegate)
        _delegate->willShowViewController(*this, *top, animated);
    if (top == _panes.back())
        top->viewWillAppear(animated);
}

void NavigationController::fillBars(bool /*animated*/) {
    const ViewController& top = *_panes.back();
    NavigationView& stack = stackView();
    stack.header().setTitle(toQt(top.title()));
    const bool hasBack = _panes.size() > 1;
    stack.header().setBack(hasBack || !_leave.title.empty(),
                           toQt(hasBack ? _panes[_panes.size() - 2]->title() : _leave.title));
    stack.fitHeader();
    stack.toolbar().setItems(top.toolbarItems());
    if (auto* const window = dynamic_cast<WindowWidget*>(stack.widget()->window()); window && _namesWindow)
        window->setWindowTitle(toQt(top.title()));
}

void NavigationController::viewControllerChanged(const ViewController& viewController) {
    const bool isBelow = _panes.size() > 1 && _panes[_panes.size() - 2].get() == &viewController;
    if (_isOnScreen && (isBelow || _panes.back().get() == &viewController))
        fillBars(false);
}

void NavigationController::viewWillAppear(bool animated) {
    _isOnScreen = true;
    announceTop(animated);
    fillBars(animated);
    stackView().showPane(_panes.back()->view(), nullptr, true, false, [] {});
}

void NavigationController::viewDidAppear(bool animated) {
    _panes.back()->viewDidAppear(animated);
    (void)becomeFirstResponder();
}

void NavigationController::viewWillDisappear(bool animated) {
    stackView().finish();
    _panes.back()->viewWillDisappear(animated);
    _isOnScreen = false;
}

void NavigationController::viewDidDisappear(bool animated) {
    _panes.back()->viewDidDisappear(animated);
}

bool NavigationController::becomeFirstResponder() {
    return _panes.back()->becomeFirstResponder();
}

void NavigationController::cancelOperation() {
    goBack();
}

void NavigationController::saveOperation() {
    if (!_isToolbarHidden && isViewLoaded())
        stackView().toolbar().save();
}

} // namespace velmora
