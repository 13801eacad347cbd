// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Window.h"

#include "Toolkit/Navigation/ViewController.h"
#include "Toolkit/View.h"
#include "Toolkit/Widgets/Conversions.h"
#include "Toolkit/Widgets/WindowWidget.h"

#include <QEvent>
#include <QGuiApplication>
#include <QWindow>

#include <utility>

namespace velmora {

namespace {

class RootView : public View {
public:
    RootView() : View(new WindowWidget) {}
};

/// Whether windows have the screen to themselves there.
bool fillsScreen() {
    const QString platform = QGuiApplication::platformName();
    return platform.startsWith("eglfs") || platform.startsWith("linuxfb") ||
           platform.startsWith("vkkhrdisplay");
}

} // namespace

class Window::Impl {
public:
    [[nodiscard]] WindowWidget& widget() const { return static_cast<WindowWidget&>(*view.widget()); }
    void layout() {
        view.setFrame(fromQt(widget().rect()));
        if (root)
            root->view().setFrame(view.bounds());
    }
    void appear() {
        if (root && !std::exchange(isShown, true)) {
            layout();
            root->viewWillAppear(false);
            layout();
        }
    }
    void disappear() {
        if (root && std::exchange(isShown, false)) {
            root->viewWillDisappear(false);
            root->viewDidDisappear(false);
        }
    }

    RootView view;
    std::shared_ptr<ViewController> root;
    bool isShown = false;
};

Window::Window(const Rect& frame) : _impl(std::make_unique<Impl>()) {
    WindowWidget& window = _impl->widget();
    window.resize(toQt(frame).size());
    window.onResize = [impl = _impl.get()] { impl->layout(); };
    window.onCancel = [impl = _impl.get()] {
        if (const auto root = impl->root)
            root->cancelOperation();
    };
    window.onSave = [impl = _impl.get()] {
        if (const auto root = impl->root)
            root->saveOperation();
    };
    window.onFocus = [impl = _impl.get()] {
        if (impl->root)
            (void)impl->root->becomeFirstResponder();
    };
}

Window::~Window() {
    WindowWidget& window = _impl->widget();
    window.onResize = nullptr;
    window.onCancel = nullptr;
    window.onSave = nullptr;
    window.onFocus = nullptr;
    window.onPainted = nullptr;
    window.onDrop = nullptr;
    window.commands.clear();
    window.hide();
    if (_impl->root)
        _impl->root->view().removeFromSuperview();
}

std::shared_ptr<ViewController> Window::rootViewController() const {
    return _impl->root;
}

void Window::setRootViewController(std::shared_ptr<ViewController> viewController) {
    const bool wasShown = _impl->isShown;
    _impl->disappear();
    if (_impl->root)
        _impl->root->view().removeFromSuperview();
    _impl->root = std::move(viewController);
    if (_impl->root)
        _impl->view.addSubview(_impl->root->view());
    if (wasShown)
        makeKeyAndVisible();
}

void Window::makeKeyAndVisible() {
    WindowWidget& window = _impl->widget();
    const bool appears = !_impl->isShown;
    _impl->appear();
    if (fillsScreen())
        window.showFullScreen();
    else
        window.show();
    window.activateWindow();
    if (!window.focusWidget())
        window.onFocus();
    if (_impl->root && appears)
        _impl->root->viewDidAppear(false);
}

void Window::whenPainted(std::function<void()> painted) {
    WindowWidget& window = _impl->widget();
    window.onPainted = std::move(painted);
    window.checkPainted();
}

void Window::displayIfNeeded() {
    const QWindow* const shown = _impl->widget().windowHandle();
    if (!shown || !shown->isExposed())
        return;
    // New texts are laid out first.
    QCoreApplication::sendPostedEvents(nullptr, QEvent::LayoutRequest);
    _impl->widget().repaint();
}

void Window::setCommand(char letter, std::function<void()> command) {
    _impl->widget().commands[Qt::CTRL | Qt::Key(letter)] =
        std::move(command); // a key's number is its letter's
}

void Window::setShiftCommand(char letter, std::function<void()> command) {
    _impl->widget().commands[Qt::CTRL | Qt::SHIFT | Qt::Key(letter)] = std::move(command);
}

void Window::setOnDrop(std::function<void(const std::string& path)> dropped) {
    WindowWidget& window = _impl->widget();
    window.onDrop = std::move(dropped);
    window.setAcceptDrops(window.onDrop != nullptr);
}

bool Window::isHidden() const {
    return _impl->widget().isHidden();
}

void Window::setHidden(bool isHidden) {
    if (!isHidden) {
        makeKeyAndVisible();
        return;
    }
    _impl->disappear();
    _impl->widget().hide();
}

Rect Window::bounds() const {
    return fromQt(_impl->widget().rect());
}

QWidget* Window::widget() const {
    return _impl->view.widget();
}

} // namespace velmora
