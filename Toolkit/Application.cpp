// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Application.h"

#include "Platform/Linux/LoopTimer.h"
#include "Platform/Linux/SignalWatcher.h"
#include "Toolkit/ApplicationDelegate.h"
#include "Toolkit/Widgets/Accessibility.h"
#include "Toolkit/Widgets/Conversions.h"

#include <QApplication>
#include <QEvent>
#include <QIcon>
#include <QLocale>

#include <optional>
#include <stdexcept>

namespace velmora {

namespace {

Application* theApplication = nullptr;

} // namespace

class Application::Impl {
public:
    Impl(int& argc, char** argv) : qt(argc, argv) {}

    QApplication qt;
    ApplicationDelegate* delegate = nullptr;
    std::optional<int> status;
};

Application::Application(int& argc, char** argv) : _impl(std::make_unique<Impl>(argc, argv)) {
    theApplication = this;
    installAccessibility();
    // Qt would take it from a translation, which there is none of.
    if (QLocale::system().textDirection() == Qt::RightToLeft)
        QGuiApplication::setLayoutDirection(Qt::RightToLeft);
    // The delegate hears of the end before the loop stops.
    QApplication::setQuitOnLastWindowClosed(false);
    QObject::connect(&_impl->qt, &QApplication::lastWindowClosed, &_impl->qt, [this] {
        if (_impl->delegate)
            terminate();
    });
}

Application::~Application() {
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    theApplication = nullptr;
}

Application* Application::shared() {
    return theApplication;
}

void Application::setName(std::string_view displayName, std::string_view desktopName) {
    const QString desktop = toQt(desktopName);
    QCoreApplication::setApplicationName(desktop);
    QGuiApplication::setApplicationDisplayName(toQt(displayName));
    QGuiApplication::setDesktopFileName(desktop);
    QGuiApplication::setWindowIcon(QIcon::fromTheme(desktop));
}

int Application::run(ApplicationDelegate& delegate) {
    if (_impl->delegate)
        throw std::logic_error("the application is running already");
    if (!_impl->status) {
        const SignalWatcher watcher([this](int) { terminate(); });
        _impl->delegate = &delegate;
        QMetaObject::invokeMethod(
            &_impl->qt,
            [this, &delegate] {
                if (!_impl->status)
                    delegate.applicationDidFinishLaunching(*this);
            },
            Qt::QueuedConnection);
        if (!_impl->status)
            (void)QApplication::exec();
        _impl->delegate = nullptr;
    }
    const int status = _impl->status.value_or(0);
    _impl->status.reset();
    return status;
}

void Application::terminate(int status) {
    if (_impl->status)
        return;
    _impl->status = status;
    if (_impl->delegate)
        _impl->delegate->applicationWillTerminate(*this);
    QCoreApplication::exit(status);
}

bool Application::runUntil(const std::function<bool()>& done, std::chrono::nanoseconds limit) {
    bool isLate = false;
    LoopTimer timer([&isLate] { isLate = true; });
    timer.startOnce(limit);
    bool isDone = done();
    while (!isDone && !isLate) {
        QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
        isDone = done();
    }
    return isDone;
}

} // namespace velmora
