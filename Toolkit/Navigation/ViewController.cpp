// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Navigation/ViewController.h"

#include "Toolkit/Button.h"
#include "Toolkit/Navigation/NavigationController.h"
#include "Toolkit/Widgets/Navigation/ModalPresentation.h"
#include "Toolkit/Widgets/WindowWidget.h"

#include <QWidget>

#include <stdexcept>
#include <utility>

namespace velmora {

namespace {

/// The first button of that role in the view, or null.
Button* buttonOf(const View& view, ButtonRole role) {
    for (View* subview : view.subviews()) {
        if (auto* const button = dynamic_cast<Button*>(subview); button && button->role() == role)
            return button;
        if (Button* const button = buttonOf(*subview, role))
            return button;
    }
    return nullptr;
}

} // namespace

ViewController::ViewController() = default;

ViewController::~ViewController() {
    if (_presentation)
        _presentation->discard();
}

View& ViewController::view() {
    if (!_view) {
        _view = loadView();
        viewDidLoad();
    }
    return *_view;
}

std::unique_ptr<View> ViewController::loadView() {
    auto view = std::make_unique<View>();
    view->setBackgroundColor(Color::ground);
    return view;
}

void ViewController::viewDidLoad() {}

void ViewController::viewWillAppear(bool /*animated*/) {}

void ViewController::viewDidAppear(bool /*animated*/) {}

void ViewController::viewWillDisappear(bool /*animated*/) {}

void ViewController::viewDidDisappear(bool /*animated*/) {}

void ViewController::viewDidUnload() {}

void ViewController::didReceiveMemoryWarning() {}

void ViewController::setTitle(std::string_view title) {
    _title = title;
    if (_navigationController)
        _navigationController->viewControllerChanged(*this);
}

void ViewController::setToolbarItems(std::vector<std::shared_ptr<ToolbarItem>> items, bool /*animated*/) {
    _toolbarItems = std::move(items);
    if (_navigationController)
        _navigationController->viewControllerChanged(*this);
}

void ViewController::presentModalViewController(std::shared_ptr<ViewController> viewController,
                                                bool animated) {
    auto* const window = dynamic_cast<WindowWidget*>(view().widget()->window());
    if (_presentation || !window || !viewController || viewController->_presenter)
        throw std::logic_error(_presentation     ? "a screen that presents another presents a second one"
                               : !window         ? "a screen that is in no window presents another"
                               : !viewController ? "a screen presents none"
                                                 : "a screen is presented twice");
    viewController->_presenter = this;
    _presentation = std::make_shared<ModalPresentation>(*window, std::move(viewController));
    const std::shared_ptr<ModalPresentation> presentation = _presentation;
    presentation->present(animated);
}

void ViewController::dismissModalViewController(bool animated) {
    if (!_presentation) {
        if (_presenter)
            _presenter->dismissModalViewController(animated);
        return;
    }
    const std::shared_ptr<ModalPresentation> presentation = std::exchange(_presentation, nullptr);
    presentation->viewController()->_presenter = nullptr;
    presentation->dismiss(animated);
}

std::shared_ptr<ViewController> ViewController::modalViewController() const {
    return _presentation ? _presentation->viewController() : nullptr;
}

void ViewController::cancelOperation() {
    if (Button* const button = buttonOf(view(), ButtonRole::cancel))
        button->press();
    else if (_presenter)
        _presenter->dismissModalViewController(true);
}

void ViewController::saveOperation() {
    if (Button* const button = buttonOf(view(), ButtonRole::save))
        button->press();
}

bool ViewController::becomeFirstResponder() {
    return view().becomeFirstResponder();
}

bool ViewController::resignFirstResponder() {
    view().resignFirstResponder();
    return true;
}

} // namespace velmora
