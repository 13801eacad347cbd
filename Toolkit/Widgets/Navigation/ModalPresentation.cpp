// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Navigation/ModalPresentation.h"

#include "Toolkit/Widgets/Conversions.h"

#include <algorithm>
#include <utility>

namespace velmora {

namespace {

/// How much of what is below shows above the sheet, and how wide a sheet gets, in points.
constexpr double gapAbove = 24;
constexpr double maximumWidth = 560;

} // namespace

ModalPresentation::ModalPresentation(WindowWidget& window, std::shared_ptr<ViewController> viewController)
    : _viewController(std::move(viewController)), _window(&window), _sheet(new SheetWidget(window)) {
    _panel.setBackgroundColor(Color::ground);
    _panel.widget()->setParent(_sheet);
    _panel.setHidden(false);
    _panel.addSubview(_viewController->view());
    _sheet->onResize = [this] { layout(); };
    _sheet->onDestroyed = [this] { _panel.widget()->setParent(nullptr); };
    _sheet->onCancel = [this] { std::shared_ptr(_viewController)->cancelOperation(); };
    _sheet->onSave = [this] { std::shared_ptr(_viewController)->saveOperation(); };
}

ModalPresentation::~ModalPresentation() {
    removeSheet();
}

void ModalPresentation::present(bool animated) {
    const auto self = shared_from_this();
    _focusBefore = _window->focusWidget();
    _sheet->setAccessibleName(toQt(_viewController->title()));
    layout();
    _viewController->viewWillAppear(animated);
    layout(); // over whatever frame the screen gave itself
    _sheet->show();
    _sheet->raise();
    if (!_viewController->becomeFirstResponder())
        _sheet->focusFirst();
    _animation.start(
        animated,
        [this](double part) {
            _shown = part;
            layout();
        },
        [this, animated] { _viewController->viewDidAppear(animated); });
}

void ModalPresentation::dismiss(bool animated) {
    _animation.finish();
    _viewController->viewWillDisappear(animated);
    if (!_sheet) {
        _viewController->viewDidDisappear(animated);
        return;
    }
    _sheet->setPassive();
    if (_window)
        _window->returnFocus(_focusBefore);
    _animation.start(
        animated,
        [this](double part) {
            _shown = 1 - part;
            layout();
        },
        [this, animated, self = shared_from_this()] {
            removeSheet();
            _viewController->viewDidDisappear(animated);
        });
}

void ModalPresentation::discard() {
    _viewController->_presenter = nullptr;
    removeSheet();
}

void ModalPresentation::layout() {
    if (!_sheet)
        return;
    const double width = std::min(static_cast<double>(_sheet->width()), maximumWidth);
    const double height = std::max(_sheet->height() - gapAbove, 0.0);
    const double left = (_sheet->width() - width) / 2;
    _panel.setFrame({left, gapAbove + (1 - _shown) * height, width, height});
    _viewController->view().setFrame(_panel.bounds());
    _sheet->setShade(_shown);
}

void ModalPresentation::removeSheet() {
    _viewController->view().removeFromSuperview();
    if (!_sheet)
        return;
    _sheet->onResize = nullptr;
    _sheet->onDestroyed = nullptr;
    _sheet->onCancel = nullptr;
    _sheet->onSave = nullptr;
    _panel.widget()->setParent(nullptr);
    _sheet->hide();
    _sheet->deleteLater();
    _sheet = nullptr;
}

} // namespace velmora
