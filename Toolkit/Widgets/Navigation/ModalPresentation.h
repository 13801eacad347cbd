// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Navigation/ViewController.h"
#include "Toolkit/View.h"
#include "Toolkit/Widgets/Animation.h"
#include "Toolkit/Widgets/Navigation/SheetWidget.h"
#include "Toolkit/Widgets/WindowWidget.h"

#include <QPointer>

#include <memory>

namespace velmora {

/// A screen on a sheet over a window. Lives until the sheet is out of sight, and holds the screen as long.
class ModalPresentation : public std::enable_shared_from_this<ModalPresentation> {
public:
    ModalPresentation(WindowWidget& window, std::shared_ptr<ViewController> viewController);
    ~ModalPresentation();
    ModalPresentation(const ModalPresentation&) = delete;
    ModalPresentation& operator=(const ModalPresentation&) = delete;

    [[nodiscard]] const std::shared_ptr<ViewController>& viewController() const { return _viewController; }
    void present(bool animated);
    void dismiss(bool animated);
    /// The presenter is being destroyed: removes the sheet without notifications.
    void discard();

private:
    void layout();
    void removeSheet();

    std::shared_ptr<ViewController> _viewController;
    View _panel;
    QPointer<WindowWidget> _window;
    QPointer<SheetWidget> _sheet;
    QPointer<QWidget> _focusBefore;
    Animation _animation;
    double _shown = 0;
};

} // namespace velmora
