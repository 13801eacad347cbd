// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Screen.h"

#include "Toolkit/Widgets/Conversions.h"
#include "Toolkit/Widgets/WindowWidget.h"

#include <QGuiApplication>
#include <QScreen>

#include <algorithm>

namespace velmora {

namespace {

/// That of a phone and, where the screen is a desktop's, one that has room for two screens side by side.
constexpr QSize usual(390, 844);
constexpr QSize usualOnDesktop(1120, 844);
constexpr int leastWidthOfDesktop = 1200;

} // namespace

Rect Screen::mainBounds() {
    const QScreen* const screen = QGuiApplication::primaryScreen();
    if (!screen)
        return fromQt(QRect({0, 0}, usual));
    const QString platform = QGuiApplication::platformName();
    const bool isDevice = platform.startsWith("eglfs") || platform.startsWith("linuxfb");
    const QSize available = screen->availableSize();
    const QSize window = available.width() >= leastWidthOfDesktop ? usualOnDesktop : usual;
    return fromQt(QRect({0, 0}, isDevice ? screen->size() : window.boundedTo(available)));
}

Rect Screen::mainApplicationFrame() {
    const WindowWidget* const window = WindowWidget::main();
    return window ? fromQt(window->rect()) : mainBounds();
}

} // namespace velmora
